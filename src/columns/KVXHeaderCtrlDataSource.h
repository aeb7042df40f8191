// KVXHeaderCtrlDataSource: the data source of a dragged column. It renders one
// column record and its flag byte in the "HeaderCtrl Item" format into the file
// the drag's target asks for.
//
//   KVXHeaderCtrlDataSource source;
//   source.DelayRenderFileData(static_cast<CLIPFORMAT>(KVXHeaderCtrlClipboardFormats::HeaderCtrlItem));
//   source.SetData(column, bSortedColumn);
//   source.DoDragDrop(DROPEFFECT_COPY | DROPEFFECT_MOVE | DROPEFFECT_LINK);
#pragma once

#include <afxwin.h>
#include <afxole.h>

#include "KVXColumnInfo.h"

class AFX_EXT_CLASS KVXHeaderCtrlDataSource : public COleDataSource
{
// Constructors
public:
    KVXHeaderCtrlDataSource();
    virtual ~KVXHeaderCtrlDataSource();

// Operations
    // Copies the record; bSortedColumn becomes the payload's flag byte.
    void SetData(KVXColumnInfo& columnInfo, bool bSortedColumn);

// Overridables
    // "HeaderCtrl Item": the record (KVXColumnInfo::Write) and the flag byte; any
    // other format renders nothing.
    virtual BOOL OnRenderFileData(LPFORMATETC lpFormatEtc, CFile* pFile);

// Implementation
protected:
    bool m_bSortedColumn;
    KVXColumnInfo m_ColumnInfo;
};
