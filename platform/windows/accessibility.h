// What screen readers are told of the controls.
#pragma once

#include "platform/windows/control.h"

namespace platform {

// Gives the control its name for screen readers, once after each change of it. Where Windows refuses, it keeps the name
// that Windows finds for it.
void TellName(ControlState& control);

// Before the native control is gone.
void ForgetName(const ControlState& control);

}  // namespace platform
