// oleimpl.h - helpers shared by the OLE sources of the framework.
#pragma once

#include "wndimpl.h"

#include <afxole.h>
#include <afxadv.h>

// The FORMATETC for cfFormat when the caller gave none: content aspect, no target
// device, any medium (tymed -1). Returns the one to use.
LPFORMATETC AFXAPI _AfxFillFormatEtc(LPFORMATETC lpFormatEtc, CLIPFORMAT cfFormat,
    LPFORMATETC lpFormatEtcFill);

// Copies a memory handle or stream medium: into lpDest's own medium when it has
// one of the same type, else into a new one. FALSE for other media.
BOOL AFXAPI _AfxCopyStgMedium(CLIPFORMAT cfFormat, LPSTGMEDIUM lpDest, LPSTGMEDIUM lpSource);

// Stream errors become file exceptions, as for any CFile.
void AFXAPI _AfxThrowOleFileException(SCODE sc);
