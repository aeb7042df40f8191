#include "StringEscapes.h"

#include <algorithm>

namespace StringEscapes {

std::wstring ReplaceSpecialCharacters(const std::wstring& text, bool keepStrayBackslash)
{
    std::wstring out;
    out.reserve(text.size());
    size_t pos = 0;
    for (;;)
    {
        const size_t slash = text.find(L'\\', pos);
        if (slash == std::wstring::npos)
        {
            out.append(text, pos, std::wstring::npos);
            break;
        }
        out.append(text, pos, slash - pos);
        const wchar_t next = slash + 1 < text.size() ? text[slash + 1] : L'\0';
        switch (next)
        {
        case L'\\': out += L'\\'; pos = slash + 2; break;
        case L'n':  out += L'\n'; pos = slash + 2; break;
        case L't':  out += L'\t'; pos = slash + 2; break;
        default:
            if (keepStrayBackslash)
                out += L'\\';
            pos = slash + 1;
            break;
        }
    }
    return out;
}

std::wstring RemoveStrayBackslashes(const std::wstring& text)
{
    std::wstring out;
    out.reserve(text.size());
    size_t i = 0;
    while (i < text.size())
    {
        if (text[i] != L'\\')
        {
            out += text[i++];
            continue;
        }
        size_t end = i;
        while (end < text.size() && text[end] == L'\\')
            ++end;
        size_t run = end - i;
        const bool escapeFollows = end < text.size() && (text[end] == L'n' || text[end] == L't');
        if (run % 2 == 1 && !escapeFollows)
            --run;
        out.append(run, L'\\');
        i = end;
    }
    return out;
}

std::wstring ProspectiveTypedText(const std::wstring& text, int selStart, wchar_t ch)
{
    const size_t at = static_cast<size_t>(std::clamp(selStart, 0, static_cast<int>(text.size())));
    std::wstring prospective = text;
    prospective.insert(at, 1, ch);
    return prospective;
}

bool ComposePaste(const std::wstring& text, int selStart, int selEnd, const std::wstring& clip,
                  int maxChars, PasteResult& result)
{
    const int length = static_cast<int>(text.size());
    int start = std::clamp(selStart, 0, length);
    int end = std::clamp(selEnd, 0, length);
    if (end < start)
        std::swap(start, end);

    std::wstring rest = text;
    rest.erase(static_cast<size_t>(start), static_cast<size_t>(end - start));
    const int restLength = static_cast<int>(rest.size());
    if (restLength >= maxChars)
        return false;

    const size_t room = static_cast<size_t>(maxChars - restLength);
    const std::wstring inserted = clip.substr(0, (std::min)(clip.size(), room));
    rest.insert(static_cast<size_t>(start), inserted);
    result.text = rest;
    result.caret = start + static_cast<int>(inserted.size());
    return true;
}

} // namespace StringEscapes
