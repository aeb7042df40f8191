// Multi-selection tree page: about a thousand folders and files. Click, Ctrl+click,
// Shift+click, Shift/Ctrl with the arrow keys, and a rubber band dragged over empty
// space select; the pane on the right lists the notifications the page receives as
// they arrive, marking those the control sends itself.
#include "GalleryPage.h"

#include <afxcmn.h>

#include "CMultiTree.h"

#include <vector>

class CTreePage : public CGalleryPage
{
public:
    CTreePage();

    LPCTSTR GetTitle() const override { return _T("Tree"); }
    void CreateControls() override;

protected:
    BOOL OnNotify(WPARAM wParam, LPARAM lParam, LRESULT* pResult) override;
    afx_msg void OnCheckBoxes();
    afx_msg void OnMultiSelect();
    afx_msg void OnLabelHit();
    afx_msg void OnClearLog();
    afx_msg LRESULT OnFlushLog(WPARAM wParam, LPARAM lParam);
    DECLARE_MESSAGE_MAP()

private:
    enum
    {
        IDC_TREE = 400,
        IDC_LOG,
        IDC_CHECKBOXES,
        IDC_MULTISELECT,
        IDC_LABELHIT,
        IDC_CLEAR,
        IDC_STATUS,
    };
    // Posted once per burst of notifications: the pane is filled in one go, so a band
    // or a Select All over hundreds of items does not repaint it line by line.
    static const UINT kFlushLogMessage = WM_APP + 40;

    void CreateTree();
    void Fill();
    void AddButton(CWnd& button, UINT id, LPCTSTR text, DWORD style, const CRect& rc);
    void Log(const CString& line);
    void UpdateStatus();
    CString Describe(const NMHDR* pHdr) const;

    CFont* m_pFont;
    CRect m_rcTree;
    CMultiTree m_tree;
    CWnd m_treeLabel;
    CWnd m_logLabel;
    CWnd m_log;
    CWnd m_checkBoxes;
    CWnd m_multiSelect;
    CWnd m_labelHit;
    CWnd m_clear;
    CWnd m_status;
    std::vector<CString> m_pendingLines;
    bool m_bFlushPosted;
};

GALLERY_PAGE(40, CTreePage);

BEGIN_MESSAGE_MAP(CTreePage, CGalleryPage)
    ON_BN_CLICKED(IDC_CHECKBOXES, &CTreePage::OnCheckBoxes)
    ON_BN_CLICKED(IDC_MULTISELECT, &CTreePage::OnMultiSelect)
    ON_BN_CLICKED(IDC_LABELHIT, &CTreePage::OnLabelHit)
    ON_BN_CLICKED(IDC_CLEAR, &CTreePage::OnClearLog)
    ON_MESSAGE(kFlushLogMessage, &CTreePage::OnFlushLog)
END_MESSAGE_MAP()

CTreePage::CTreePage()
    : m_pFont(NULL), m_bFlushPosted(false)
{
}

void CTreePage::AddButton(CWnd& button, UINT id, LPCTSTR text, DWORD style, const CRect& rc)
{
    button.Create(_T("BUTTON"), text, WS_CHILD | WS_VISIBLE | WS_TABSTOP | style, rc, this, id);
    button.SetFont(m_pFont);
}

void CTreePage::CreateControls()
{
    m_pFont = CFont::FromHandle(static_cast<HFONT>(::GetStockObject(DEFAULT_GUI_FONT)));
    CRect rc;
    GetClientRect(&rc);
    const int split = rc.Width() * 11 / 20;

    m_treeLabel.Create(_T("STATIC"), _T("Ctrl/Shift + click or arrows; drag over empty space for a rubber band"),
        WS_CHILD | WS_VISIBLE, CRect(12, 10, split - 6, 28), this, 0xFFFF);
    m_treeLabel.SetFont(m_pFont);
    m_rcTree = CRect(12, 32, split - 6, rc.bottom - 74);
    CreateTree();

    AddButton(m_checkBoxes, IDC_CHECKBOXES, _T("Check boxes"), BS_AUTOCHECKBOX, CRect(12, rc.bottom - 66, 130, rc.bottom - 46));
    AddButton(m_multiSelect, IDC_MULTISELECT, _T("Multiple selection"), BS_AUTOCHECKBOX, CRect(136, rc.bottom - 66, 286, rc.bottom - 46));
    AddButton(m_labelHit, IDC_LABELHIT, _T("Band hits labels only"), BS_AUTOCHECKBOX, CRect(292, rc.bottom - 66, split - 6, rc.bottom - 46));
    m_multiSelect.SendMessage(BM_SETCHECK, BST_CHECKED);

    m_status.Create(_T("STATIC"), _T(""), WS_CHILD | WS_VISIBLE, CRect(12, rc.bottom - 38, split - 6, rc.bottom - 20), this, IDC_STATUS);
    m_status.SetFont(m_pFont);

    m_logLabel.Create(_T("STATIC"), _T("Notifications received by the parent (* sent by the control itself)"),
        WS_CHILD | WS_VISIBLE, CRect(split + 6, 10, rc.right - 12, 28), this, 0xFFFF);
    m_logLabel.SetFont(m_pFont);
    m_log.CreateEx(WS_EX_CLIENTEDGE, _T("LISTBOX"), NULL,
        WS_CHILD | WS_VISIBLE | WS_VSCROLL | LBS_NOINTEGRALHEIGHT | LBS_NOSEL,
        CRect(split + 6, 32, rc.right - 12, rc.bottom - 74), this, IDC_LOG);
    m_log.SetFont(m_pFont);
    AddButton(m_clear, IDC_CLEAR, _T("Clear"), BS_PUSHBUTTON, CRect(rc.right - 92, rc.bottom - 68, rc.right - 12, rc.bottom - 44));
    UpdateStatus();
}

