// Cost of sorting the extended list by each column type against two baselines measured
// in the same run, over 10,000 and 100,000 rows (filled with redraw off, list hidden):
//   floor        LVM_SORTITEMS of the same rows over precomputed integer keys (each row's
//                final place, so the list view moves the rows exactly as in the sort
//                measured), plus the two passes that write item data: the least any sort
//                through the list view costs;
//   per-compare  what hosts commonly do: LVM_SORTITEMS with a callback that fetches
//                both cells (GetItemText, or the image index) in every comparison and
//                applies the same rule to them;
//   sort         KVXListCtrlEx::SortList.
// Every sort starts from the rows' original order. One line per type and size:
//   sort <type> <rows> floor-ratio <sort / floor> per-compare-ratio <sort / per-compare>
// then the medians in milliseconds. The target is a floor ratio of at most 1.6 at
// 100,000 rows.
#include <afxwin.h>
#include <afxcmn.h>
#include <afxdisp.h>

#include "BenchSupport.h"
#include "KVXListCtrlEx.h"
#include "OrvaneControls.h"

#include <algorithm>
#include <cstdio>
#include <stdlib.h>
#include <string>
#include <vector>
#include <wchar.h>

namespace {

using bench::Median;
using bench::NowMs;

class CBenchApp : public CWinApp
{
public:
    CBenchApp() : CWinApp(_T("list_sort_bench")) {}
};

CBenchApp theBenchApp;

constexpr double kTarget = 1.6;
constexpr int kTargetRows = 100000;

struct ColumnSpec
{
    const char* name;
    LPCTSTR title;
    unsigned char type;
};

// Column positions in the list; the type codes are the list's column types.
const ColumnSpec kColumns[] = {
    { "text", _T("Name"), 0 },
    { "nocase", _T("Owner"), 1 },
    { "integer", _T("Size"), 2 },
    { "float", _T("Ratio"), 5 },
    { "date", _T("Modified"), 3 },
    { "time", _T("Time"), 6 },
    { "image", _T("Flag"), 7 },
};
constexpr int kColumnCount = sizeof kColumns / sizeof kColumns[0];
const LPCTSTR kBaseTime = _T("6:00 AM");

// Deterministic rows, so that every run sorts the same data.
class RowMaker
{
public:
    unsigned Next()
    {
        m_state = m_state * 1664525u + 1013904223u;
        return m_state >> 8;
    }

