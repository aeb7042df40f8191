// Sorting of list rows without a window.
#include "ListSortKeys.h"

#include <algorithm>
#include <numeric>
#include <stdlib.h>
#include <string>
#include <string_view>
#include <unordered_map>
#include <wctype.h>
#include <wchar.h>

namespace ListSortKeys {

namespace {

bool IsDateType(unsigned char type)
{
    return type == kDate || type == kTimeOfDay;
}

double IntegerValue(LPCWSTR text)
{
    return static_cast<double>(_wtol(text));
}

double FloatValue(LPCWSTR text)
{
    const int nBytes = ::WideCharToMultiByte(CP_ACP, 0, text, -1, NULL, 0, NULL, NULL);
    std::string ansi(nBytes > 0 ? static_cast<size_t>(nBytes) : 1, '\0');
    if (nBytes > 0)
        ::WideCharToMultiByte(CP_ACP, 0, text, -1, &ansi[0], nBytes, NULL, NULL);
    const double value = atof(ansi.c_str());
    // Not-a-number is no number at all; it would also break the ordering.
    return value == value ? value : 0.0;
}

// Dates compare by their distance from day 0, which, unlike the raw DATE, grows
// through the days before 30 December 1899 as well.
double LinearDays(const COleDateTime& date)
{
    return (date - COleDateTime(0.0)).GetTotalDays();
}

template <typename T>
int Sign(T a, T b)
{
    return a < b ? -1 : (b < a ? 1 : 0);
}

} // namespace

SortKeys::SortKeys(unsigned char type, const std::vector<LPCWSTR>& texts, const COleDateTime& baseTime)
    : m_type(type), m_keys(texts.size(), Key{ L"", 0.0, true })
{
    if (type == kTextNoCase)
    {
        m_folded.resize(texts.size());
        for (size_t i = 0; i < texts.size(); ++i)
        {
            m_folded[i] = texts[i] != NULL ? texts[i] : L"";
            for (wchar_t& ch : m_folded[i])
                ch = towlower(ch);
            m_keys[i].text = m_folded[i].c_str();
        }
        return;
    }

    const bool bShift = type == kTimeOfDay && baseTime.GetStatus() == COleDateTime::valid;
    const COleDateTimeSpan oneDay(1, 0, 0, 0);
    // The platform's parser is slow; sorted columns repeat many of their texts.
    std::unordered_map<std::wstring_view, Key> parsed;
    for (size_t i = 0; i < texts.size(); ++i)
    {
        LPCWSTR text = texts[i] != NULL ? texts[i] : L"";
        Key& key = m_keys[i];
        key.text = text;
        switch (type)
        {
        case kInteger:
        case kImage:
        case kImageAlt:
            key.value = IntegerValue(text);
            break;
        case kFloat:
            key.value = FloatValue(text);
            break;
        case kDate:
        case kTimeOfDay:
        {
            auto found = parsed.find(text);
            if (found != parsed.end())
            {
                key = found->second;
                break;
            }
            COleDateTime date;
            key.valid = date.ParseDateTime(text, 0, LANG_USER_DEFAULT);
            if (key.valid && bShift && date < baseTime)
                date += oneDay;
            key.value = key.valid ? LinearDays(date) : 0.0;
            parsed.emplace(text, key);
            break;
        }
        default:
            break;
        }
    }
}

int SortKeys::Compare(int a, int b) const
{
    const Key& keyA = m_keys[a];
    const Key& keyB = m_keys[b];
    switch (m_type)
    {
    case kText:
    case kTextNoCase:
        return Sign(wcscmp(keyA.text, keyB.text), 0);
    case kInteger:
    case kFloat:
    case kImage:
    case kImageAlt:
        return Sign(keyA.value, keyB.value);
    case kDate:
    case kTimeOfDay:
        return keyA.valid && keyB.valid ? Sign(keyA.value, keyB.value) : 0;
    default:
        return 0;
    }
}

std::vector<int> SortKeys::Order(bool bAscending) const
{
    const int n = static_cast<int>(m_keys.size());
    std::vector<int> order(static_cast<size_t>(n));
    std::iota(order.begin(), order.end(), 0);
    if (m_type == kNotSortable || m_type > kLastColumnType)
        return order;

    auto before = [this, bAscending](int a, int b) {
        return bAscending ? Compare(a, b) < 0 : Compare(b, a) < 0;
    };
    if (!IsDateType(m_type))
    {
        std::stable_sort(order.begin(), order.end(), before);
        return order;
    }

    // A text that is no date equals every row, which no total order can honour:
    // such rows stay where they are, the dated rows are sorted into the other places.
    std::vector<int> places;
    for (int i = 0; i < n; ++i)
    {
        if (m_keys[i].valid)
            places.push_back(i);
    }
    std::vector<int> dated = places;
    std::stable_sort(dated.begin(), dated.end(), before);
    for (size_t k = 0; k < places.size(); ++k)
        order[places[k]] = dated[k];
    return order;
}

} // namespace ListSortKeys
