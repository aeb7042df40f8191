// For the families that test the control library: its resources (strings, templates,
// the slider cursor) are found through the chain only after the host inserted it, once.
#pragma once

#include "OrvaneControls.h"

namespace orvane_test {

inline void LoadLibraryOnce()
{
    static const bool loaded = (LoadOrvaneControlsLibrary(), true);
    (void)loaded;
}

} // namespace orvane_test