    CString Cell(int column)
    {
        static const LPCTSTR kWords[] = { _T("report"), _T("Invoice"), _T("budget"), _T("Photo"), _T("letter"),
            _T("Draft"), _T("summary"), _T("Archive"), _T("notes"), _T("Backup") };
        static const LPCTSTR kOwners[] = { _T("anna"), _T("Ben"), _T("CLARA"), _T("david"), _T("Eva"), _T("frank") };
        static const LPCTSTR kExtensions[] = { _T("txt"), _T("docx"), _T("png"), _T("csv"), _T("pdf") };
        CString text;
        switch (column)
        {
        case 0:
            text.Format(_T("%s %05u.%s"), kWords[Next() % 10], Next() % 100000, kExtensions[Next() % 5]);
            break;
        case 1:
            text.Format(_T("%s%u"), kOwners[Next() % 6], Next() % 50);
            break;
        case 2:
            text.Format(_T("%u"), Next() % 1000000000u);
            break;
        case 3:
            text.Format(_T("%.2f"), (Next() % 100000) / 100.0);
            break;
        case 4:
            // A day within ten years.
            text = COleDateTime(41640.0 + Next() % 3653).Format(VAR_DATEVALUEONLY);
            break;
        case 5:
            // A time of day to the minute, as schedules and shift lists show it.
            text = COleDateTime((Next() % 1440) / 1440.0).Format(VAR_TIMEVALUEONLY);
            break;
        }
        return text;
    }

private:
    unsigned m_state = 20240301u;
};

void AddColumns(CListCtrl& list)
{
    for (int c = 0; c < kColumnCount; ++c)
        list.InsertColumn(c, kColumns[c].title, LVCFMT_LEFT, 90);
}

// Fills both lists with the same rows, the original index as item data.
void Fill(CListCtrl& list, CListCtrl& source, int rows)
{
    RowMaker maker;
    list.SetRedraw(FALSE);
    source.SetRedraw(FALSE);
    for (int r = 0; r < rows; ++r)
    {
        for (CListCtrl* pList : { &list, &source })
            pList->InsertItem(LVIF_TEXT | LVIF_PARAM, r, _T(""), 0, 0, 0, r);
        for (int c = 0; c < kColumnCount; ++c)
        {
            if (kColumns[c].type == 7)
            {
                const int image = static_cast<int>(maker.Next() % 6);
                list.SetItem(r, c, LVIF_IMAGE, NULL, image, 0, 0, 0);
                source.SetItem(r, c, LVIF_IMAGE, NULL, image, 0, 0, 0);
                continue;
            }
            const CString text = maker.Cell(c);
            list.SetItemText(r, c, text);
            source.SetItemText(r, c, text);
        }
    }
}

int CALLBACK CompareIntegers(LPARAM a, LPARAM b, LPARAM)
{
    return a < b ? -1 : (a > b ? 1 : 0);
}

// Back to the original order: the item data is the original index.
void RestoreOriginalOrder(CListCtrl& list)
{
    list.SortItems(&CompareIntegers, 0);
}

// The original index of the row at each place.
std::vector<int> CurrentOrder(const CListCtrl& list)
{
    std::vector<int> order(static_cast<size_t>(list.GetItemCount()));
    for (int i = 0; i < list.GetItemCount(); ++i)
        order[i] = static_cast<int>(list.GetItemData(i));
    return order;
}

// ---------------------------------------------------------------------------------
// The per-compare baseline

struct PerCompareContext
{
    CListCtrl* pSource;     // the rows in their original order
    int nColumn;
    unsigned char nType;
    COleDateTime baseTime;
};

double FloatOf(const CString& text)
{
    char ansi[64];
    ::WideCharToMultiByte(CP_ACP, 0, text, -1, ansi, sizeof ansi, NULL, NULL);
    ansi[sizeof ansi - 1] = 0;
    return atof(ansi);
}

COleDateTime DateOf(const CString& text, const PerCompareContext& context)
{
    COleDateTime date;
    date.ParseDateTime(text);
    if (context.nType == 6 && date.GetStatus() == COleDateTime::valid && date < context.baseTime)
        date += COleDateTimeSpan(1, 0, 0, 0);
    return date;
}

template <typename T>
int Sign(T a, T b)
{
    return a < b ? -1 : (b < a ? 1 : 0);
}

int CALLBACK PerCompare(LPARAM lParam1, LPARAM lParam2, LPARAM lParamSort)
{
    const PerCompareContext& context = *reinterpret_cast<const PerCompareContext*>(lParamSort);
    const int nRow1 = static_cast<int>(lParam1);
    const int nRow2 = static_cast<int>(lParam2);
    if (context.nType == 7)
    {
        LVITEM item1 = {};
        item1.mask = LVIF_IMAGE;
        item1.iItem = nRow1;
        item1.iSubItem = context.nColumn;
        LVITEM item2 = item1;
        item2.iItem = nRow2;
        context.pSource->GetItem(&item1);
        context.pSource->GetItem(&item2);
        return Sign(item1.iImage, item2.iImage);
    }
    const CString text1 = context.pSource->GetItemText(nRow1, context.nColumn);
    const CString text2 = context.pSource->GetItemText(nRow2, context.nColumn);
    switch (context.nType)
    {
    case 0: return Sign(wcscmp(text1, text2), 0);
    case 1: return Sign(_wcsicmp(text1, text2), 0);
    case 2: return Sign(_wtol(text1), _wtol(text2));
    case 5: return Sign(FloatOf(text1), FloatOf(text2));
    default:
    {
        const COleDateTime date1 = DateOf(text1, context);
        const COleDateTime date2 = DateOf(text2, context);
        if (date1.GetStatus() != COleDateTime::valid || date2.GetStatus() != COleDateTime::valid)
            return 0;
        return date1 < date2 ? -1 : (date2 < date1 ? 1 : 0);
    }
    }
}

// ---------------------------------------------------------------------------------

struct Result
{
    const char* type;
    int rows;
    double floor;
    double sort;
    double perCompare;
};

void Measure(CWnd& parent, int rows, std::vector<Result>& results, bool& bSameOrder)
{
    KVXListCtrlEx list;
    CListCtrl source;
    list.Create(WS_CHILD | LVS_REPORT, CRect(0, 0, 600, 400), &parent, 1);
    source.Create(WS_CHILD | LVS_REPORT, CRect(0, 0, 600, 400), &parent, 2);
    AddColumns(list);
    AddColumns(source);
    Fill(list, source, rows);
    unsigned char types[kColumnCount];
    for (int c = 0; c < kColumnCount; ++c)
        types[c] = kColumns[c].type;
    list.SetColumnTypes(types, kColumnCount);
    list.SetBaseTime(kBaseTime);

    // The slow baseline at the large size costs a minute per date column: fewer runs.
    const int nRuns = rows >= kTargetRows ? 5 : 7;
    const int nPerCompareRuns = rows >= kTargetRows ? 1 : 3;
    for (int c = 0; c < kColumnCount; ++c)
    {
        // Each row's final place, for the floor's integer keys.
        RestoreOriginalOrder(list);
        list.SortList(-1, true);
        list.SortList(c, true);
        const std::vector<int> sorted = CurrentOrder(list);
        std::vector<LPARAM> place(static_cast<size_t>(rows));
        for (int k = 0; k < rows; ++k)
            place[sorted[k]] = k;

        std::vector<double> floors, sorts, perCompares;
        for (int run = 0; run < nRuns; ++run)
        {
            RestoreOriginalOrder(list);
            double t0 = NowMs();
            for (int i = 0; i < rows; ++i)
                list.SetItemData(i, static_cast<DWORD_PTR>(place[i]));
            list.SortItems(&CompareIntegers, 0);
            for (int k = 0; k < rows; ++k)
                list.SetItemData(k, static_cast<DWORD_PTR>(sorted[k]));
            floors.push_back(NowMs() - t0);
            bSameOrder = bSameOrder && CurrentOrder(list) == sorted;

            RestoreOriginalOrder(list);
            list.SortList(-1, true);
            t0 = NowMs();
            list.SortList(c, true);
            sorts.push_back(NowMs() - t0);
            bSameOrder = bSameOrder && CurrentOrder(list) == sorted;

            if (run < nPerCompareRuns)
            {
                RestoreOriginalOrder(list);
                PerCompareContext context = { &source, c, kColumns[c].type, COleDateTime() };
                context.baseTime.ParseDateTime(kBaseTime);
                t0 = NowMs();
                list.SortItems(&PerCompare, reinterpret_cast<DWORD_PTR>(&context));
                perCompares.push_back(NowMs() - t0);
                bSameOrder = bSameOrder && CurrentOrder(list) == sorted;
            }
        }
        results.push_back(Result{ kColumns[c].name, rows, Median(floors), Median(sorts), Median(perCompares) });
    }
    list.DestroyWindow();
    source.DestroyWindow();
}

} // namespace

