// NumberText.cpp - the number grammar of the value types (see NumberText.h).
#include "NumberText.h"

#include <charconv>
#include <cmath>
#include <cstdint>
#include <cstring>
#include <cwchar>
#include <string>
#include <system_error>

namespace
{

// Exponents are saturated here while they are read: far beyond every double, far below overflow.
const int64_t kExponentLimit = 1000000000;

struct Span
{
    const wchar_t* text;
    int begin;  // first character after the leading blanks
    int end;    // one past the last character before the trailing blanks
};

bool IsBlank(wchar_t ch)
{
    return ch == L' ' || ch == L'\t';
}

bool IsDecimalDigit(wchar_t ch)
{
    return ch >= L'0' && ch <= L'9';
}

int DigitValue(wchar_t ch, int base)
{
    int digit = -1;
    if (ch >= L'0' && ch <= L'9')
        digit = ch - L'0';
    else if (ch >= L'a' && ch <= L'f')
        digit = ch - L'a' + 10;
    else if (ch >= L'A' && ch <= L'F')
        digit = ch - L'A' + 10;
    return digit < base ? digit : -1;
}

wchar_t LowerAscii(wchar_t ch)
{
    return (ch >= L'A' && ch <= L'Z') ? wchar_t(ch + (L'a' - L'A')) : ch;
}

Span Trim(const wchar_t* text, int length)
{
    if (text == nullptr)
        length = 0;
    else if (length < 0)
        length = int(std::wcslen(text));
    Span span = { text, 0, length };
    while (span.begin < span.end && IsBlank(text[span.begin]))
        ++span.begin;
    while (span.end > span.begin && IsBlank(text[span.end - 1]))
        --span.end;
    return span;
}

// [sign] nan | inf | infinity, any letter case.
bool IsNonFiniteWord(const Span& span)
{
    int i = span.begin;
    if (i < span.end && (span.text[i] == L'+' || span.text[i] == L'-'))
        ++i;
    static const wchar_t* const kWords[] = { L"nan", L"inf", L"infinity" };
    for (const wchar_t* word : kWords)
    {
        int n = int(std::wcslen(word));
        if (span.end - i != n)
            continue;
        int k = 0;
        while (k < n && LowerAscii(span.text[i + k]) == word[k])
            ++k;
        if (k == n)
            return true;
    }
    return false;
}

// Index of the first digit after an optional sign and base prefix; reports sign and base.
int ReadSignAndPrefix(const Span& span, wchar_t& sign, int& base)
{
    int i = span.begin;
    sign = 0;
    if (i < span.end && (span.text[i] == L'+' || span.text[i] == L'-'))
        sign = span.text[i++];
    base = 10;
    if (i + 1 < span.end && span.text[i] == L'0')
    {
        wchar_t letter = LowerAscii(span.text[i + 1]);
        if (letter == L'b')
            base = 2;
        else if (letter == L'x')
            base = 16;
        if (base != 10)
            i += 2;
    }
    return i;
}

} // namespace

KVTEnumConvertType KvtParseLong(const wchar_t* text, int length, long& value, int& errorPos)
{
    errorPos = 0;
    Span span = Trim(text, length);
    if (span.begin == span.end || IsNonFiniteWord(span))
        return KVT_CONVERT_NOT_A_NUMBER;

    wchar_t sign;
    int base;
    int i = ReadSignAndPrefix(span, sign, base);
    if (i == span.end)
        return KVT_CONVERT_NOT_A_NUMBER;

    // The magnitude saturates just above 32 bits: every range decision below needs no more.
    const uint64_t kSaturated = uint64_t(0xFFFFFFFF) + 1;
    uint64_t magnitude = 0;
    for (; i < span.end; ++i)
    {
        int digit = DigitValue(span.text[i], base);
        if (digit < 0)
        {
            errorPos = i;
            return KVT_CONVERT_SYNTAX_ERROR;
        }
        if (magnitude < kSaturated)
            magnitude = magnitude * uint64_t(base) + uint64_t(digit);
    }

    const uint64_t kMaxPositive = 0x7FFFFFFF;
    const uint64_t kMaxNegative = 0x80000000;
    int64_t result;
    if (sign == L'-')
    {
        if (magnitude > kMaxNegative)
            return KVT_CONVERT_UNDERFLOW;
        result = -int64_t(magnitude);
    }
    else if (base != 10 && sign == 0)
    {
        if (magnitude > 0xFFFFFFFF)
            return KVT_CONVERT_OVERFLOW;
        result = int32_t(uint32_t(magnitude));
    }
    else
    {
        if (magnitude > kMaxPositive)
            return KVT_CONVERT_OVERFLOW;
        result = int64_t(magnitude);
    }
    value = long(result);
    return KVT_CONVERT_OK;
}

