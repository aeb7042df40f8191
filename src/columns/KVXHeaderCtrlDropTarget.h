// KVXHeaderCtrlDropTarget: the drop target of a drag header. While a dragged column
// is over the header it marks the insertion position with two red triangles drawn on
// the header's parent; on a drop it sends WM_KVX_INSERTCOLUMN (KVXColumnNotify.h) with
// the column and that position to its message window (the header's parent when none).
#pragma once

#include <afxwin.h>
#include <afxcmn.h>
#include <afxole.h>

class AFX_EXT_CLASS KVXHeaderCtrlDropTarget : public COleDropTarget
{
// Constructors
public:
    KVXHeaderCtrlDropTarget();
    virtual ~KVXHeaderCtrlDropTarget();

// Operations
    void SetMessageWnd(CWnd* pWnd);

// Overridables
    // Forgets the marker last drawn, then as OnDragOver.
    virtual DROPEFFECT OnDragEnter(CWnd* pWnd, COleDataObject* pDataObject, DWORD dwKeyState, CPoint point);
    // DROPEFFECT_MOVE over a header for a dragged column, with the marker at the
    // insertion position; DROPEFFECT_NONE otherwise. The key state is not looked at.
    virtual DROPEFFECT OnDragOver(CWnd* pWnd, COleDataObject* pDataObject, DWORD dwKeyState, CPoint point);
    // Takes a moved column whose payload is one whole record; FALSE otherwise.
    virtual BOOL OnDrop(CWnd* pWnd, COleDataObject* pDataObject, DROPEFFECT dropEffect, CPoint point);
    virtual void OnDragLeave(CWnd* pWnd);

// Implementation
protected:
    CWnd* m_pMessageWnd;
    CRect m_rectMarkTop;        // in the header parent's client coordinates; empty: none
    CRect m_rectMarkBottom;

private:
    // The insertion position for a point in the header's client coordinates, and the
    // insertion line: rect spans the header vertically, left = right = the line's x
    // in the parent's coordinates (the parent's horizontal scroll taken off).
    bool CheckPositionForHeader(CHeaderCtrl* pHeader, CPoint point, int& nIndex, CRect& rect);
    // Invalidates the marker areas in the parent and repaints them at once.
    void EraseMarker(CWnd* pParent);
};
