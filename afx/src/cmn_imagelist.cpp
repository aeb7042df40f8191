// CImageList: an object owns its image list handle. Objects made by FromHandle for
// handles that no object owns are temporary wrappers: they never destroy the handle.
#include <afxcmn.h>

#include <map>

IMPLEMENT_DYNCREATE(CImageList, CObject)

namespace {

// Handle -> object maps. Temporary wrappers are reused per handle, so their number is
// bounded by the handles seen; they are freed by DeleteTempMap or at unload.
struct ImageListMaps
{
    std::map<HIMAGELIST, CImageList*> permanent;
    std::map<HIMAGELIST, CImageList*> temporary;

    ~ImageListMaps() { DeleteTemporary(); }

    void DeleteTemporary()
    {
        std::map<HIMAGELIST, CImageList*> temp;
        temp.swap(temporary);
        for (auto& entry : temp)
        {
            entry.second->m_hImageList = NULL;   // a wrapper never destroys the handle
            delete entry.second;
        }
    }
};

ImageListMaps& Maps()
{
    static ImageListMaps maps;
    return maps;
}

} // namespace

/////////////////////////////////////////////////////////////////////////////
// Construction and handle map

CImageList::CImageList()
    : m_hImageList(NULL)
{
}

CImageList::~CImageList()
{
    DeleteImageList();
}

CImageList::operator HIMAGELIST() const
{
    return m_hImageList;
}

HIMAGELIST CImageList::GetSafeHandle() const
{
    return m_hImageList;
}

CImageList* PASCAL CImageList::FromHandle(HIMAGELIST hImageList)
{
    if (hImageList == NULL)
        return NULL;
    if (CImageList* pPermanent = FromHandlePermanent(hImageList))
        return pPermanent;
    ImageListMaps& maps = Maps();
    auto it = maps.temporary.find(hImageList);
    if (it != maps.temporary.end())
        return it->second;
    CImageList* pTemp = new CImageList;
    pTemp->m_hImageList = hImageList;
    maps.temporary[hImageList] = pTemp;
    return pTemp;
}

CImageList* PASCAL CImageList::FromHandlePermanent(HIMAGELIST hImageList)
{
    if (hImageList == NULL)
        return NULL;
    ImageListMaps& maps = Maps();
    auto it = maps.permanent.find(hImageList);
    return it == maps.permanent.end() ? NULL : it->second;
}

void PASCAL CImageList::DeleteTempMap()
{
    Maps().DeleteTemporary();
}

BOOL CImageList::Attach(HIMAGELIST hImageList)
{
    ASSERT(m_hImageList == NULL);
    if (hImageList == NULL || m_hImageList != NULL)
        return FALSE;
    ImageListMaps& maps = Maps();
    // A handle that gains an owner loses its temporary wrapper.
    auto it = maps.temporary.find(hImageList);
    if (it != maps.temporary.end())
    {
        it->second->m_hImageList = NULL;
        delete it->second;
        maps.temporary.erase(it);
    }
    m_hImageList = hImageList;
    maps.permanent[hImageList] = this;
    return TRUE;
}

HIMAGELIST CImageList::Detach()
{
    HIMAGELIST hImageList = m_hImageList;
    if (hImageList != NULL)
    {
        ImageListMaps& maps = Maps();
        auto it = maps.permanent.find(hImageList);
        if (it != maps.permanent.end() && it->second == this)
            maps.permanent.erase(it);
        auto temp = maps.temporary.find(hImageList);
        if (temp != maps.temporary.end() && temp->second == this)
            maps.temporary.erase(temp);
    }
    m_hImageList = NULL;
    return hImageList;
}

BOOL CImageList::DeleteImageList()
{
    if (m_hImageList == NULL)
        return FALSE;
    return ImageList_Destroy(Detach());
}

/////////////////////////////////////////////////////////////////////////////
// Creation

BOOL CImageList::Create(int cx, int cy, UINT nFlags, int nInitial, int nGrow)
{
    return Attach(ImageList_Create(cx, cy, nFlags, nInitial, nGrow));
}

BOOL CImageList::Create(UINT nBitmapID, int cx, int nGrow, COLORREF crMask)
{
    return Create(MAKEINTRESOURCE(nBitmapID), cx, nGrow, crMask);
}

BOOL CImageList::Create(LPCTSTR lpszBitmapID, int cx, int nGrow, COLORREF crMask)
{
    HINSTANCE hInst = AfxFindResourceHandle(lpszBitmapID, RT_BITMAP);
    return Attach(ImageList_LoadImage(hInst, lpszBitmapID, cx, nGrow, crMask, IMAGE_BITMAP, 0));
}

BOOL CImageList::Create(CImageList& imagelist1, int nImage1, CImageList& imagelist2, int nImage2, int dx, int dy)
{
    return Attach(ImageList_Merge(imagelist1.m_hImageList, nImage1, imagelist2.m_hImageList, nImage2, dx, dy));
}

BOOL CImageList::Create(CImageList* pImageList)
{
    if (pImageList == NULL)
        return FALSE;
    return Attach(ImageList_Duplicate(pImageList->m_hImageList));
}

