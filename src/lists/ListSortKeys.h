// Sorting of list rows without a window: each row's key text is parsed once into a
// sort key by its column's rule, and the rows are put in order by those keys. Rows
// whose keys compare equal keep their previous order.
//
// Column type codes:
//   0 text, case-sensitive (wcscmp)       5 floating point (the ANSI text read by atof)
//   1 text, case-insensitive (_wcsicmp)   6 time of day: a date/time earlier than the base
//   2 integer (_wtol)                       time counts one day later
//   3 date and/or time (COleDateTime)     7, 8 image index (the key text is its "%d")
//   4 not sortable: rows keep their order
#pragma once

#include <afx.h>
#include <afxdisp.h>

#include <string>
#include <vector>

namespace ListSortKeys {

enum ColumnType : unsigned char
{
    kText = 0,
    kTextNoCase = 1,
    kInteger = 2,
    kDate = 3,
    kNotSortable = 4,
    kFloat = 5,
    kTimeOfDay = 6,
    kImage = 7,
    kImageAlt = 8,
};
// Codes above this are not column types.
constexpr unsigned char kLastColumnType = kImageAlt;
// The rule of a column that has no entry in the list's column types: the default
// type of a column record, case-sensitive text.
constexpr unsigned char kDefaultColumnType = kText;

// The keys of one column's rows, each parsed once from its key text.
class SortKeys
{
public:
    // The base time of type 6: a time before it counts one day later. Not valid: no
    // shift. Dates are parsed with ParseDateTime (no flags, LANG_USER_DEFAULT), each
    // distinct text once. The texts must outlive the keys.
    SortKeys(unsigned char type, const std::vector<LPCWSTR>& texts, const COleDateTime& baseTime);

    // The rule before the direction for rows a and b: negative, 0 or positive. A text
    // that is no date compares equal to every row; so do all rows of type 4 and of
    // unknown types.
    int Compare(int a, int b) const;

    // order[k] is the row that goes to place k. Rows that compare equal keep their
    // order in both directions; rows whose text is no date keep their places, and the
    // dated rows are ordered among themselves in the other places.
    std::vector<int> Order(bool bAscending) const;

private:
    struct Key
    {
        LPCWSTR text;   // the text rules; type 1: folded to lower case
        double value;   // integer, float, or a date as a linear count of days
        bool valid;     // date rules: the text is a date (or time)
    };

    unsigned char m_type;
    std::vector<Key> m_keys;
    // _wcsicmp compares the characters folded by towlower: folded once per row, the
    // texts compare alike with wcscmp.
    std::vector<std::wstring> m_folded;
};

} // namespace ListSortKeys
