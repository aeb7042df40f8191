// Cost of the multi-selection tree's walks against a bare walk of the same items.
//
// For 2,000 and 10,000 visible items (folders of 19 files, all expanded, filled while
// the tree is hidden), in one run and interleaved:
//   walk   root, then next-visible, reading each item's state: the least any walk over
//          the visible items costs;
//   band   one rubber-band update (UpdateSelectionForRect) over a band that stays
//          where it is, as while the pointer rests: every item is visited and nothing
//          changes;
//   count  GetSelectedCount.
// Each figure is the median of several repetitions; band and count are reported as
// ratios to the walk. The target is a ratio of at most 1.2.
#include <afxwin.h>
#include <afxcmn.h>

#include "BenchSupport.h"
#include "CMultiTree.h"
#include "OrvaneControls.h"
#include "TreeSelectionMath.h"

#include <algorithm>
#include <cstdio>
#include <vector>

namespace {

using bench::Median;
using bench::NowMs;

class CBenchApp : public CWinApp
{
public:
    CBenchApp() : CWinApp(_T("tree_bench")) {}
};

CBenchApp theBenchApp;

class CBenchTree : public CMultiTree
{
public:
    using CMultiTree::UpdateSelectionForRect;
};

constexpr int kRepetitions = 9;
constexpr double kTarget = 1.2;

void Fill(CBenchTree& tree, int count)
{
    tree.SetRedraw(FALSE);
    HTREEITEM hFolder = NULL;
    TCHAR text[32];
    for (int i = 0; i < count; ++i)
    {
        if (i % 20 == 0)
        {
            _stprintf(text, _T("Folder %d"), i / 20);
            hFolder = tree.InsertItem(text, TVI_ROOT, TVI_LAST);
        }
        else
        {
            _stprintf(text, _T("File %d.txt"), i);
            tree.InsertItem(text, hFolder, TVI_LAST);
        }
    }
    for (HTREEITEM h = tree.GetRootItem(); h != NULL; h = tree.GetNextSiblingItem(h))
        tree.Expand(h, TVE_EXPAND);
    tree.SetRedraw(TRUE);
}

// The bare walk: what reading every visible item's state costs at the least.
UINT BareWalk(const CTreeCtrl& tree)
{
    UINT selected = 0;
    for (HTREEITEM h = tree.GetRootItem(); h != NULL; h = tree.GetNextVisibleItem(h))
        selected += tree.GetItemState(h, TVIS_SELECTED) & TVIS_SELECTED ? 1 : 0;
    return selected;
}

struct Row
{
    int items;
    double walk;
    double band;
    double count;
};

Row Measure(CWnd& parent, int count)
{
    CBenchTree tree;
    tree.Create(WS_CHILD | TVS_HASBUTTONS | TVS_HASLINES | TVS_LINESATROOT, CRect(0, 0, 300, 400), &parent, 1);
    Fill(tree, count);

    int visible = 0;
    for (HTREEITEM h = tree.GetRootItem(); h != NULL; h = tree.GetNextVisibleItem(h))
        ++visible;

    // A band over the first rows of the client area, applied once so that the measured
    // updates find the selection already as the band wants it.
    const CRect band(10, 5, 60, 200);
    TreeSelectionMath::SelectionSnapshot snapshot;
    tree.UpdateSelectionForRect(&band, 0, snapshot);
    const UINT selected = tree.GetSelectedCount();

    std::vector<double> walks, bands, counts;
    UINT sink = 0;
    for (int r = 0; r < kRepetitions; ++r)
    {
        double t0 = NowMs();
        sink += BareWalk(tree);
        double t1 = NowMs();
        tree.UpdateSelectionForRect(&band, 0, snapshot);
        double t2 = NowMs();
        sink += tree.GetSelectedCount();
        double t3 = NowMs();
        walks.push_back(t1 - t0);
        bands.push_back(t2 - t1);
        counts.push_back(t3 - t2);
    }
    if (sink != 2 * kRepetitions * selected)
        std::printf("warning: the selection changed during the measurement\n");
    tree.DestroyWindow();
    return Row{ visible, Median(walks), Median(bands), Median(counts) };
}

} // namespace

int main()
{
    CWnd parent;
    if (!bench::Start(parent, _T("tree bench"), 320, 420))
        return 1;

    std::vector<Row> rows;
    for (int count : { 2000, 10000 })
        rows.push_back(Measure(parent, count));
    parent.DestroyWindow();

    std::printf("tree walks, median of %d runs; ratio = time / bare walk (target <= %.1f)\n\n", kRepetitions, kTarget);
    std::printf("  visible   walk ms   band ms  ratio   count ms  ratio\n");
    bool withinTarget = true;
    for (const Row& row : rows)
    {
        const double bandRatio = row.band / row.walk;
        const double countRatio = row.count / row.walk;
        withinTarget = withinTarget && bandRatio <= kTarget && countRatio <= kTarget;
        std::printf("  %7d  %8.2f  %8.2f  %5.2f  %9.2f  %5.2f\n", row.items, row.walk, row.band, bandRatio,
            row.count, countRatio);
    }
    std::printf("\n%s\n", withinTarget ? "within target" : "OVER TARGET");
    AfxWinTerm();
    return 0;
}
