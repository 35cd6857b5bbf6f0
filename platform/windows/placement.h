// Where a window is and how large it is, in pixels of the screen.
#pragma once

#include <windows.h>

#include "platform/windows/window.h"

namespace platform {

DWORD NativeStyle(const WindowStyle& style);

// Size of the whole window when its client area is as large as the style asks.
SIZE WindowSize(const WindowStyle& style, int dpi);

// The corner of a window of this size in the middle of a monitor: of the one on which the program's first window is, or
// of the primary one for that window itself.
POINT CentredCorner(const WindowState& window, const SIZE& size);

// Moves the window and makes its client area as large as its style asks.
void PlaceWindow(WindowState& window, int left, int top);

// Moves it only.
void MoveWindowTo(const WindowState& window, int left, int top);

// Where the window is; of a minimized one, where it will be again.
RECT PlaceOf(const WindowState& window);

}  // namespace platform
