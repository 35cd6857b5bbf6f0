// The user's hand on the program's own windows, on whichever platform the tests run. It reaches what a user could
// reach: nothing happens to what is disabled, hidden, or behind a modal window.
#pragma once

#include <functional>
#include <initializer_list>

#include "platform/controls.h"
#include "tests/contract/machine.h"

namespace contract {

void Click(Button& button);
void Click(ImageButton& button);
void Click(CheckBox& box);
void Choose(ListBox& list, int index);
void Choose(ComboBox& box, int index);       // the entry beside the chosen one
void DoubleClick(ListBox& list, int index);  // the second click follows at once
void PressKey(ListBox& list, int keyCode);
void UseCloseBox(Window& window);

// Happens when the program handles its pending events, or in an event loop.
void QueueEvent(std::function<void()> event);

// What the user does in front of the next modal window. It has to close the window.
void QueueModal(std::function<void()> script);

// Lets these timers tick until the condition holds; false when it does not come true in time.
bool WaitUntil(const std::function<bool()>& condition, std::initializer_list<Timer*> timers);

}  // namespace contract
