#include "platform/events.h"

#include <algorithm>
#include <utility>

#include "platform/windows/state.h"

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

std::vector<WindowState*>& AllWindows() {
  static std::vector<WindowState*> windows;
  return windows;
}

WindowState* FindWindowState(HWND handle) {
  const auto found = std::find_if(AllWindows().begin(), AllWindows().end(),
                                  [&](const WindowState* window) { return window->Handle == handle; });
  return handle != nullptr && found != AllWindows().end() ? *found : nullptr;
}

HWND OwnerForModal() {
  const HWND active = ::GetActiveWindow();
  if (FindWindowState(active) != nullptr && ::IsWindowVisible(active)) return active;
  HWND owner = nullptr;
  for (const WindowState* window : AllWindows()) {
    if (::IsWindowVisible(window->Handle) && ::IsWindowEnabled(window->Handle)) owner = window->Handle;
  }
  return owner;
}

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

void Window::ShowModal() {
  if (state_->Handle == nullptr) return;
  const HWND owner = OwnerForModal();
  ::SetWindowLongPtrA(state_->Handle, GWLP_HWNDPARENT, reinterpret_cast<LONG_PTR>(owner));
  for (const WindowState* other : AllWindows()) {
    if (other == state_.get() || !::IsWindowVisible(other->Handle) || !::IsWindowEnabled(other->Handle)) continue;
    ::EnableWindow(other->Handle, FALSE);
    state_->Disabled.push_back(other->Handle);
  }
  const OwnEventLoop loop;
  Show();
  MSG event;
  while (!IsClosed() && ::GetMessageA(&event, nullptr, 0, 0) > 0) HandleEvent(event);
  Close();
  if (::IsWindowEnabled(owner)) ::SetActiveWindow(owner);
}

void Sleep(std::uint32_t milliseconds) { ::Sleep(milliseconds); }

}  // namespace platform