void CTreePage::CreateTree()
{
    // Check boxes are a creation style of the tree: switching them re-creates it.
    const BOOL bCheckBoxes = m_checkBoxes.m_hWnd != NULL && m_checkBoxes.SendMessage(BM_GETCHECK) == BST_CHECKED;
    if (m_tree.m_hWnd != NULL)
        m_tree.DestroyWindow();
    DWORD style = WS_CHILD | WS_VISIBLE | WS_BORDER | WS_TABSTOP | TVS_HASBUTTONS | TVS_HASLINES
        | TVS_LINESATROOT | TVS_SHOWSELALWAYS;
    if (bCheckBoxes)
        style |= TVS_CHECKBOXES;
    m_tree.Create(style, m_rcTree, this, IDC_TREE);
    m_tree.SetFont(m_pFont);
    if (m_multiSelect.m_hWnd != NULL)
        m_tree.SetMultiSelect(m_multiSelect.SendMessage(BM_GETCHECK) == BST_CHECKED);
    if (m_labelHit.m_hWnd != NULL)
        m_tree.SetBandingHit(m_labelHit.SendMessage(BM_GETCHECK) == BST_CHECKED);
    Fill();
}

void CTreePage::Fill()
{
    static const LPCTSTR kFolders[] = { _T("Documents"), _T("Pictures"), _T("Music"), _T("Projects"), _T("Reports"),
        _T("Archive"), _T("Letters"), _T("Invoices"), _T("Drafts"), _T("Backups") };
    static const LPCTSTR kExtensions[] = { _T("txt"), _T("doc"), _T("png"), _T("csv"), _T("pdf") };

    // Filled with redraw off: a visible tree repaints after every insertion.
    m_tree.SetRedraw(FALSE);
    int files = 0;
    for (int f = 0; f < 10; ++f)
    {
        HTREEITEM hFolder = m_tree.InsertItem(kFolders[f]);
        for (int s = 0; s < 4; ++s)
        {
            CString name;
            name.Format(_T("%s %d"), kFolders[(f + s + 1) % 10], 2020 + s);
            HTREEITEM hSub = m_tree.InsertItem(name, hFolder);
            for (int i = 0; i < 23; ++i)
            {
                name.Format(_T("File %04d.%s"), ++files, kExtensions[(f + i) % 5]);
                m_tree.InsertItem(TVIF_TEXT | TVIF_PARAM, name, 0, 0, 0, 0, files, hSub, TVI_LAST);
            }
        }
        if (f < 3)
            m_tree.Expand(hFolder, TVE_EXPAND);
    }
    m_tree.Expand(m_tree.GetChildItem(m_tree.GetRootItem()), TVE_EXPAND);
    m_tree.SetRedraw(TRUE);
    m_tree.Invalidate();

    // Start with a small multiple selection; the log shows what selecting it sent.
    m_pendingLines.clear();
    HTREEITEM hFile = m_tree.GetChildItem(m_tree.GetChildItem(m_tree.GetRootItem()));
    for (int i = 0; hFile != NULL && i < 8; ++i, hFile = m_tree.GetNextSiblingItem(hFile))
    {
        if (i == 2 || i == 3 || i == 6)
            m_tree.SetItemState(hFile, TVIS_SELECTED, TVIS_SELECTED);
    }
}

