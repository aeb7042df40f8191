// First page: shows that the library is loaded by listing its string table,
// read through the host's resource chain.
#include "GalleryPage.h"

#include "resource.h"

class CLibraryPage : public CGalleryPage
{
public:
    LPCTSTR GetTitle() const override { return _T("Library"); }
    void CreateControls() override;

private:
    CWnd m_caption;
    CWnd m_strings;
};

GALLERY_PAGE(0, CLibraryPage);

void CLibraryPage::CreateControls()
{
    CRect rc;
    GetClientRect(&rc);
    CFont* font = CFont::FromHandle(static_cast<HFONT>(::GetStockObject(DEFAULT_GUI_FONT)));

    m_caption.Create(_T("STATIC"), _T("OrvaneControlsU.dll is loaded. Its string table, read through the resource chain:"),
                     WS_CHILD | WS_VISIBLE, CRect(12, 10, rc.right - 12, 30), this, 1);
    m_caption.SetFont(font);
    m_strings.CreateEx(WS_EX_CLIENTEDGE, _T("LISTBOX"), nullptr,
                       WS_CHILD | WS_VISIBLE | WS_VSCROLL | WS_HSCROLL | LBS_NOINTEGRALHEIGHT,
                       CRect(12, 36, rc.right - 12, rc.bottom - 12), this, 2);
    m_strings.SetFont(font);
    m_strings.SendMessage(LB_SETHORIZONTALEXTENT, 1400);

    for (UINT id = IDS_DRAGLISTCTRL_CAPTION; id <= IDS_LONG_UNDERFLOW; ++id)
    {
        CString text;
        if (!text.LoadString(id))
            continue;
        text.Replace(_T("\n"), _T(" | "));
        CString line;
        line.Format(_T("%u   %s"), id, static_cast<LPCTSTR>(text));
        m_strings.SendMessage(LB_ADDSTRING, 0, reinterpret_cast<LPARAM>(static_cast<LPCTSTR>(line)));
    }
}
