// Text rules of the string edit: C-style escapes (\\, \n, \t), stray backslashes, and
// the length arithmetic of typing and pasting under a maximum character count.
// Plain functions over wide strings; no window involved.
#pragma once

#include <string>

namespace StringEscapes {

// Translates the escapes left to right without rescanning produced output: "\\" gives one
// backslash, "\n" a line feed (0x0A), "\t" a tab. A backslash before any other character,
// or at the very end, is kept when keepStrayBackslash is true and dropped otherwise; the
// character after it stays ordinary text.
std::wstring ReplaceSpecialCharacters(const std::wstring& text, bool keepStrayBackslash);

// Removes stray backslashes: of every run of backslashes with odd length that is not
// followed by 'n' or 't', the last backslash goes. Even runs, and odd runs whose last
// backslash starts an \n or \t escape, stay whole.
std::wstring RemoveStrayBackslashes(const std::wstring& text);

// Text that typing ch at the selection start would give; the selection itself is not
// removed for this count (typing over a selection at the maximum is refused).
std::wstring ProspectiveTypedText(const std::wstring& text, int selStart, wchar_t ch);

struct PasteResult
{
    std::wstring text;   // the new window text
    int caret = 0;       // caret position after the inserted text
};

// Replaces the selection [selStart, selEnd) by clip, cutting clip so that the result has
// at most maxChars characters. Returns false (nothing to do) when the text without the
// selection already has maxChars characters or more. Out-of-range selection positions
// are clamped to the text.
bool ComposePaste(const std::wstring& text, int selStart, int selEnd, const std::wstring& clip,
                  int maxChars, PasteResult& result);

} // namespace StringEscapes
