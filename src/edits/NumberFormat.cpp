#include "NumberFormat.h"

#include <climits>
#include <cmath>
#include <cstdio>
#include <cwchar>

#include "resource.h"

namespace NumberFormat {

bool IsClipboardChar(WCHAR c)
{
    return c == 3 || c == 22 || c == 24;
}

bool IsLongEditChar(WCHAR c)
{
    if (c == 8 || c == 16 || c == 17 || c == 19)
        return true;
    if (c == L'#' || c == L'$' || c == L'-' || c == L'x' || c == L'X')
        return true;
    return (c >= L'0' && c <= L'9') || (c >= L'a' && c <= L'f') || (c >= L'A' && c <= L'F');
}

bool IsDoubleEditChar(WCHAR c)
{
    if (c >= L'0' && c <= L'9')
        return true;
    return c == 8 || c == L'+' || c == L'-' || c == L'.' || c == L'e' || c == L'E';
}

std::wstring BinaryDigits(long value)
{
    unsigned long bits = static_cast<unsigned long>(value);
    if (bits == 0)
        return L"0";
    std::wstring digits;
    while (bits != 0)
    {
        digits.insert(digits.begin(), (bits & 1u) ? L'1' : L'0');
        bits >>= 1;
    }
    return digits;
}

std::wstring LongDisplayText(long value, int displayType)
{
    wchar_t buffer[16];
    switch (displayType)
    {
    case kBinary:
        return L"0b" + BinaryDigits(value);
    case kHexadecimal:
        swprintf(buffer, 16, L"%lX", static_cast<unsigned long>(value));
        return std::wstring(L"0x") + buffer;
    default:
        swprintf(buffer, 16, L"%ld", value);
        return buffer;
    }
}

std::wstring RangeText(const std::wstring& minText, const std::wstring& maxText, bool minIncluded, bool maxIncluded)
{
    std::wstring text = minIncluded ? L" [ " : L" ( ";
    text += minText;
    text += L" , ";
    text += maxText;
    text += maxIncluded ? L" ] " : L" ) ";
    return text;
}

UINT LongErrorMessageId(int code, int base)
{
    switch (code)
    {
    case 0: return IDS_LONG_NOT_IN_RANGE;
    case -7: return IDS_NOT_A_NUMBER;
    case -5: return IDS_LONG_OVERFLOW;
    case -4: return IDS_LONG_UNDERFLOW;
    case -3:
        if (base == 2)
            return IDS_BINARY_SYNTAX;
        if (base == 16)
            return IDS_HEXADECIMAL_SYNTAX;
        return IDS_DECIMAL_SYNTAX;
    default: return IDS_CANNOT_CONVERT;
    }
}

UINT DoubleErrorMessageId(int code)
{
    switch (code)
    {
    case 0: return IDS_DOUBLE_NOT_IN_RANGE;
    case -7: return IDS_NOT_A_NUMBER;
    case -5: return IDS_DOUBLE_OVERFLOW;
    case -4: return IDS_DOUBLE_UNDERFLOW;
    case -3: return IDS_DOUBLE_SYNTAX;
    default: return IDS_CANNOT_CONVERT;
    }
}

UINT FixedInputMessageId(int displayType, int base)
{
    switch (displayType)
    {
    case kBinary: return base != 2 ? IDS_MUST_BE_BINARY : 0;
    case kHexadecimal: return base != 16 ? IDS_MUST_BE_HEXADECIMAL : 0;
    default: return base != 10 ? IDS_MUST_BE_DECIMAL : 0;
    }
}

bool LowerEndIsNearer(long lower, long upper, long cur)
{
    const long long toLower = std::llabs(static_cast<long long>(lower) - cur);
    const long long toUpper = std::llabs(static_cast<long long>(upper) - cur);
    return toLower < toUpper;
}

bool LowerEndIsNearer(double lower, double upper, double cur)
{
    return std::fabs(lower - cur) < std::fabs(upper - cur);
}

bool AddSteps(long middle, long offset, long& result)
{
    const long long sum = static_cast<long long>(middle) + offset;
    if (sum < LONG_MIN || sum > LONG_MAX)
        return false;
    result = static_cast<long>(sum);
    return true;
}

bool IsSingleDoubleFormat(const std::wstring& format)
{
    int conversions = 0;
    const size_t n = format.size();
    for (size_t i = 0; i < n; ++i)
    {
        if (format[i] != L'%')
            continue;
        ++i;
        if (i < n && format[i] == L'%')
            continue;
        while (i < n && format[i] != 0 && wcschr(L"-+ #0", format[i]) != nullptr)
            ++i;
        while (i < n && format[i] >= L'0' && format[i] <= L'9')
            ++i;
        if (i < n && format[i] == L'.')
        {
            ++i;
            while (i < n && format[i] >= L'0' && format[i] <= L'9')
                ++i;
        }
        if (i < n && format[i] == L'l')
            ++i;
        if (i >= n || format[i] == 0 || wcschr(L"eEfgG", format[i]) == nullptr)
            return false;
        ++conversions;
    }
    return conversions == 1;
}

// 10 to the power n; negative powers as a quotient of exact powers, so that 0.1 is the
// double nearest to one tenth.
static double PowerOfTen(long n)
{
    if (n >= 0)
        return std::pow(10.0, static_cast<double>(n));
    if (n >= -22)
        return 1.0 / std::pow(10.0, static_cast<double>(-n));
    return std::pow(10.0, static_cast<double>(n));
}

double AutoDelta(const std::wstring& formatted, double middle)
{
    const std::wstring::size_type npos = std::wstring::npos;
    const std::wstring::size_type dotAt = formatted.find(L'.');
    std::wstring::size_type expAt = formatted.find(L'e');
    if (expAt == npos)
        expAt = formatted.find(L'E');

    if (expAt == npos)
    {
        if (dotAt == npos)
            return 1.0;
        const long decimals = static_cast<long>(formatted.size() - dotAt - 1);
        return PowerOfTen(-decimals);
    }

    // The decimal exponent of 0 (and of inf or NaN) is not defined: count it as 0.
    long exponent = 0;
    const double magnitude = std::fabs(middle);
    if (magnitude > 0.0 && std::isfinite(magnitude))
        exponent = static_cast<long>(std::floor(std::log10(magnitude)));
    long mantissaDecimals = 0;
    if (dotAt != npos && dotAt < expAt)
        mantissaDecimals = static_cast<long>(expAt - dotAt - 1);
    return PowerOfTen(exponent - mantissaDecimals);
}

} // namespace NumberFormat
