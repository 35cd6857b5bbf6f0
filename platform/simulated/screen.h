// What the machine in memory knows of windows and controls.
#pragma once

#include <cstdint>
#include <functional>
#include <memory>
#include <string>
#include <vector>

#include "platform/controls.h"

namespace platform::simulated {

// Of a window; shared with its controls, which may live longer.
struct WindowFacts {
  Window* Self = nullptr;
  WindowStyle Style{};
  std::string Caption;
  int Left = 0, Top = 0, Width = 0, Height = 0;
  bool Enabled = true, Shown = false, Closing = false, Closed = false;
  std::int32_t Handle = 0;
  std::vector<Control*> Controls;  // in order of creation
  Control* Focus = nullptr;        // the one that last got the keyboard focus, usable or not
};

struct ListEntry {
  std::string Text, Key;  // the key as text_order.h makes it
};

// Whether the user can reach the window: shown, enabled, and not behind a modal one.
bool TakesInput(const WindowFacts& window);
bool TakesInput(const ControlState& control);

void CountDroppedException();

// While it lives, events run by RunPendingEvents, which then does not run any more, or by a loop of their own.
class EventLevel {
 public:
  explicit EventLevel(bool pendingEventsRun);
  ~EventLevel() { pendingEventsRun_ = outer_; }
  EventLevel(const EventLevel&) = delete;
  EventLevel& operator=(const EventLevel&) = delete;

 private:
  bool& pendingEventsRun_;  // the machine's
  const bool outer_;
};

// While it lives, only this window takes input; null: none of the program's.
class ModalTurn {
 public:
  explicit ModalTurn(const WindowFacts* window);
  ~ModalTurn();
  ModalTurn(const ModalTurn&) = delete;
  ModalTurn& operator=(const ModalTurn&) = delete;

 private:
  const EventLevel level_{false};
};

// Calls a handler as the window thread does: an exception ends here. The handler may replace itself meanwhile.
template <typename... Arguments>
void RunHandler(std::function<void(Arguments...)> handler, Arguments... arguments) {
  if (!handler) return;
  try {
    handler(arguments...);
  } catch (...) {
    CountDroppedException();
  }
}

}  // namespace platform::simulated

namespace platform {

struct WindowState {
  std::shared_ptr<simulated::WindowFacts> Facts;
};

// Of every kind of control; each uses its own part.
struct ControlState {
  Control* Self = nullptr;
  std::shared_ptr<simulated::WindowFacts> Window;
  Bounds Place{};
  std::string Caption, ToolTip, AccessibleName;
  bool Enabled = true, Visible = true;
  std::int32_t Handle = 0;

  std::vector<simulated::ListEntry> Entries;
  bool Sorted = false;
  int Selected = -1;
  int Value = 0;
  int Icon = 0;
  Font Letters{};
  bool WhiteGround = false;
  Picture Shown;
};

struct TimerState {
  std::shared_ptr<simulated::WindowFacts> Window;
  std::uint32_t Interval = 0;
  bool Enabled = false;
};

}  // namespace platform
