// The two messages that move a column between a drag header, its drop target and
// the column-customising list, and the block whose address they carry in lParam.
//
// WM_KVX_INSERTCOLUMN (WM_USER+1, wParam 0), sent by the header's drop target to
//   its message window: insert a copy of pColumnInfo (a temporary, valid only during
//   the call) at the position its index holds. hdr is all zero but for code.
// WM_NOTIFY with code KVXN_DELETECOLUMN (0x0402, wParam 0), sent by the drag header to
//   its message window after a drag that moved a column out: remove the column of
//   pColumnInfo, the record the header knows it by. hdr.hwndFrom is the header.
// bSortedColumn: the column is the one its list was sorted by.
#pragma once

#include <afxwin.h>

class KVXColumnInfo;

#define WM_KVX_INSERTCOLUMN (WM_USER + 1)
#define KVXN_DELETECOLUMN   0x0402

struct KVXColumnNotify
{
    NMHDR hdr;
    KVXColumnInfo* pColumnInfo;
    bool bSortedColumn;
};
