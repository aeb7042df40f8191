// The library's process-wide objects. They live in this one translation unit so
// that they are constructed in a fixed order when the library attaches: first the
// edits' error registry, then the clipboard format of dragged columns.
#include <afxwin.h>

#include "KVXEdit.h"
#include "KVXHeaderCtrlClipboardFormats.h"

// Block size 10: a registry holds one entry per page with a pending error.
CMap<HWND, HWND, KVXEdit*, KVXEdit*> KVXEdit::m_cmapError(10);

UINT KVXHeaderCtrlClipboardFormats::HeaderCtrlItem = ::RegisterClipboardFormatW(L"HeaderCtrl Item");
