// The tool tips of a window's controls.
#pragma once

#include "platform/windows/control.h"

namespace platform {

// Tells the tool tips what the control's tip is, and where the control lies while it is disabled.
void UpdateToolTip(const ControlState& control);

// The mouse has moved over the window: from the first time that it is at a control that has a tip the window has tool
// tips. They cost the start of the program more than its controls, so they wait until then.
void OfferToolTips(WindowState& window);

}  // namespace platform
