// KVXRange.h - an interval of values with an included or excluded end on each side.
//
// Building: Empty(v) makes the range the single value v; Adjust(v) widens it so that it reaches v.
// The callers pass the minimum to Empty and the maximum to Adjust, so a reversed pair (minimum
// above maximum) simply yields the ordered range; the include flags always belong to the lower
// and the upper end as they are after that ordering. The include flags are kept by Empty and
// Adjust; a new range is [0, 0] with both ends included (empty variants count as 0).
//
// Comparing: when both ends are integers of at most 32 bits (VT_I1, VT_UI1, VT_I2, VT_UI2, VT_I4,
// VT_INT, or VT_EMPTY as 0) the range is an integer range; otherwise both ends are read as doubles
// (KVXVariant::GetAs). An end that is no number (NaN, text outside the grammar, VT_NULL, objects)
// makes a range that contains nothing. A value is compared exactly as an integer against an
// integer range when it is an integer itself, and as a double otherwise.
//
// In-range ends: an included end is its own in-range value. An excluded end of an integer range
// moves one inward (min + 1, max - 1), of a double range to the next representable double inward
// (nextafter). When no value at all lies in the range (e.g. (5, 6) of integers), GetMinimumInRange
// and GetMaximumInRange return the ends as set; IsInRange then accepts nothing.
//
// Adjust's result: 0 the value lay inside already, 1 the minimum moved, 2 the maximum moved
// (also when the value is no number: it becomes the maximum and the range contains nothing).
// The range's own 32-bit word records how its ends compare (none, integer, double).
#pragma once

#include "KVTEnums.h"
#include "KVXVariant.h"

class KVT_API KVXRange
{
public:
// Constructors
    KVXRange();
    KVXRange(const KVXRange& rangeSrc);
    virtual ~KVXRange();
    const KVXRange& operator=(const KVXRange& rangeSrc);

// Ends
    void Empty(const KVXVariant& varValue);
    short Adjust(const KVXVariant& varValue);
    KVXVariant GetMinimum() const { return m_varMinimum; }
    KVXVariant GetMaximum() const { return m_varMaximum; }
    void SetMinimumInclude(bool bInclude) { m_bMinimumInclude = bInclude; }
    bool GetMinimumInclude() const { return m_bMinimumInclude; }
    void SetMaximumInclude(bool bInclude) { m_bMaximumInclude = bInclude; }
    bool GetMaximumInclude() const { return m_bMaximumInclude; }

// Membership
    bool IsInRange(const KVXVariant& varValue) const;
    KVXVariant GetMinimumInRange() const;
    KVXVariant GetMaximumInRange() const;

protected:
    enum { compareNone = 0, compareInteger = 1, compareDouble = 2 };

    bool m_bMinimumInclude;
    bool m_bMaximumInclude;
    KVXVariant m_varMinimum;
    KVXVariant m_varMaximum;
    DWORD m_dwCompare;  // compareNone, compareInteger or compareDouble, from the two ends

    void UpdateCompare();
};
