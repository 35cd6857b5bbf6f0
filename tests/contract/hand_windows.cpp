#include <windows.h>

#include <deque>

#include "platform/events.h"
#include "platform/windows/state.h"
#include "tests/contract/hand.h"

namespace contract {
namespace {

std::deque<std::function<void()>> events;

// Receives the queued events through the thread's own message queue.
LRESULT CALLBACK EventProcedure(HWND handle, UINT message, WPARAM wParam, LPARAM lParam) {
  if (message != WM_APP || events.empty()) return ::DefWindowProcA(handle, message, wParam, lParam);
  const std::function<void()> event = std::move(events.front());
  events.pop_front();
  event();
  return 0;
}

// Presses a key or the mouse and lets go, if the user can reach the control.
void Press(const Control& control, UINT down, WPARAM what, LPARAM place) {
  const HWND handle = control.State().Handle;
  const bool key = down == WM_KEYDOWN;
  for (const HWND window : {handle, ::GetAncestor(handle, GA_ROOT)}) {
    if (!::IsWindowVisible(window) || !::IsWindowEnabled(window)) return;
  }
  ::PostMessageA(handle, down, what, key ? 1 : place);
  ::PostMessageA(handle, key ? WM_KEYUP : WM_LBUTTONUP, what, key ? static_cast<LPARAM>(0xC0000001) : place);
  RunPendingEvents();
}

// In the middle of the control, or of an entry of it.
void PressMouse(const Control& control, int entry = -1, UINT down = WM_LBUTTONDOWN) {
  const HWND handle = control.State().Handle;
  RECT area = {};
  ::GetClientRect(handle, &area);
  if (entry >= 0) ::SendMessageA(handle, LB_GETITEMRECT, static_cast<WPARAM>(entry), reinterpret_cast<LPARAM>(&area));
  Press(control, down, MK_LBUTTON, MAKELPARAM((area.left + area.right) / 2, (area.top + area.bottom) / 2));
}

}  // namespace

void Click(Button& button) { PressMouse(button); }
void Click(ImageButton& button) { PressMouse(button); }
void Click(CheckBox& box) { PressMouse(box); }
void Choose(ListBox& list, int index) { PressMouse(list, index); }
void Choose(ComboBox& box, int index) { Press(box, WM_KEYDOWN, index > box.Selected() ? VK_DOWN : VK_UP, 0); }
void DoubleClick(ListBox& list, int index) { PressMouse(list, index), PressMouse(list, index, WM_LBUTTONDBLCLK); }
void PressKey(ListBox& list, int keyCode) { Press(list, WM_KEYDOWN, static_cast<WPARAM>(keyCode), 0); }
void UseCloseBox(Window& window) {
  ::PostMessageA(window.State().Handle, WM_CLOSE, 0, 0);  // what the close box sends in the end
  RunPendingEvents();
}

void QueueEvent(std::function<void()> event) {
  static const HWND window = ::CreateWindowExA(0, "STATIC", "", 0, 0, 0, 0, 0, HWND_MESSAGE, nullptr, nullptr, nullptr);
  ::SetWindowLongPtrA(window, GWLP_WNDPROC, reinterpret_cast<LONG_PTR>(EventProcedure));
  events.push_back(std::move(event));
  ::PostMessageA(window, WM_APP, 0, 0);
}

void QueueModal(std::function<void()> script) { QueueEvent(std::move(script)); }

bool WaitUntil(const std::function<bool()>& condition, std::initializer_list<Timer*>) {
  for (const ULONGLONG end = ::GetTickCount64() + 10'000; !condition() && ::GetTickCount64() < end;) {
    ::MsgWaitForMultipleObjects(0, nullptr, FALSE, 100, QS_ALLINPUT);
    RunPendingEvents();
  }
  return condition();
}

}  // namespace contract
