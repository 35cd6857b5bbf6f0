#include "platform/events.h"

#include <algorithm>

#include "platform/windows/state.h"

namespace platform {
namespace {

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

// A window that is closed while events are handled, however deep, shows in its state alone: the message that asks a
// thread to quit would reach only the innermost pump.
void RunPendingEvents() {
  MSG event;
  while (::PeekMessageA(&event, nullptr, 0, 0, PM_REMOVE)) HandleEvent(event);
}

void RunPendingEventsAtIntervals() {
  constexpr ULONGLONG interval = 10;  // milliseconds
  static ULONGLONG last = 0;
  if (::GetTickCount64() - last < interval) return;
  RunPendingEvents();
  last = ::GetTickCount64();
}

void RunEventLoop() {
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
  Show();
  MSG event;
  while (!IsClosed() && ::GetMessageA(&event, nullptr, 0, 0) > 0) HandleEvent(event);
  Close();
  if (::IsWindowEnabled(owner)) ::SetActiveWindow(owner);
}

void Sleep(std::uint32_t milliseconds) { ::Sleep(milliseconds); }

int ScreenWidth() {
  const RECT area = WorkArea();
  return ToTwips(area.right - area.left, DpiOfScreen());
}

int ScreenHeight() {
  const RECT area = WorkArea();
  return ToTwips(area.bottom - area.top, DpiOfScreen());
}

}  // namespace platform
