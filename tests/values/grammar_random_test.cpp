// Generated texts against a reference reading of the grammar:
//  - a few thousand random texts (fixed seed) built from the grammar's pieces and mutated;
//  - KvtParseLong and KvtParseDouble never crash and agree with the reference on result code,
//    error position and value;
//  - the reference is written differently from the module: regular expressions decide whether a
//    text is a number, the error position is the first character after which no completion
//    ("" or "1") can make the text a number, and the value comes from the C runtime.
#include <gtest/gtest.h>

#include <cctype>
#include <cerrno>
#include <cmath>
#include <cstdint>
#include <cstdlib>
#include <cstring>
#include <map>
#include <random>
#include <regex>
#include <string>

#include "NumberText.h"

namespace
{

struct Reference
{
    KVTEnumConvertType code;
    int errorPos;
    long longValue;
    double doubleValue;
};

bool IsBlank(wchar_t ch) { return ch == L' ' || ch == L'\t'; }

std::string Narrow(const std::wstring& text)
{
    std::string narrow;
    for (wchar_t ch : text)
        narrow += ch < 0x80 ? char(ch) : '?';
    return narrow;
}

// Common frame: blanks around the core, words, then viability of every prefix of the core.
Reference ReferenceFrame(const std::wstring& text, const std::wregex& grammar, bool exponentRule,
                         std::wstring& core, int& offset, bool& complete)
{
    Reference ref = { KVT_CONVERT_OK, 0, 0, 0.0 };
    size_t first = 0, last = text.size();
    while (first < last && IsBlank(text[first]))
        ++first;
    while (last > first && IsBlank(text[last - 1]))
        --last;
    core = text.substr(first, last - first);
    offset = int(first);
    complete = false;
    static const std::wregex words(L"[+-]?(nan|inf|infinity)", std::regex::icase);
    if (core.empty() || std::regex_match(core, words))
    {
        ref.code = KVT_CONVERT_NOT_A_NUMBER;
        return ref;
    }
    if (std::regex_match(core, grammar))
    {
        complete = true;
        return ref;
    }
    for (size_t n = 1; n <= core.size(); ++n)
    {
        std::wstring prefix = core.substr(0, n);
        if (!std::regex_match(prefix, grammar) && !std::regex_match(prefix + L"1", grammar))
        {
            ref.code = KVT_CONVERT_SYNTAX_ERROR;
            ref.errorPos = offset + int(n) - 1;
            return ref;
        }
    }
    // Every prefix can still become a number: something is missing at the end.
    size_t letter = core.find_first_of(L"eE");
    if (exponentRule && letter != std::wstring::npos)
    {
        ref.code = KVT_CONVERT_SYNTAX_ERROR;
        ref.errorPos = offset + int(letter);
    }
    else
        ref.code = KVT_CONVERT_NOT_A_NUMBER;
    return ref;
}

Reference ReferenceLong(const std::wstring& text)
{
    static const std::wregex grammar(L"[+-]?(0[bB][01]+|0[xX][0-9a-fA-F]+|[0-9]+)");
    std::wstring core;
    int offset;
    bool complete;
    Reference ref = ReferenceFrame(text, grammar, false, core, offset, complete);
    if (!complete)
        return ref;

    bool negative = core[0] == L'-';
    bool sign = core[0] == L'-' || core[0] == L'+';
    std::string digits = Narrow(core.substr(sign ? 1 : 0));
    const char prefix = digits.size() > 1 && digits[0] == '0' ? char(std::tolower(digits[1])) : '\0';
    const int base = prefix == 'b' ? 2 : prefix == 'x' ? 16 : 10;
    if (base != 10)
        digits = digits.substr(2);
    errno = 0;
    unsigned long long magnitude = std::strtoull(digits.c_str(), nullptr, base);
    // Unsigned prefixed text is a 32-bit pattern; otherwise the magnitude of a signed value.
    const unsigned long long limit = base != 10 && !sign ? 0xFFFFFFFFull : negative ? 2147483648ull : 2147483647ull;
    if (errno == ERANGE || magnitude > limit)
        ref.code = negative ? KVT_CONVERT_UNDERFLOW : KVT_CONVERT_OVERFLOW;
    else
        ref.longValue = long(int32_t(uint32_t(negative ? 0 - magnitude : magnitude)));
    return ref;
}

Reference ReferenceDouble(const std::wstring& text)
{
    static const std::wregex grammar(L"[+-]?([0-9]+(\\.[0-9]*)?|\\.[0-9]+)([eE][+-]?[0-9]+)?");
    std::wstring core;
    int offset;
    bool complete;
    Reference ref = ReferenceFrame(text, grammar, true, core, offset, complete);
    if (!complete)
        return ref;

    std::string narrow = Narrow(core);
    double value = std::strtod(narrow.c_str(), nullptr);
    size_t exponent = narrow.find_first_of("eE");
    bool nonZeroDigit = narrow.substr(0, exponent).find_first_of("123456789") != std::string::npos;
    if (std::isinf(value))
        ref.code = value < 0 ? KVT_CONVERT_UNDERFLOW : KVT_CONVERT_OVERFLOW;
    else if (value == 0.0 && nonZeroDigit)
        ref.code = KVT_CONVERT_PRECISION_LOSS;
    else
        ref.doubleValue = value;
    return ref;
}

// Texts made of the grammar's pieces, then sometimes mutated by one character.
std::wstring RandomText(std::mt19937& random)
{
    auto pick = [&random](const std::wstring& set) {
        return set[std::uniform_int_distribution<size_t>(0, set.size() - 1)(random)];
    };
    auto chance = [&random](int percent) { return std::uniform_int_distribution<int>(0, 99)(random) < percent; };
    auto count = [&random](int most) { return std::uniform_int_distribution<int>(0, most)(random); };

    std::wstring text;
    if (chance(15))
    {
        for (int n = count(10); n > 0; --n)
            text += pick(L"0123456789+-.eEbBxXaAfF #$ \tni,g");
        return text;
    }
    if (chance(10))
        text += pick(L" \t");
    if (chance(40))
        text += pick(L"+-");
    if (chance(5))
        text += pick(L"nN");
    int kind = count(2);
    if (kind == 0)
    {
        for (int n = count(14); n > 0; --n)
            text += pick(L"0123456789");
        if (chance(40))
        {
            text += L'.';
            for (int n = count(6); n > 0; --n)
                text += pick(L"0123456789");
        }
        if (chance(35))
        {
            text += pick(L"eE");
            if (chance(50))
                text += pick(L"+-");
            for (int n = count(4); n > 0; --n)
                text += pick(L"0123456789");
        }
    }
    else
    {
        text += L'0';
        text += kind == 1 ? pick(L"bB") : pick(L"xX");
        const wchar_t* digits = kind == 1 ? L"01" : L"0123456789abcdefABCDEF";
        for (int n = count(kind == 1 ? 36 : 10); n > 0; --n)
            text += pick(digits);
    }
    if (chance(10))
        text += pick(L" \t");
    if (chance(30) && !text.empty())
    {
        size_t at = std::uniform_int_distribution<size_t>(0, text.size() - 1)(random);
        switch (count(2))
        {
        case 0: text.erase(at, 1); break;
        case 1: text.insert(text.begin() + long(at), pick(L"0123456789+-.eEbxX g#")); break;
        default: text[at] = pick(L"0123456789+-.eEbxX g#"); break;
        }
    }
    return text;
}

// Parses the generator's texts (every fifth with a tail appended, when tails are given)
// with one type's function, compares with the reference and counts the codes seen.
template<class T>
void AgreeWithReference(unsigned seed, Reference (*reference)(const std::wstring&),
                        KVTEnumConvertType (*parse)(const wchar_t*, int, T&, int&), T Reference::*expected,
                        const wchar_t* const* tails, std::map<int, int>& seen)
{
    const T kUntouched = T(23130.5);
    std::mt19937 random(seed);
    for (int i = 0; i < 4000; ++i)
    {
        std::wstring text = RandomText(random);
        if (tails != nullptr && i % 5 == 0)
            text += tails[i % 2];
        const Reference ref = reference(text);
        T value = kUntouched;
        int errorPos = -1;
        const KVTEnumConvertType code = parse(text.c_str(), int(text.size()), value, errorPos);
        ASSERT_EQ(ref.code, code) << testing::PrintToString(text);
        ASSERT_EQ(ref.errorPos, errorPos) << testing::PrintToString(text);
        ASSERT_EQ(code == KVT_CONVERT_OK ? ref.*expected : kUntouched, value) << testing::PrintToString(text);
        ASSERT_EQ(std::signbit(double(ref.*expected)), std::signbit(double(value))) << testing::PrintToString(text);
        ++seen[code];
    }
}

TEST(GrammarRandom, LongAgreesWithReference)
{
    std::map<int, int> seen;
    AgreeWithReference(12345, ReferenceLong, KvtParseLong, &Reference::longValue, nullptr, seen);
    // The generator must reach every code the grammar gives for long.
    for (int code : { 0, -3, -4, -5, -7 })
        EXPECT_GE(seen[code], 40) << "code " << code;
}

TEST(GrammarRandom, DoubleAgreesWithReference)
{
    // Exponents large enough to leave the type are spliced in now and then.
    const wchar_t* const tails[] = { L"e-400", L"e400" };
    std::map<int, int> seen;
    AgreeWithReference(54321, ReferenceDouble, KvtParseDouble, &Reference::doubleValue, tails, seen);
    for (int code : { 0, -3, -4, -5, -6, -7 })
        EXPECT_GE(seen[code], 20) << "code " << code;
}

} // namespace
