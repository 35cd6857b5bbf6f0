// The keyboard in the hands of somebody who has no mouse.
#pragma once

#include <vector>

#include "tests/windows/driver/window.h"

namespace driver {

void PressWith(WORD modifier, WORD key);

// Presses Tab until the control has the keyboard; false when it does not get it.
bool TabTo(const Window& control);

// What the control looks like on the screen.
std::vector<COLORREF> Appearance(const Window& control);

// As Answer, with a key instead of the mouse.
Message AnswerWithKey(const Program& program, WORD key);

// Types a path over what stands in a file dialog, and Enter.
void EnterPath(const Program& program, const std::string& path);

}  // namespace driver
