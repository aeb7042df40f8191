#include "DialogTemplateReader.h"

namespace {

class Cursor
{
public:
    Cursor(const BYTE* p, size_t size) : m_begin(p), m_p(p), m_end(p + size) {}
    bool ok() const { return m_ok; }

    WORD Word()
    {
        if (m_end - m_p < 2) { m_ok = false; return 0; }
        WORD w = static_cast<WORD>(m_p[0] | (m_p[1] << 8));
        m_p += 2;
        return w;
    }
    DWORD Dword()
    {
        WORD lo = Word();
        WORD hi = Word();
        return lo | (static_cast<DWORD>(hi) << 16);
    }
    // sz_Or_Ord: 0 = none, 0xFFFF + ordinal, or a zero-terminated string.
    std::wstring StringOrOrdinal(WORD* ordinal = nullptr)
    {
        WORD first = Word();
        if (first == 0xFFFF)
        {
            WORD ord = Word();
            if (ordinal) *ordinal = ord;
            return std::wstring();
        }
        std::wstring s;
        for (WORD c = first; c != 0 && m_ok; c = Word())
            s.push_back(static_cast<wchar_t>(c));
        return s;
    }
    void AlignDword()
    {
        size_t offset = static_cast<size_t>(m_p - m_begin);
        size_t pad = (4 - offset % 4) % 4;
        if (static_cast<size_t>(m_end - m_p) < pad) { m_ok = false; return; }
        m_p += pad;
    }
    void Skip(size_t n)
    {
        if (static_cast<size_t>(m_end - m_p) < n) { m_ok = false; return; }
        m_p += n;
    }

private:
    const BYTE* m_begin;
    const BYTE* m_p;
    const BYTE* m_end;
    bool m_ok = true;
};

std::wstring PredefinedClass(WORD atom)
{
    switch (atom)
    {
    case 0x0080: return L"Button";
    case 0x0081: return L"Edit";
    case 0x0082: return L"Static";
    case 0x0083: return L"ListBox";
    case 0x0084: return L"ScrollBar";
    case 0x0085: return L"ComboBox";
    default: return L"#" + std::to_wstring(atom);
    }
}

} // namespace

DialogTemplateInfo ReadDialogTemplate(const void* data, size_t size)
{
    DialogTemplateInfo info;
    if (!data)
        return info;
    Cursor c(static_cast<const BYTE*>(data), size);
    info.style = c.Dword();
    c.Dword();                       // extended style
    WORD count = c.Word();
    c.Word(); c.Word();              // x, y
    info.cx = static_cast<short>(c.Word());
    info.cy = static_cast<short>(c.Word());
    c.StringOrOrdinal();             // menu
    c.StringOrOrdinal();             // class
    info.caption = c.StringOrOrdinal();
    if (info.style & DS_SETFONT)
    {
        info.pointSize = c.Word();
        info.fontName = c.StringOrOrdinal();
    }
    for (WORD i = 0; i < count && c.ok(); ++i)
    {
        c.AlignDword();
        DialogControlInfo item;
        item.style = c.Dword();
        c.Dword();                   // extended style
        item.x = static_cast<short>(c.Word());
        item.y = static_cast<short>(c.Word());
        item.cx = static_cast<short>(c.Word());
        item.cy = static_cast<short>(c.Word());
        item.id = c.Word();
        WORD atom = 0;
        item.className = c.StringOrOrdinal(&atom);
        if (item.className.empty() && atom)
            item.className = PredefinedClass(atom);
        item.text = c.StringOrOrdinal();
        WORD extra = c.Word();
        c.Skip(extra);
        info.controls.push_back(item);
    }
    info.valid = c.ok();
    return info;
}
