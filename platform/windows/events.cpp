#include "platform/events.h"

#include <utility>

#include "platform/windows/events.h"
#include "platform/windows/window.h"

namespace platform {
namespace {

bool pendingEventsRun = false;  // in a call that is under way, and in no event loop that was begun since

// Also a look at the queue, by which Windows sees that the program lives, and lets other programs' questions in.
void DrawWindows() {
  for (const WindowState* window : AllWindows()) {
    if (window->Handle == nullptr) continue;
    ::RedrawWindow(window->Handle, nullptr, nullptr, RDW_UPDATENOW | RDW_ALLCHILDREN);
  }
  MSG event;
  ::PeekMessageA(&event, nullptr, 0, 0, PM_NOREMOVE);
}

bool MainWindowIsOpen() { return !AllWindows().empty() && AllWindows().front()->Handle != nullptr; }

}  // namespace

void HandleEvent(MSG& event) {
  const HWND root = event.hwnd != nullptr ? ::GetAncestor(event.hwnd, GA_ROOT) : nullptr;
  if (FindWindowState(root) != nullptr && ::IsDialogMessageA(root, &event)) return;
  ::TranslateMessage(&event);
  ::DispatchMessageA(&event);
}

OwnEventLoop::OwnEventLoop() : outer_(std::exchange(pendingEventsRun, false)) {}

OwnEventLoop::~OwnEventLoop() { pendingEventsRun = outer_; }

// A window that is closed while events are handled, however deep, shows in its state alone: the message that asks a
// thread to quit would reach only the innermost pump.
void RunPendingEvents() {
  if (pendingEventsRun) return DrawWindows();
  pendingEventsRun = true;
  MSG event;
  while (::PeekMessageA(&event, nullptr, 0, 0, PM_REMOVE)) HandleEvent(event);
  pendingEventsRun = false;
}

void RunPendingEventsAtIntervals() {
  constexpr ULONGLONG interval = 10;  // milliseconds
  static ULONGLONG last = 0;
  if (::GetTickCount64() - last < interval) return;
  RunPendingEvents();
  last = ::GetTickCount64();
}

void RunEventLoop() {
  const OwnEventLoop loop;
  MSG event;
  while (MainWindowIsOpen() && ::GetMessageA(&event, nullptr, 0, 0) > 0) HandleEvent(event);
}

void Sleep(std::uint32_t milliseconds) { ::Sleep(milliseconds); }

}  // namespace platform
