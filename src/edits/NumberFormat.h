// Window-free rules of the numeric edits: which characters the filters let through,
// how an integer is shown in each display base, which message a failed text check
// stores, the range text appended to range messages, the nearer range end, integer
// steps without 32-bit wrap-around, and the automatic step size of the
// floating-point edit.
#pragma once

#include <windows.h>

#include <string>

namespace NumberFormat {

// Display bases of the integer edit (the values of KVXLongEdit::DISPLAYTYPE).
constexpr int kDecimal = 1;
constexpr int kBinary = 2;
constexpr int kHexadecimal = 3;

// Ctrl+C, Ctrl+V and Ctrl+X as WM_CHAR codes: always passed to the control while Ctrl is down.
bool IsClipboardChar(WCHAR c);
// Ctrl+Z as a WM_CHAR code: the numeric edits' undo.
constexpr WCHAR kUndoChar = 26;

// Characters the integer edit lets through, the same for every display base: backspace,
// 16, 17, 19, '#', '$', '0'-'9', 'A'-'F', 'a'-'f', 'x', 'X', 'b', 'B' and '-'.
bool IsLongEditChar(WCHAR c);
// Characters the floating-point edit lets through: '0'-'9', '+', '-', '.', 'e', 'E', backspace.
bool IsDoubleEditChar(WCHAR c);

// Base-2 digits of value read as an unsigned 32-bit number, without leading zeros ("0" for 0).
std::wstring BinaryDigits(long value);
// The text an integer edit shows: "%ld", "0b" + binary digits, or "0x" + upper-case hex
// digits of the 32-bit pattern. Any other display value is treated as decimal.
std::wstring LongDisplayText(long value, int displayType);

// Range text appended to the "not in range" messages: " [ " or " ( ", min, " , ", max,
// " ] " or " ) ", the brackets chosen by whether each end is included.
std::wstring RangeText(const std::wstring& minText, const std::wstring& maxText, bool minIncluded, bool maxIncluded);

// String-table number for a failed integer text check: conversion code (KVTEnumConvertType)
// and number base of the text (2, 10, 16). Code 0 means "converted but out of range".
UINT LongErrorMessageId(int code, int base);
// The same for the floating-point edit.
UINT DoubleErrorMessageId(int code);
// With fixed input: the message when a text's base does not match the display base, else 0.
UINT FixedInputMessageId(int displayType, int base);

// True when the lower end is strictly nearer to cur than the upper end (a tie picks the
// upper end). The integer overload works in 64 bits, so the distances never wrap around.
bool LowerEndIsNearer(long lower, long upper, long cur);
bool LowerEndIsNearer(double lower, double upper, double cur);

// middle + offset as a signed 32-bit value; false when the sum leaves that range.
bool AddSteps(long middle, long offset, long& result);

// True when format is a printf format that consumes exactly one double: literal text and
// "%%" around one conversion with flags, width and precision given as digits (no '*') and
// one of the letters e, E, f, g, G (an 'l' before it is allowed). Anything else would read
// arguments that are not there.
bool IsSingleDoubleFormat(const std::wstring& format);

// Step size of one spin unit derived from the text the format made of the middle value:
// one unit of the last decimal shown, or of the last mantissa digit when the text has an
// exponent letter ('e', else 'E'). Without either a point or an exponent it is 1.0. A middle
// value of 0 (or one without a finite exponent) counts as decimal exponent 0.
double AutoDelta(const std::wstring& formatted, double middle);

} // namespace NumberFormat