CString CTreePage::Describe(const NMHDR* pHdr) const
{
    LPCTSTR name = NULL;
    bool bItems = true;
    switch (pHdr->code)
    {
    case TVN_SELCHANGINGW: name = _T("TVN_SELCHANGING"); break;
    case TVN_SELCHANGEDW: name = _T("TVN_SELCHANGED"); break;
    case TVN_BEGINDRAGW: name = _T("TVN_BEGINDRAG"); break;
    case TVN_BEGINRDRAGW: name = _T("TVN_BEGINRDRAG"); break;
    case TVN_ITEMEXPANDINGW: name = _T("TVN_ITEMEXPANDING"); break;
    case TVN_ITEMEXPANDEDW: name = _T("TVN_ITEMEXPANDED"); break;
    case NM_CLICK: name = _T("NM_CLICK"); bItems = false; break;
    case NM_RCLICK: name = _T("NM_RCLICK"); bItems = false; break;
    case NM_DBLCLK: name = _T("NM_DBLCLK"); bItems = false; break;
    case NM_SETFOCUS: name = _T("NM_SETFOCUS"); bItems = false; break;
    case NM_KILLFOCUS: name = _T("NM_KILLFOCUS"); bItems = false; break;
    case TVN_KEYDOWN: name = _T("TVN_KEYDOWN"); bItems = false; break;
    default: return CString();
    }
    CString line;
    line.Format(_T("%s%s"), m_tree.IsEmulatedNotify() ? _T("* ") : _T("   "), name);
    if (bItems)
    {
        const NMTREEVIEW* pNM = reinterpret_cast<const NMTREEVIEW*>(pHdr);
        if (pNM->itemOld.hItem != NULL)
            line += _T("   old: ") + m_tree.GetItemText(pNM->itemOld.hItem);
        if (pNM->itemNew.hItem != NULL)
            line += _T("   new: ") + m_tree.GetItemText(pNM->itemNew.hItem);
    }
    return line;
}

BOOL CTreePage::OnNotify(WPARAM wParam, LPARAM lParam, LRESULT* pResult)
{
    const NMHDR* pHdr = reinterpret_cast<const NMHDR*>(lParam);
    if (m_tree.m_hWnd != NULL && pHdr->hwndFrom == m_tree.m_hWnd)
    {
        const CString line = Describe(pHdr);
        if (!line.IsEmpty())
            Log(line);
    }
    return CGalleryPage::OnNotify(wParam, lParam, pResult);
}

void CTreePage::Log(const CString& line)
{
    m_pendingLines.push_back(line);
    if (!m_bFlushPosted && m_hWnd != NULL)
        m_bFlushPosted = PostMessage(kFlushLogMessage) != FALSE;
}

LRESULT CTreePage::OnFlushLog(WPARAM, LPARAM)
{
    m_bFlushPosted = false;
    if (m_log.m_hWnd == NULL)
        return 0;
    const size_t kMaxLines = 400;
    m_log.SetRedraw(FALSE);
    const size_t first = m_pendingLines.size() > kMaxLines ? m_pendingLines.size() - kMaxLines : 0;
    for (size_t i = first; i < m_pendingLines.size(); ++i)
        m_log.SendMessage(LB_ADDSTRING, 0, reinterpret_cast<LPARAM>(static_cast<LPCTSTR>(m_pendingLines[i])));
    m_pendingLines.clear();
    while (m_log.SendMessage(LB_GETCOUNT) > static_cast<LRESULT>(kMaxLines))
        m_log.SendMessage(LB_DELETESTRING, 0);
    const LRESULT count = m_log.SendMessage(LB_GETCOUNT);
    if (count > 0)
        m_log.SendMessage(LB_SETTOPINDEX, static_cast<WPARAM>(count - 1));
    m_log.SetRedraw(TRUE);
    m_log.Invalidate();
    UpdateStatus();
    return 0;
}

void CTreePage::UpdateStatus()
{
    if (m_status.m_hWnd == NULL)
        return;
    CString text;
    text.Format(_T("%u items, %u selected"), m_tree.GetCount(), m_tree.GetSelectedCount());
    m_status.SetWindowText(text);
}

void CTreePage::OnCheckBoxes()
{
    CreateTree();
    UpdateStatus();
}

void CTreePage::OnMultiSelect()
{
    m_tree.SetMultiSelect(m_multiSelect.SendMessage(BM_GETCHECK) == BST_CHECKED);
    UpdateStatus();
}

void CTreePage::OnLabelHit()
{
    m_tree.SetBandingHit(m_labelHit.SendMessage(BM_GETCHECK) == BST_CHECKED);
}

void CTreePage::OnClearLog()
{
    m_log.SendMessage(LB_RESETCONTENT);
}
