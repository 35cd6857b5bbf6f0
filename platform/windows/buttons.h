// What stands behind buttons of every kind.
#pragma once

#include <windows.h>

#include <functional>

#include "platform/windows/control.h"
#include "platform/windows/icons.h"

namespace platform {

// Enter presses the button that has the keyboard; a key that is held down does so once.
struct ButtonState : ControlState {
  ButtonState() { EnterIsKey = true; }

  bool OnKey(int key, bool repeated) override;
  void LayOut() override;

  int IconId = 0;   // 0: it shows no icon
  IconHandle Icon;  // the native button draws it, but does not own it
};

// One that calls a handler. A second click that follows at once is a click like any other.
struct PushButtonState : ButtonState {
  explicit PushButtonState(const std::function<void()>& handler) : Handler(handler) {}

  void OnNotification(int code) override;

  const std::function<void()>& Handler;
};

}  // namespace platform
