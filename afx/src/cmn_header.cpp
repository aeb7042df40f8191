// CHeaderCtrl: one message per wrapper; the header control's own results are returned.
#include <afxcmn.h>
#include <afxpriv.h>

IMPLEMENT_DYNAMIC(CHeaderCtrl, CWnd)

/////////////////////////////////////////////////////////////////////////////
// Construction

CHeaderCtrl::CHeaderCtrl()
{
}

CHeaderCtrl::~CHeaderCtrl()
{
    DestroyWindow();
}

BOOL CHeaderCtrl::Create(DWORD dwStyle, const RECT& rect, CWnd* pParentWnd, UINT nID)
{
    if (!AfxDeferRegisterClass(AFX_WNDCOMMCTLS_REG))
        return FALSE;
    return CWnd::Create(WC_HEADER, NULL, dwStyle, rect, pParentWnd, nID);
}

BOOL CHeaderCtrl::CreateEx(DWORD dwExStyle, DWORD dwStyle, const RECT& rect, CWnd* pParentWnd, UINT nID)
{
    if (!AfxDeferRegisterClass(AFX_WNDCOMMCTLS_REG))
        return FALSE;
    return CWnd::CreateEx(dwExStyle, WC_HEADER, NULL, dwStyle, rect, pParentWnd, nID);
}

/////////////////////////////////////////////////////////////////////////////
// Attributes

int CHeaderCtrl::GetItemCount() const
{
    ASSERT(::IsWindow(m_hWnd));
    return (int)::SendMessage(m_hWnd, HDM_GETITEMCOUNT, 0, 0);
}

BOOL CHeaderCtrl::GetItem(int nPos, HDITEM* pHeaderItem) const
{
    ASSERT(::IsWindow(m_hWnd));
    return (BOOL)::SendMessage(m_hWnd, HDM_GETITEM, (WPARAM)nPos, (LPARAM)pHeaderItem);
}

BOOL CHeaderCtrl::SetItem(int nPos, HDITEM* pHeaderItem)
{
    ASSERT(::IsWindow(m_hWnd));
    return (BOOL)::SendMessage(m_hWnd, HDM_SETITEM, (WPARAM)nPos, (LPARAM)pHeaderItem);
}

CImageList* CHeaderCtrl::GetImageList() const
{
    ASSERT(::IsWindow(m_hWnd));
    return CImageList::FromHandle((HIMAGELIST)::SendMessage(m_hWnd, HDM_GETIMAGELIST, 0, 0));
}

CImageList* CHeaderCtrl::SetImageList(CImageList* pImageList)
{
    ASSERT(::IsWindow(m_hWnd));
    return CImageList::FromHandle((HIMAGELIST)::SendMessage(m_hWnd, HDM_SETIMAGELIST, 0,
        (LPARAM)(pImageList == NULL ? NULL : pImageList->m_hImageList)));
}

BOOL CHeaderCtrl::GetItemRect(int nIndex, LPRECT lpRect) const
{
    ASSERT(::IsWindow(m_hWnd));
    return (BOOL)::SendMessage(m_hWnd, HDM_GETITEMRECT, (WPARAM)nIndex, (LPARAM)lpRect);
}

BOOL CHeaderCtrl::GetOrderArray(LPINT piArray, int iCount)
{
    ASSERT(::IsWindow(m_hWnd));
    if (iCount == -1)
        iCount = GetItemCount();
    return (BOOL)::SendMessage(m_hWnd, HDM_GETORDERARRAY, (WPARAM)iCount, (LPARAM)piArray);
}

BOOL CHeaderCtrl::SetOrderArray(int iCount, LPINT piArray)
{
    ASSERT(::IsWindow(m_hWnd));
    return (BOOL)::SendMessage(m_hWnd, HDM_SETORDERARRAY, (WPARAM)iCount, (LPARAM)piArray);
}

int CHeaderCtrl::OrderToIndex(int nOrder) const
{
    ASSERT(::IsWindow(m_hWnd));
    return (int)::SendMessage(m_hWnd, HDM_ORDERTOINDEX, (WPARAM)nOrder, 0);
}

/////////////////////////////////////////////////////////////////////////////
// Operations

int CHeaderCtrl::InsertItem(int nPos, HDITEM* phdi)
{
    ASSERT(::IsWindow(m_hWnd));
    return (int)::SendMessage(m_hWnd, HDM_INSERTITEM, (WPARAM)nPos, (LPARAM)phdi);
}

BOOL CHeaderCtrl::DeleteItem(int nPos)
{
    ASSERT(::IsWindow(m_hWnd));
    return (BOOL)::SendMessage(m_hWnd, HDM_DELETEITEM, (WPARAM)nPos, 0);
}

BOOL CHeaderCtrl::Layout(HDLAYOUT* pHeaderLayout)
{
    ASSERT(::IsWindow(m_hWnd));
    return (BOOL)::SendMessage(m_hWnd, HDM_LAYOUT, 0, (LPARAM)pHeaderLayout);
}

int CHeaderCtrl::HitTest(LPHDHITTESTINFO pHeaderHitTestInfo)
{
    ASSERT(::IsWindow(m_hWnd));
    return (int)::SendMessage(m_hWnd, HDM_HITTEST, 0, (LPARAM)pHeaderHitTestInfo);
}

/////////////////////////////////////////////////////////////////////////////
// Owner draw

void CHeaderCtrl::DrawItem(LPDRAWITEMSTRUCT)
{
}

BOOL CHeaderCtrl::OnChildNotify(UINT message, WPARAM wParam, LPARAM lParam, LRESULT* pResult)
{
    if (message != WM_DRAWITEM)
        return CWnd::OnChildNotify(message, wParam, lParam, pResult);
    DrawItem((LPDRAWITEMSTRUCT)lParam);
    if (pResult != NULL)
        *pResult = TRUE;
    return TRUE;
}
