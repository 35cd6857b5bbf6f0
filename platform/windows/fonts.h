// The fonts of the controls.
#pragma once

#include <windows.h>

#include "platform/controls.h"

namespace platform {

// Its handle lives as long as the program.
HFONT FontFor(const Font& font, int dpi);

}  // namespace platform
