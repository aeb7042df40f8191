// Pieces the framework layer's tests share: values gtest can print, exceptions caught
// by type, and a window that traces the PreTranslateMessage walk.
#pragma once

#include <afxwin.h>

#include <gtest/gtest.h>

#include <functional>
#include <ostream>
#include <string>

// gtest would print these through their pointer conversions, as addresses.
inline void PrintTo(const CRect& r, std::ostream* os)
{
    *os << "(" << r.left << "," << r.top << ")-(" << r.right << "," << r.bottom << ")";
}

inline void PrintTo(const CPoint& p, std::ostream* os)
{
    *os << "(" << p.x << "," << p.y << ")";
}

inline void PrintTo(const CSize& s, std::ostream* os)
{
    *os << "[" << s.cx << "x" << s.cy << "]";
}

namespace afx_test {

inline std::wstring W(const CString& s)
{
    return std::wstring((LPCTSTR)s, (size_t)s.GetLength());
}

// Runs f and reports whether it threw an E; inspect sees it before it is deleted.
template<class E, class F>
bool Throws(F f, const std::function<void(E*)>& inspect = nullptr)
{
    try
    {
        f();
    }
    catch (E* e)
    {
        if (inspect)
            inspect(e);
        e->Delete();
        return true;
    }
    return false;
}

// Appends its name to a trace for every WM_KEYDOWN offered to PreTranslateMessage,
// takes the message when m_bEat is set, and counts the key-downs dispatched to it.
class CWalkWnd : public CWnd
{
public:
    std::string* m_pTrace = nullptr;
    const char* m_pszName = "";
    BOOL m_bEat = FALSE;
    int m_nKeyDowns = 0;

    BOOL PreTranslateMessage(MSG* pMsg) override
    {
        if (pMsg->message == WM_KEYDOWN)
            *m_pTrace += std::string(m_pszName) + ";";
        return m_bEat;
    }
    LRESULT WindowProc(UINT message, WPARAM wParam, LPARAM lParam) override
    {
        if (message == WM_KEYDOWN)
            ++m_nKeyDowns;
        return CWnd::WindowProc(message, wParam, lParam);
    }
};

} // namespace afx_test
