// Entry point of the control library for host applications.
#pragma once

#include <afxwin.h>

// Inserts the library into the host's resource chain: from then on string, dialog
// template and cursor look-ups (and run-time class look-ups by name) also search
// the library. Call it once during the host's initialisation, before creating any
// control that loads a resource by number.
AFX_EXT_API void LoadOrvaneControlsLibrary();
