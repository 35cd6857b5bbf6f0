// What stands behind a timer.
#pragma once

#include <windows.h>

#include "platform/windows/window.h"

namespace platform {

struct TimerState {
  Timer& Object;
  WindowState* Owner;  // null once the window object is gone
  UINT Interval;
  bool Enabled = false;
};

// Runs the window's timer of this number (WM_TIMER), unless it has been disabled meanwhile.
void Tick(const WindowState& window, UINT_PTR id);

}  // namespace platform
