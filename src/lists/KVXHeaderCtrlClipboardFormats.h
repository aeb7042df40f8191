// The clipboard format that carries a dragged column between windows.
#pragma once

#include <afxwin.h>

class AFX_EXT_CLASS KVXHeaderCtrlClipboardFormats
{
public:
    // RegisterClipboardFormat("HeaderCtrl Item"), registered once when the library loads.
    static UINT HeaderCtrlItem;

    KVXHeaderCtrlClipboardFormats& operator=(const KVXHeaderCtrlClipboardFormats&) { return *this; }
};
