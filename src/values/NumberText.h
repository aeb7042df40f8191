// NumberText.h - the number grammar of the value types, as plain functions over wide text.
//
// KVXString::GetAs and KVXVariant's text conversions are thin wrappers around these functions;
// they need no object and no window, so tests call them directly.
//
// Grammar shared by both types
//   - Blanks (space U+0020 and tab U+0009) before and after the number are ignored. A blank
//     anywhere else (after a sign, inside the digits) is a syntax error at that blank.
//   - At most one sign, '+' or '-', directly before the digits or the prefix.
//   - Without a digit there is no number: an empty or all-blank text, a lone sign, a lone prefix
//     ("0x", "-0b"), a lone point (".", "-.") give KVT_CONVERT_NOT_A_NUMBER (-7). So do the words
//     "nan", "inf" and "infinity" (any letter case, optional sign): they name no finite number.
//   - Any other character that cannot continue the number gives KVT_CONVERT_SYNTAX_ERROR (-3) with
//     errorPos = its index in the text as given (leading blanks counted).
//   - The syntax is judged first, the range afterwards: "99999999999#" is a syntax error at '#'.
//   - errorPos is 0 for every result other than -3; the value is written only for 0.
//
// long (32-bit signed)
//   number  = [sign] ( decimal | prefix digits )
//   decimal = '0'-'9' {'0'-'9'}                        leading zeros allowed
//   prefix  = "0b" | "0B" (base 2, digits '0' '1') | "0x" | "0X" (base 16, '0'-'9' 'a'-'f' 'A'-'F')
//   Decimal: above 2147483647 -> -5, below -2147483648 -> -4.
//   Prefixed without a sign: the digits are the 32-bit two's-complement pattern, as the integer
//   edit shows a value ("0xFFFFFFFF" is -1, "0x80000000" is -2147483648); more than 32 significant
//   bits -> -5. Prefixed with a sign: the digits are a magnitude ("-0x10" is -16), so
//   "+0x80000000" -> -5 and "-0x80000001" -> -4.
//   "0b102" -> -3 at index 4; "1e3" -> -3 at index 1; "#5" -> -3 at index 0.
//
// double
//   number   = [sign] mantissa [exponent]
//   mantissa = digits ['.' [digits]] | '.' digits      "1.", ".5", "007.50" are numbers
//   exponent = ('e' | 'E') [sign] digits
//   No base prefix, no thousands separator, no comma; the decimal point is always '.'.
//   An exponent letter without digits ("1e", "1e+") is a syntax error at the exponent letter.
//   The value is the correctly rounded nearest double. |value| above the largest double: -5 for
//   a positive number, -4 for a negative one. A nonzero number that would round to 0 (below the
//   smallest subnormal, e.g. 1e-400): -6. Subnormal results convert normally; "-0" gives -0.0.
//
// Base detection: after leading blanks and one optional sign, "0b"/"0B" -> 2, "0x"/"0X" -> 16,
// anything else -> 10 (also for "0b" alone and for texts that are no number at all).
//
// Formatting
//   KvtFormatLong: base 10 "%ld"; base 2 "0b" + the 32-bit pattern without leading zeros;
//   base 16 "0x" + the pattern in upper-case digits. Each text parses back to the same value.
//   KvtFormatDouble: the shortest text that parses back to the same double ("0.1", "1e+300");
//   NaN and infinities become "nan", "inf", "-inf" (which parse as -7).
#pragma once

#include "KVTEnums.h"

// Enough for any text KvtFormatLong or KvtFormatDouble produce, terminator included.
#define KVT_NUMBER_TEXT_MAX 40

// length < 0: the text ends at its NUL terminator. A NULL text is an empty text.
KVT_API KVTEnumConvertType KvtParseLong(const wchar_t* text, int length, long& value, int& errorPos);
KVT_API KVTEnumConvertType KvtParseDouble(const wchar_t* text, int length, double& value, int& errorPos);
KVT_API int KvtNumberBase(const wchar_t* text, int length);

// Write the text and a terminator into buffer; return the number of characters written (without
// the terminator), or 0 with an empty buffer when bufferSize is too small. base: 2, 10 or 16.
KVT_API int KvtFormatLong(long value, int base, wchar_t* buffer, int bufferSize);
KVT_API int KvtFormatDouble(double value, wchar_t* buffer, int bufferSize);

// True for the conversion letters of a printf format that the value types recognise:
// % B C E G T X b c d e f g i o p s t u x.
KVT_API bool KvtIsFormatType(wchar_t ch);
