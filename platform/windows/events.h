// Handling of events, and calling the program's handlers.
#pragma once

#include <windows.h>

namespace platform {

// While it lives events are handled by a loop of their own, whose handlers may let pending ones run.
class OwnEventLoop {
 public:
  OwnEventLoop();
  ~OwnEventLoop();
  OwnEventLoop(const OwnEventLoop&) = delete;
  OwnEventLoop& operator=(const OwnEventLoop&) = delete;

 private:
  const bool outer_;
};

// Handles one event, the keyboard's rules for a window with controls included.
void HandleEvent(MSG& event);

// Calls a handler of the program's logic. What it throws ends here.
template <typename Handler, typename... Arguments>
void Raise(const Handler& handler, Arguments... arguments) noexcept {
  try {
    const Handler kept = handler;  // it may be replaced while it runs
    if (kept) kept(arguments...);
  } catch (...) {
  }
}

}  // namespace platform
