#include "HostDialog.h"

#include <afxpriv.h>

#include "KVXSpin.h"
#include "resource.h"

BEGIN_MESSAGE_MAP(CHostDialog, CDialog)
    ON_WM_DESTROY()
    ON_MESSAGE(WM_KVX_COLORWELLCHANGED, &CHostDialog::OnColourChanged)
    ON_MESSAGE(WM_KICKIDLE, &CHostDialog::OnKickIdle)
END_MESSAGE_MAP()

CHostDialog::CHostDialog(bool bSelfCheck)
    : CDialog(IDD_HOST), m_lCount(12), m_clrColour(RGB(0, 102, 204)), m_nSelected(0),
      m_bSelfCheck(bSelfCheck)
{
}

BOOL CHostDialog::OnInitDialog()
{
    CDialog::OnInitDialog();

    // Range and value first: subclassing shows the value and places the spin.
    m_count.SetRange(KVXVariant(1L), KVXVariant(100L), TRUE, TRUE);
    m_count.SetValue(m_lCount, TRUE);
    m_count.SubclassDlgItem(IDC_COUNT, this);
    // Keeps the user in the field while its text is invalid.
    m_count.InitErrorHandling(m_hWnd, TRUE);

    // The template gives the button BS_OWNERDRAW, as the well needs.
    m_colour.SubclassDlgItem(IDC_COLOUR, this);
    m_colour.SetColor(m_clrColour);

    m_tree.SubclassDlgItem(IDC_TREE, this);
    HTREEITEM hFruit = m_tree.InsertItem(_T("Fruit"));
    m_tree.InsertItem(_T("Apples"), hFruit);
    m_tree.InsertItem(_T("Pears"), hFruit);
    m_tree.InsertItem(_T("Plums"), hFruit);
    m_tree.Expand(hFruit, TVE_EXPAND);
    return TRUE;
}

void CHostDialog::OnOK()
{
    m_lCount = m_count.GetValue(TRUE);
    m_clrColour = m_colour.GetColor();
    m_nSelected = m_tree.GetSelectedCount();
    CDialog::OnOK();
}

void CHostDialog::OnDestroy()
{
    m_count.InitErrorHandling(m_hWnd, FALSE);
    CDialog::OnDestroy();
}

LRESULT CHostDialog::OnColourChanged(WPARAM wParam, LPARAM lParam)
{
    const KVXColorWellNotify* pNotify = reinterpret_cast<const KVXColorWellNotify*>(lParam);
    if (wParam == IDC_COLOUR)
        m_clrColour = pNotify->clrColor;
    return 0;
}

// The modal loop sends WM_KICKIDLE once the dialog is shown and the queue is empty.
LRESULT CHostDialog::OnKickIdle(WPARAM, LPARAM)
{
    if (m_bSelfCheck)
    {
        m_bSelfCheck = false;
        EndDialog(CheckControls() ? IDOK : IDABORT);
    }
    return FALSE;
}

namespace {

// A GUI program has no console; its standard output is whatever the caller gave it.
void PrintLine(const CString& line)
{
    HANDLE hOut = ::GetStdHandle(STD_OUTPUT_HANDLE);
    if (hOut == NULL || hOut == INVALID_HANDLE_VALUE)
        return;
    const CString text = line + _T("\n");
    char buffer[512];
    const int nBytes = ::WideCharToMultiByte(CP_UTF8, 0, text, text.GetLength(), buffer, sizeof buffer, NULL, NULL);
    DWORD written = 0;
    ::WriteFile(hOut, buffer, nBytes, &written, NULL);
}

} // namespace

// Walks the dialog's visible child windows and names the library object attached to each.
bool CHostDialog::CheckControls()
{
    int nEdits = 0, nSpins = 0, nWells = 0, nTrees = 0;
    CString line(_T("OrvaneHost shows:"));
    for (CWnd* pChild = GetWindow(GW_CHILD); pChild != NULL; pChild = pChild->GetWindow(GW_HWNDNEXT))
    {
        CWnd* pObject = CWnd::FromHandlePermanent(pChild->m_hWnd);
        if (pObject == NULL || !pObject->IsWindowVisible())
            continue;
        CString item;
        if (KVXLongEdit* pEdit = dynamic_cast<KVXLongEdit*>(pObject))
        {
            ++nEdits;
            item.Format(_T(" KVXLongEdit(%ld)"), pEdit->GetValue(FALSE));
        }
        else if (dynamic_cast<KVXSpin*>(pObject) != NULL)
        {
            ++nSpins;
            item = _T(" KVXSpin");
        }
        else if (KVXColorWell* pWell = dynamic_cast<KVXColorWell*>(pObject))
        {
            ++nWells;
            item.Format(_T(" KVXColorWell(%06lX)"), static_cast<unsigned long>(pWell->GetColor()));
        }
        else if (CMultiTree* pTree = dynamic_cast<CMultiTree*>(pObject))
        {
            ++nTrees;
            item.Format(_T(" CMultiTree(%u items)"), pTree->GetCount());
        }
        line += item;
    }
    PrintLine(line);
    return nEdits == 1 && nSpins == 1 && nWells == 1 && nTrees == 1;
}
