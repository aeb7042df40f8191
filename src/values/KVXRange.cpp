// KVXRange.cpp - interval of variants with included or excluded ends.
#include "KVXRange.h"

#include <cmath>
#include <cstdint>

namespace
{

enum NumberKind { kindNone, kindInteger, kindDouble };

struct Number
{
    NumberKind kind;
    int64_t integer;  // valid for kindInteger
    double real;      // valid for kindInteger and kindDouble
};

bool IsSmallIntegerType(VARTYPE vt)
{
    return vt == VT_EMPTY || vt == VT_I1 || vt == VT_UI1 || vt == VT_I2 || vt == VT_UI2 ||
           vt == VT_I4 || vt == VT_INT;
}

Number ReadNumber(const KVXVariant& var)
{
    Number number = { kindNone, 0, 0.0 };
    if (IsSmallIntegerType(var.GetType()))
    {
        long lValue = 0;
        if (var.GetAs(lValue) == KVT_VARIANT_OK)
        {
            number.kind = kindInteger;
            number.integer = lValue;
            number.real = double(lValue);
        }
        return number;
    }
    double dValue = 0.0;
    if (var.GetAs(dValue) == KVT_VARIANT_OK && !std::isnan(dValue))
    {
        number.kind = kindDouble;
        number.real = dValue;
    }
    return number;
}

// -1, 0, 1; integers exactly when both are integers, else as doubles (neither is NaN here).
int CompareNumbers(const Number& a, const Number& b)
{
    if (a.kind == kindInteger && b.kind == kindInteger)
        return a.integer < b.integer ? -1 : (a.integer > b.integer ? 1 : 0);
    return a.real < b.real ? -1 : (a.real > b.real ? 1 : 0);
}

} // namespace

KVXRange::KVXRange()
    : m_bMinimumInclude(true), m_bMaximumInclude(true), m_dwCompare(compareInteger)
{
}

KVXRange::KVXRange(const KVXRange& rangeSrc)
    : m_bMinimumInclude(rangeSrc.m_bMinimumInclude),
      m_bMaximumInclude(rangeSrc.m_bMaximumInclude),
      m_varMinimum(rangeSrc.m_varMinimum),
      m_varMaximum(rangeSrc.m_varMaximum),
      m_dwCompare(rangeSrc.m_dwCompare)
{
}

KVXRange::~KVXRange() {}

const KVXRange& KVXRange::operator=(const KVXRange& rangeSrc)
{
    m_bMinimumInclude = rangeSrc.m_bMinimumInclude;
    m_bMaximumInclude = rangeSrc.m_bMaximumInclude;
    m_varMinimum = rangeSrc.m_varMinimum;
    m_varMaximum = rangeSrc.m_varMaximum;
    m_dwCompare = rangeSrc.m_dwCompare;
    return *this;
}

void KVXRange::UpdateCompare()
{
    Number minimum = ReadNumber(m_varMinimum);
    Number maximum = ReadNumber(m_varMaximum);
    if (minimum.kind == kindNone || maximum.kind == kindNone)
        m_dwCompare = compareNone;
    else if (minimum.kind == kindInteger && maximum.kind == kindInteger)
        m_dwCompare = compareInteger;
    else
        m_dwCompare = compareDouble;
}

void KVXRange::Empty(const KVXVariant& varValue)
{
    m_varMinimum = varValue;
    m_varMaximum = varValue;
    UpdateCompare();
}

short KVXRange::Adjust(const KVXVariant& varValue)
{
    Number value = ReadNumber(varValue);
    if (value.kind == kindNone || m_dwCompare == compareNone)
    {
        m_varMaximum = varValue;
        UpdateCompare();
        return 2;
    }
    if (CompareNumbers(value, ReadNumber(m_varMinimum)) < 0)
    {
        m_varMinimum = varValue;
        UpdateCompare();
        return 1;
    }
    if (CompareNumbers(value, ReadNumber(m_varMaximum)) > 0)
    {
        m_varMaximum = varValue;
        UpdateCompare();
        return 2;
    }
    return 0;
}

bool KVXRange::IsInRange(const KVXVariant& varValue) const
{
    if (m_dwCompare == compareNone)
        return false;
    Number value = ReadNumber(varValue);
    if (value.kind == kindNone)
        return false;
    int toMinimum = CompareNumbers(value, ReadNumber(m_varMinimum));
    int toMaximum = CompareNumbers(value, ReadNumber(m_varMaximum));
    bool aboveMinimum = m_bMinimumInclude ? toMinimum >= 0 : toMinimum > 0;
    bool belowMaximum = m_bMaximumInclude ? toMaximum <= 0 : toMaximum < 0;
    return aboveMinimum && belowMaximum;
}

KVXVariant KVXRange::GetMinimumInRange() const
{
    Number minimum = ReadNumber(m_varMinimum);
    Number maximum = ReadNumber(m_varMaximum);
    if (m_dwCompare == compareInteger)
    {
        int64_t low = minimum.integer + (m_bMinimumInclude ? 0 : 1);
        int64_t high = maximum.integer - (m_bMaximumInclude ? 0 : 1);
        return low <= high ? KVXVariant(long(low)) : m_varMinimum;
    }
    if (m_dwCompare == compareDouble)
    {
        double low = m_bMinimumInclude ? minimum.real : std::nextafter(minimum.real, HUGE_VAL);
        double high = m_bMaximumInclude ? maximum.real : std::nextafter(maximum.real, -HUGE_VAL);
        return low <= high ? KVXVariant(low) : m_varMinimum;
    }
    return m_varMinimum;
}

KVXVariant KVXRange::GetMaximumInRange() const
{
    Number minimum = ReadNumber(m_varMinimum);
    Number maximum = ReadNumber(m_varMaximum);
    if (m_dwCompare == compareInteger)
    {
        int64_t low = minimum.integer + (m_bMinimumInclude ? 0 : 1);
        int64_t high = maximum.integer - (m_bMaximumInclude ? 0 : 1);
        return low <= high ? KVXVariant(long(high)) : m_varMaximum;
    }
    if (m_dwCompare == compareDouble)
    {
        double low = m_bMinimumInclude ? minimum.real : std::nextafter(minimum.real, HUGE_VAL);
        double high = m_bMaximumInclude ? maximum.real : std::nextafter(maximum.real, -HUGE_VAL);
        return low <= high ? KVXVariant(high) : m_varMaximum;
    }
    return m_varMaximum;
}
