// The screen: one plane of all monitors, in twips, whose origin is the top left corner of the primary one.
#pragma once

#include <vector>

#include "platform/controls.h"

namespace platform {

// Size of the primary monitor, the taskbar included.
int ScreenWidth();
int ScreenHeight();

// Every monitor's place, in no order; the primary one among them.
std::vector<Bounds> Monitors();

}  // namespace platform