KVTEnumConvertType KvtParseDouble(const wchar_t* text, int length, double& value, int& errorPos)
{
    errorPos = 0;
    Span span = Trim(text, length);
    if (span.begin == span.end || IsNonFiniteWord(span))
        return KVT_CONVERT_NOT_A_NUMBER;

    const wchar_t* s = span.text;
    int i = span.begin;
    std::string canonical;  // ASCII copy of the validated number for the correctly rounding parser
    bool negative = false;
    if (s[i] == L'+' || s[i] == L'-')
    {
        negative = s[i] == L'-';
        canonical += char(s[i]);
        ++i;
    }

    // Mantissa. The decimal exponent of its leading digit decides overflow against underflow.
    int64_t integerDigits = 0;
    int64_t firstNonZero = -1;  // index of the first nonzero digit among all mantissa digits
    int64_t digitCount = 0;
    for (; i < span.end && IsDecimalDigit(s[i]); ++i, ++digitCount, ++integerDigits)
    {
        if (firstNonZero < 0 && s[i] != L'0')
            firstNonZero = digitCount;
        canonical += char(s[i]);
    }
    if (i < span.end && s[i] == L'.')
    {
        canonical += '.';
        for (++i; i < span.end && IsDecimalDigit(s[i]); ++i, ++digitCount)
        {
            if (firstNonZero < 0 && s[i] != L'0')
                firstNonZero = digitCount;
            canonical += char(s[i]);
        }
    }
    if (digitCount == 0)
    {
        if (i == span.end)
            return KVT_CONVERT_NOT_A_NUMBER;
        errorPos = i;
        return KVT_CONVERT_SYNTAX_ERROR;
    }

    int64_t exponent = 0;
    if (i < span.end && (s[i] == L'e' || s[i] == L'E'))
    {
        int letter = i++;
        bool negativeExponent = false;
        if (i < span.end && (s[i] == L'+' || s[i] == L'-'))
            negativeExponent = s[i++] == L'-';
        if (i == span.end || !IsDecimalDigit(s[i]))
        {
            errorPos = i == span.end ? letter : i;
            return KVT_CONVERT_SYNTAX_ERROR;
        }
        for (; i < span.end && IsDecimalDigit(s[i]); ++i)
            if (exponent < kExponentLimit)
                exponent = exponent * 10 + (s[i] - L'0');
        if (negativeExponent)
            exponent = -exponent;
    }
    if (i < span.end)
    {
        errorPos = i;
        return KVT_CONVERT_SYNTAX_ERROR;
    }

    if (firstNonZero < 0)
    {
        value = negative ? -0.0 : 0.0;
        return KVT_CONVERT_OK;
    }
    canonical += 'e';
    canonical += std::to_string(exponent);

    double parsed = 0.0;
    const char* first = canonical.data();
    const char* last = first + canonical.size();
    if (*first == '+')
        ++first;  // from_chars takes no plus sign
    std::from_chars_result result = std::from_chars(first, last, parsed, std::chars_format::general);
    if (result.ec == std::errc() && result.ptr == last && std::isfinite(parsed))
    {
        value = parsed;
        return KVT_CONVERT_OK;
    }
    // Out of range: the leading digit stands for 10^(exponent + integerDigits - firstNonZero - 1).
    if (exponent + integerDigits - firstNonZero - 1 >= 0)
        return negative ? KVT_CONVERT_UNDERFLOW : KVT_CONVERT_OVERFLOW;
    return KVT_CONVERT_PRECISION_LOSS;
}

int KvtNumberBase(const wchar_t* text, int length)
{
    Span span = Trim(text, length);
    wchar_t sign;
    int base;
    ReadSignAndPrefix(span, sign, base);
    return base;
}

int KvtFormatLong(long value, int base, wchar_t* buffer, int bufferSize)
{
    if (buffer == nullptr || bufferSize <= 0)
        return 0;
    wchar_t text[KVT_NUMBER_TEXT_MAX];
    int n = 0;
    if (base == 2 || base == 16)
    {
        // The 32-bit pattern, as the integer edit shows negative values.
        uint32_t pattern = uint32_t(value);
        wchar_t digits[33];
        int count = 0;
        do
        {
            digits[count++] = L"0123456789ABCDEF"[pattern % uint32_t(base)];
            pattern /= uint32_t(base);
        } while (pattern != 0);
        text[n++] = L'0';
        text[n++] = base == 2 ? L'b' : L'x';
        while (count > 0)
            text[n++] = digits[--count];
    }
    else
    {
        int64_t magnitude = value;
        if (magnitude < 0)
        {
            text[n++] = L'-';
            magnitude = -magnitude;
        }
        wchar_t digits[12];
        int count = 0;
        do
        {
            digits[count++] = wchar_t(L'0' + magnitude % 10);
            magnitude /= 10;
        } while (magnitude != 0);
        while (count > 0)
            text[n++] = digits[--count];
    }
    if (n >= bufferSize)
    {
        buffer[0] = 0;
        return 0;
    }
    std::wmemcpy(buffer, text, size_t(n));
    buffer[n] = 0;
    return n;
}

int KvtFormatDouble(double value, wchar_t* buffer, int bufferSize)
{
    if (buffer == nullptr || bufferSize <= 0)
        return 0;
    char text[KVT_NUMBER_TEXT_MAX];
    int n;
    if (std::isnan(value))
        n = int(std::strlen(std::strcpy(text, "nan")));
    else if (std::isinf(value))
        n = int(std::strlen(std::strcpy(text, value < 0 ? "-inf" : "inf")));
    else
    {
        std::to_chars_result result = std::to_chars(text, text + sizeof(text), value);
        n = result.ec == std::errc() ? int(result.ptr - text) : 0;
    }
    if (n == 0 || n >= bufferSize)
    {
        buffer[0] = 0;
        return 0;
    }
    for (int i = 0; i < n; ++i)
        buffer[i] = wchar_t(text[i]);
    buffer[n] = 0;
    return n;
}

bool KvtIsFormatType(wchar_t ch)
{
    static const wchar_t kTypes[] = L"%BCEGTXbcdefgiopstux";
    return ch != 0 && std::wcschr(kTypes, ch) != nullptr;
}
