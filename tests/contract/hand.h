// The user's hand on the program's own windows, on whichever platform the tests run. It reaches what a user could
// reach: nothing happens to what is disabled, hidden, or behind a modal window.
#pragma once

#include <functional>
#include <initializer_list>

#include "platform/controls.h"
#include "platform/messages.h"

namespace contract {

// A screen without windows and a user without plans; at the end of its life, too.
class Desk {
 public:
  Desk();
  ~Desk();
  Desk(const Desk&) = delete;
  Desk& operator=(const Desk&) = delete;
};

void Click(platform::Button& button);
void Click(platform::ImageButton& button);
void Click(platform::CheckBox& box);
void Choose(platform::ListBox& list, int index);
void Choose(platform::ComboBox& box, int index);       // the entry beside the chosen one
void DoubleClick(platform::ListBox& list, int index);  // the second click follows at once
void PressKey(platform::ListBox& list, int keyCode);
void UseCloseBox(platform::Window& window);

// Happens when the program handles its pending events, or in an event loop.
void QueueEvent(std::function<void()> event);

// What the user does in front of the next modal window. It has to close the window.
void QueueModal(std::function<void()> script);

// The button that is pressed in the next message box.
void QueueAnswer(platform::Answer answer);

// Lets these timers tick until the condition holds; false when it does not come true in time.
bool WaitUntil(const std::function<bool()>& condition, std::initializer_list<platform::Timer*> timers);

}  // namespace contract