/////////////////////////////////////////////////////////////////////////////
// Attributes

int CImageList::GetImageCount() const
{
    return ImageList_GetImageCount(m_hImageList);
}

COLORREF CImageList::SetBkColor(COLORREF cr)
{
    return ImageList_SetBkColor(m_hImageList, cr);
}

COLORREF CImageList::GetBkColor() const
{
    return ImageList_GetBkColor(m_hImageList);
}

BOOL CImageList::GetImageInfo(int nImage, IMAGEINFO* pImageInfo) const
{
    return ImageList_GetImageInfo(m_hImageList, nImage, pImageInfo);
}

BOOL CImageList::GetIconSize(int* cx, int* cy) const
{
    return ImageList_GetIconSize(m_hImageList, cx, cy);
}

BOOL CImageList::SetImageCount(UINT uNewCount)
{
    return ImageList_SetImageCount(m_hImageList, uNewCount);
}

/////////////////////////////////////////////////////////////////////////////
// Images

int CImageList::Add(CBitmap* pbmImage, CBitmap* pbmMask)
{
    if (pbmImage == NULL)
        return -1;
    return ImageList_Add(m_hImageList, (HBITMAP)pbmImage->m_hObject,
        pbmMask == NULL ? NULL : (HBITMAP)pbmMask->m_hObject);
}

int CImageList::Add(CBitmap* pbmImage, COLORREF crMask)
{
    if (pbmImage == NULL)
        return -1;
    return ImageList_AddMasked(m_hImageList, (HBITMAP)pbmImage->m_hObject, crMask);
}

int CImageList::Add(HICON hIcon)
{
    return ImageList_AddIcon(m_hImageList, hIcon);
}

BOOL CImageList::Remove(int nImage)
{
    return ImageList_Remove(m_hImageList, nImage);
}

BOOL CImageList::Replace(int nImage, CBitmap* pbmImage, CBitmap* pbmMask)
{
    if (pbmImage == NULL)
        return FALSE;
    return ImageList_Replace(m_hImageList, nImage, (HBITMAP)pbmImage->m_hObject,
        pbmMask == NULL ? NULL : (HBITMAP)pbmMask->m_hObject);
}

int CImageList::Replace(int nImage, HICON hIcon)
{
    return ImageList_ReplaceIcon(m_hImageList, nImage, hIcon);
}

HICON CImageList::ExtractIcon(int nImage)
{
    return ImageList_GetIcon(m_hImageList, nImage, ILD_NORMAL);
}

BOOL CImageList::Draw(CDC* pDC, int nImage, POINT pt, UINT nStyle)
{
    if (pDC == NULL)
        return FALSE;
    return ImageList_Draw(m_hImageList, nImage, pDC->m_hDC, pt.x, pt.y, nStyle);
}

BOOL CImageList::SetOverlayImage(int nImage, int nOverlay)
{
    return ImageList_SetOverlayImage(m_hImageList, nImage, nOverlay);
}

BOOL CImageList::Copy(int iDst, int iSrc, UINT uFlags)
{
    return ImageList_Copy(m_hImageList, iDst, m_hImageList, iSrc, uFlags);
}

BOOL CImageList::Copy(int iDst, CImageList* pSrc, int iSrc, UINT uFlags)
{
    if (pSrc == NULL)
        return FALSE;
    return ImageList_Copy(m_hImageList, iDst, pSrc->m_hImageList, iSrc, uFlags);
}

/////////////////////////////////////////////////////////////////////////////
// Drag images

BOOL CImageList::BeginDrag(int nImage, CPoint ptHotSpot)
{
    return ImageList_BeginDrag(m_hImageList, nImage, ptHotSpot.x, ptHotSpot.y);
}

void PASCAL CImageList::EndDrag()
{
    ImageList_EndDrag();
}

BOOL PASCAL CImageList::DragMove(CPoint pt)
{
    return ImageList_DragMove(pt.x, pt.y);
}

BOOL CImageList::SetDragCursorImage(int nDrag, CPoint ptHotSpot)
{
    return ImageList_SetDragCursorImage(m_hImageList, nDrag, ptHotSpot.x, ptHotSpot.y);
}

BOOL PASCAL CImageList::DragShowNolock(BOOL bShow)
{
    return ImageList_DragShowNolock(bShow);
}

CImageList* PASCAL CImageList::GetDragImage(LPPOINT lpPoint, LPPOINT lpPointHotSpot)
{
    return FromHandle(ImageList_GetDragImage(lpPoint, lpPointHotSpot));
}

BOOL PASCAL CImageList::DragEnter(CWnd* pWndLock, CPoint point)
{
    return ImageList_DragEnter(pWndLock == NULL ? NULL : pWndLock->m_hWnd, point.x, point.y);
}

BOOL PASCAL CImageList::DragLeave(CWnd* pWndLock)
{
    return ImageList_DragLeave(pWndLock == NULL ? NULL : pWndLock->m_hWnd);
}