int main()
{
    CWnd parent;
    if (!bench::Start(parent, _T("list sort bench"), 620, 420))
        return 1;

    std::vector<Result> results;
    bool bSameOrder = true;
    for (int rows : { 10000, kTargetRows })
        Measure(parent, rows, results, bSameOrder);
    parent.DestroyWindow();

    bool bWithinTarget = true;
    for (const Result& r : results)
    {
        const double floorRatio = r.sort / r.floor;
        if (r.rows >= kTargetRows)
            bWithinTarget = bWithinTarget && floorRatio <= kTarget;
        std::printf("sort %s %d floor-ratio %.2f per-compare-ratio %.3f\n", r.type, r.rows, floorRatio,
            r.sort / r.perCompare);
    }
    std::printf("\nmedians in ms\n  type       rows     floor      sort  per-compare\n");
    for (const Result& r : results)
        std::printf("  %-8s %6d  %8.1f  %8.1f  %11.1f\n", r.type, r.rows, r.floor, r.sort, r.perCompare);
    if (!bSameOrder)
        std::printf("\nwarning: the three sorts did not give the same order\n");
    std::printf("\n%s (floor ratio <= %.1f at %d rows)\n", bWithinTarget ? "within target" : "OVER TARGET", kTarget,
        kTargetRows);
    AfxWinTerm();
    return 0;
}
