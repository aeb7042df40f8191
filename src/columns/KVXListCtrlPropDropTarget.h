// KVXListCtrlPropDropTarget: the drop target of the column chooser's page. It takes a
// dragged column ("HeaderCtrl Item") dropped on the page's list of hidden columns and
// adds it there; the drag's source then removes the column from its list.
#pragma once

#include <afxwin.h>
#include <afxole.h>

class AFX_EXT_CLASS KVXListCtrlPropDropTarget : public COleDropTarget
{
// Constructors
public:
    KVXListCtrlPropDropTarget();
    virtual ~KVXListCtrlPropDropTarget();

// Overridables
    // As OnDragOver.
    virtual DROPEFFECT OnDragEnter(CWnd* pWnd, COleDataObject* pDataObject, DWORD dwKeyState, CPoint point);
    // DROPEFFECT_MOVE for a dragged column over the page's list; the key state is not
    // looked at.
    virtual DROPEFFECT OnDragOver(CWnd* pWnd, COleDataObject* pDataObject, DWORD dwKeyState, CPoint point);
    // Adds the column to the page when its payload is one whole record.
    virtual BOOL OnDrop(CWnd* pWnd, COleDataObject* pDataObject, DROPEFFECT dropEffect, CPoint point);
};
