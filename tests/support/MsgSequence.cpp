#include "MsgSequence.h"

#include <commctrl.h>

#include <cstdio>
#include <sstream>

namespace orvane_test {

namespace {

struct NameEntry { UINT message; const char* name; };

const NameEntry kNames[] = {
#define N(m) { m, #m }
    N(WM_NULL), N(WM_CREATE), N(WM_DESTROY), N(WM_MOVE), N(WM_SIZE), N(WM_ACTIVATE),
    N(WM_SETFOCUS), N(WM_KILLFOCUS), N(WM_ENABLE), N(WM_SETREDRAW), N(WM_SETTEXT),
    N(WM_GETTEXT), N(WM_GETTEXTLENGTH), N(WM_PAINT), N(WM_CLOSE), N(WM_ERASEBKGND),
    N(WM_SHOWWINDOW), N(WM_ACTIVATEAPP), N(WM_SETCURSOR), N(WM_MOUSEACTIVATE),
    N(WM_GETMINMAXINFO), N(WM_WINDOWPOSCHANGING), N(WM_WINDOWPOSCHANGED), N(WM_NOTIFY),
    N(WM_NCCREATE), N(WM_NCDESTROY), N(WM_NCCALCSIZE), N(WM_NCHITTEST), N(WM_NCPAINT),
    N(WM_NCACTIVATE), N(WM_GETDLGCODE), N(WM_KEYDOWN), N(WM_KEYUP), N(WM_CHAR),
    N(WM_SYSKEYDOWN), N(WM_SYSKEYUP), N(WM_SYSCHAR), N(WM_INITDIALOG), N(WM_COMMAND),
    N(WM_SYSCOMMAND), N(WM_TIMER), N(WM_HSCROLL), N(WM_VSCROLL), N(WM_CTLCOLOREDIT),
    N(WM_CTLCOLORSTATIC), N(WM_CTLCOLORBTN), N(WM_CTLCOLORLISTBOX), N(WM_CTLCOLORDLG),
    N(WM_MOUSEMOVE), N(WM_LBUTTONDOWN), N(WM_LBUTTONUP), N(WM_LBUTTONDBLCLK),
    N(WM_RBUTTONDOWN), N(WM_RBUTTONUP), N(WM_MOUSEWHEEL), N(WM_CAPTURECHANGED),
    N(WM_DRAWITEM), N(WM_MEASUREITEM), N(WM_CANCELMODE), N(WM_PRINTCLIENT),
    N(WM_USER), N(WM_GETFONT), N(WM_SETFONT), N(WM_STYLECHANGING), N(WM_STYLECHANGED),
    N(WM_PARENTNOTIFY), N(WM_CONTEXTMENU), N(WM_CHANGEUISTATE), N(WM_UPDATEUISTATE),
    N(WM_QUERYUISTATE), N(WM_IME_SETCONTEXT), N(WM_IME_NOTIFY), N(EM_SETSEL), N(EM_GETSEL),
    N(EM_SCROLLCARET), N(EM_REPLACESEL), N(EM_UNDO), N(EM_LIMITTEXT),
#undef N
};

struct CodeEntry { UINT code; const char* name; };
const CodeEntry kCodes[] = {
#define C(c) { (UINT)(c), #c }
    C(NM_CLICK), C(NM_DBLCLK), C(NM_RCLICK), C(NM_RETURN), C(NM_SETFOCUS), C(NM_KILLFOCUS),
    C(NM_CUSTOMDRAW), C(TVN_SELCHANGINGW), C(TVN_SELCHANGEDW), C(TVN_ITEMEXPANDINGW),
    C(TVN_ITEMEXPANDEDW), C(TVN_BEGINDRAGW), C(TVN_KEYDOWN), C(TVN_GETDISPINFOW),
    C(LVN_ITEMCHANGING), C(LVN_ITEMCHANGED), C(LVN_COLUMNCLICK), C(LVN_GETDISPINFOW),
    C(LVN_ENDLABELEDITW), C(LVN_BEGINDRAG), C(HDN_ITEMCLICKW), C(HDN_BEGINTRACKW),
    C(HDN_ENDTRACKW), C(HDN_DIVIDERDBLCLICKW),
#undef C
};

std::string Hex(unsigned long long v)
{
    char buf[32];
    std::snprintf(buf, sizeof buf, "0x%llx", v);
    return buf;
}

std::string CodeName(UINT message, UINT id)
{
    if (message == WM_NOTIFY)
        for (const CodeEntry& c : kCodes)
            if (c.code == id)
                return c.name;
    return Hex(id);
}

// Private messages and known control messages are named; the rest appear in hex.
bool IsNoise(UINT message)
{
    switch (message)
    {
    case WM_PAINT: case WM_ERASEBKGND: case WM_NCPAINT: case WM_NCHITTEST: case WM_SETCURSOR:
    case WM_GETTEXT: case WM_GETTEXTLENGTH: case WM_GETICON: case WM_GETOBJECT:
    case WM_CTLCOLOREDIT: case WM_CTLCOLORSTATIC: case WM_CTLCOLORBTN: case WM_CTLCOLORLISTBOX:
    case WM_CTLCOLORDLG: case WM_CTLCOLORSCROLLBAR: case WM_QUERYUISTATE: case WM_UPDATEUISTATE:
    case WM_CHANGEUISTATE: case WM_PRINTCLIENT: case WM_NOTIFYFORMAT: case WM_QUERYNEWPALETTE:
    case WM_MOUSEACTIVATE: case WM_ENTERIDLE: case WM_TIMER: case 0x0090 /* WM_UAHDESTROYWINDOW */:
        return true;
    default:
        return false;
    }
}

bool FieldsMatch(const MsgEntry& x, const MsgEntry& y)
{
    return x.message == y.message && (!(x.flags & WParam) || x.wParam == y.wParam) &&
           (!(x.flags & LParam) || x.lParam == y.lParam) && (!(x.flags & Id) || x.id == y.id) &&
           ((x.flags & Parent) != 0) == ((y.flags & Parent) != 0);
}

} // namespace

std::string MessageName(UINT message)
{
    for (const NameEntry& n : kNames)
        if (n.message == message)
            return n.name;
    if (message >= WM_USER && message < WM_APP)
        return "WM_USER+" + std::to_string(message - WM_USER);
    return Hex(message);
}

std::string DescribeEntry(const MsgEntry& e)
{
    std::ostringstream out;
    out << MessageName(e.message);
    if (e.flags & Parent) out << " parent";
    if (e.flags & Optional) out << " optional";
    out << " w=" << Hex(e.wParam) << " l=" << Hex(static_cast<unsigned long long>(e.lParam));
    if (e.message == WM_NOTIFY || e.message == WM_COMMAND)
        out << " id=" << CodeName(e.message, e.id);
    return out.str();
}

MsgLog::MsgLog(int streams) : m_streams(streams > 0 ? streams : 1) {}

MsgLog::~MsgLog()
{
    while (!m_spies.empty())
        Unspy(m_spies.back()->hwnd);
}

void MsgLog::Add(int stream, const MsgEntry& entry)
{
    if (stream > 0 && stream < static_cast<int>(m_streams.size()))
        m_streams[stream].push_back(entry);
    m_streams[kCombined].push_back(entry);
    if (onRecord)
        onRecord(stream, entry);
}

void MsgLog::Flush()
{
    for (auto& s : m_streams)
        s.clear();
}

const std::vector<MsgEntry>& MsgLog::Stream(int stream) const
{
    return m_streams.at(stream);
}

void MsgLog::SpyWindow(HWND hwnd, int stream)
{
    Spy* spy = new Spy{ hwnd, stream, false, this };
    m_spies.push_back(spy);
    SetWindowSubclass(hwnd, SpyProc, reinterpret_cast<UINT_PTR>(spy), reinterpret_cast<DWORD_PTR>(spy));
}

void MsgLog::SpyParent(HWND hwnd, int stream)
{
    SpyWindow(hwnd, stream);
    m_spies.back()->parent = true;
}

void MsgLog::Unspy(HWND hwnd)
{
    for (auto it = m_spies.begin(); it != m_spies.end();)
    {
        if ((*it)->hwnd == hwnd)
        {
            if (IsWindow(hwnd))
                RemoveWindowSubclass(hwnd, SpyProc, reinterpret_cast<UINT_PTR>(*it));
            delete *it;
            it = m_spies.erase(it);
        }
        else
            ++it;
    }
}

LRESULT CALLBACK MsgLog::SpyProc(HWND hwnd, UINT message, WPARAM wParam, LPARAM lParam,
                                 UINT_PTR, DWORD_PTR data)
{
    Spy* spy = reinterpret_cast<Spy*>(data);
    if (!IsNoise(message))
    {
        bool record = true;
        if (spy->parent)
            record = message == WM_COMMAND || message == WM_NOTIFY || message == WM_DRAWITEM ||
                     message >= WM_USER;
        if (record)
        {
            MsgEntry e{ message, 0, wParam, lParam, 0, hwnd };
            if (spy->parent)
                e.flags |= Parent;
            if (message == WM_NOTIFY && lParam)
                e.id = reinterpret_cast<NMHDR*>(lParam)->code;
            else if (message == WM_COMMAND)
                e.id = HIWORD(wParam);
            spy->log->Add(spy->stream, e);
        }
    }
    if (message == WM_NCDESTROY)
    {
        // The window is going away: stop spying but keep what was recorded.
        MsgLog* log = spy->log;
        RemoveWindowSubclass(hwnd, SpyProc, reinterpret_cast<UINT_PTR>(spy));
        LRESULT r = DefSubclassProc(hwnd, message, wParam, lParam);
        for (auto it = log->m_spies.begin(); it != log->m_spies.end(); ++it)
            if (*it == spy) { log->m_spies.erase(it); break; }
        delete spy;
        return r;
    }
    return DefSubclassProc(hwnd, message, wParam, lParam);
}

testing::AssertionResult MsgLog::Match(int stream, const MsgEntry* expected, const char* file, int line)
{
    std::vector<MsgEntry> actual = m_streams.at(stream);
    m_streams.at(stream).clear();

    std::vector<MsgEntry> want;
    for (const MsgEntry* e = expected; e && e->message; ++e)
        want.push_back(*e);

    // Equal messages compare their flagged fields; an optional entry that does not
    // match is skipped.
    size_t a = 0, w = 0;
    bool ok = true;
    while (ok && (w < want.size() || a < actual.size()))
    {
        if (w < want.size() && a < actual.size() && FieldsMatch(want[w], actual[a]))
        {
            ++w;
            ++a;
        }
        else if (w < want.size() && (want[w].flags & Optional))
            ++w;
        else
            ok = false;
    }
    if (ok)
        return testing::AssertionSuccess();

    std::ostringstream why;
    why << file << ":" << line << ": message sequence differs\n";
    size_t n = want.size() > actual.size() ? want.size() : actual.size();
    for (size_t i = 0; i < n; ++i)
    {
        why << "  " << (i < want.size() ? DescribeEntry(want[i]) : std::string("-"));
        why << "   |   " << (i < actual.size() ? DescribeEntry(actual[i]) : std::string("-")) << "\n";
    }
    return testing::AssertionFailure() << why.str();
}

NotifySpy::NotifySpy(HWND parent, UINT code, size_t payloadSize, bool command, UINT message)
    : m_code(code), m_payloadSize(payloadSize), m_message(message ? message : command ? WM_COMMAND : WM_NOTIFY), m_log(1)
{
    m_log.onRecord = [this](int, const MsgEntry& e) { OnRecord(e); };
    m_log.SpyParent(parent, 0);
}

void NotifySpy::OnRecord(const MsgEntry& e)
{
    if (e.message == m_message && e.message == WM_COMMAND)
    {
        if (HIWORD(e.wParam) == m_code)
        {
            m_ids.push_back(LOWORD(e.wParam));
            m_payloads.emplace_back();
        }
    }
    else if (e.message == m_message && e.lParam && reinterpret_cast<const NMHDR*>(e.lParam)->code == m_code)
    {
        const BYTE* p = reinterpret_cast<const BYTE*>(e.lParam);
        m_ids.push_back(e.message == WM_NOTIFY ? reinterpret_cast<const NMHDR*>(p)->idFrom : e.wParam);
        m_payloads.emplace_back(p, p + m_payloadSize);
    }
    m_log.Flush();
}

} // namespace orvane_test
