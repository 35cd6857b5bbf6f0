#include <windows.h>

#include <chrono>
#include <deque>
#include <utility>

#include "platform/events.h"
#include "platform/windows/state.h"
#include "tests/contract/hand.h"

namespace contract {
namespace {

constexpr UINT RunEvent = WM_APP;

std::deque<std::function<void()>> events;
std::deque<platform::Answer> answers;

// Receives the queued events through the thread's own message queue.
LRESULT CALLBACK EventProcedure(HWND handle, UINT message, WPARAM wParam, LPARAM lParam) {
  if (message != RunEvent || events.empty()) return ::DefWindowProcA(handle, message, wParam, lParam);
  const std::function<void()> event = std::move(events.front());
  events.pop_front();
  event();
  return 0;
}

HWND EventWindow() {
  static const HWND window = [] {
    const HWND made =
        ::CreateWindowExA(0, "STATIC", "", 0, 0, 0, 0, 0, HWND_MESSAGE, nullptr, ::GetModuleHandleA(nullptr), nullptr);
    ::SetWindowLongPtrA(made, GWLP_WNDPROC, reinterpret_cast<LONG_PTR>(EventProcedure));
    return made;
  }();
  return window;
}

int ButtonOf(platform::Answer answer) {
  switch (answer) {
    case platform::Answer::Ok:
      return IDOK;
    case platform::Answer::Retry:
      return IDRETRY;
    case platform::Answer::Yes:
      return IDYES;
    case platform::Answer::No:
      return IDNO;
    default:
      return IDCANCEL;
  }
}

// Presses a button of each message box as soon as it is up.
LRESULT CALLBACK AnswerBoxes(int code, WPARAM wParam, LPARAM lParam) {
  char name[32] = "";
  const auto window = reinterpret_cast<HWND>(wParam);
  if (code == HCBT_ACTIVATE && !answers.empty() && ::GetClassNameA(window, name, sizeof name) != 0 &&
      ::lstrcmpA(name, "#32770") == 0) {
    ::PostMessageA(window, WM_COMMAND, static_cast<WPARAM>(ButtonOf(answers.front())), 0);
    answers.pop_front();
  }
  return ::CallNextHookEx(nullptr, code, wParam, lParam);
}

bool IsReachable(HWND window) { return ::IsWindowVisible(window) && ::IsWindowEnabled(window); }

// Presses the mouse in the middle of an area of the control, as Windows routes it: to the control, or to what lies
// there in its place.
void PressMouse(HWND control, RECT area, UINT press) {
  const HWND window = ::GetAncestor(control, GA_ROOT);
  if (!IsReachable(window)) return;
  POINT point = {(area.left + area.right) / 2, (area.top + area.bottom) / 2};
  ::MapWindowPoints(control, window, &point, 1);
  const HWND target =
      ::ChildWindowFromPointEx(window, point, CWP_SKIPDISABLED | CWP_SKIPINVISIBLE | CWP_SKIPTRANSPARENT);
  if (target == nullptr) return;
  ::MapWindowPoints(window, target, &point, 1);
  const LPARAM place = MAKELPARAM(point.x, point.y);
  ::PostMessageA(target, press, MK_LBUTTON, place);
  ::PostMessageA(target, WM_LBUTTONUP, 0, place);
  platform::RunPendingEvents();
}

void PressMouse(const platform::Control& control) {
  RECT area = {};
  ::GetClientRect(control.State().Handle, &area);
  PressMouse(control.State().Handle, area, WM_LBUTTONDOWN);
}

void PressMouseOn(const platform::ListBox& list, int index, UINT press) {
  const HWND handle = list.State().Handle;
  RECT area = {};
  if (::SendMessageA(handle, LB_GETITEMRECT, static_cast<WPARAM>(index), reinterpret_cast<LPARAM>(&area)) == LB_ERR) {
    return;
  }
  PressMouse(handle, area, press);
}

void Press(HWND control, int keyCode) {
  if (!IsReachable(control) || !IsReachable(::GetAncestor(control, GA_ROOT))) return;
  ::PostMessageA(control, WM_KEYDOWN, static_cast<WPARAM>(keyCode), 1);
  ::PostMessageA(control, WM_KEYUP, static_cast<WPARAM>(keyCode), static_cast<LPARAM>(0xC0000001));
  platform::RunPendingEvents();
}

HHOOK hook = nullptr;
HANDLE turn = nullptr;  // one test program at a time has the screen: another would take the keyboard away

}  // namespace

Desk::Desk() {
  turn = ::CreateMutexA(nullptr, FALSE, "Tolvaris contract tests");
  ::WaitForSingleObject(turn, 60'000);
  hook = ::SetWindowsHookExA(WH_CBT, AnswerBoxes, nullptr, ::GetCurrentThreadId());
}

Desk::~Desk() {
  ::UnhookWindowsHookEx(hook);
  events.clear();
  answers.clear();
  platform::RunPendingEvents();
  ::ReleaseMutex(turn);
  ::CloseHandle(turn);
}

void Click(platform::Button& button) { PressMouse(button); }
void Click(platform::ImageButton& button) { PressMouse(button); }
void Click(platform::CheckBox& box) { PressMouse(box); }
void Choose(platform::ListBox& list, int index) { PressMouseOn(list, index, WM_LBUTTONDOWN); }

void Choose(platform::ComboBox& box, int index) { Press(box.State().Handle, index > box.Selected() ? VK_DOWN : VK_UP); }

void DoubleClick(platform::ListBox& list, int index) {
  PressMouseOn(list, index, WM_LBUTTONDOWN);
  PressMouseOn(list, index, WM_LBUTTONDBLCLK);
}

void PressKey(platform::ListBox& list, int keyCode) { Press(list.State().Handle, keyCode); }

void UseCloseBox(platform::Window& window) {
  ::PostMessageA(window.State().Handle, WM_CLOSE, 0, 0);  // what the close box sends in the end
  platform::RunPendingEvents();
}

void QueueEvent(std::function<void()> event) {
  events.push_back(std::move(event));
  ::PostMessageA(EventWindow(), RunEvent, 0, 0);
}

void QueueModal(std::function<void()> script) { QueueEvent(std::move(script)); }

void QueueAnswer(platform::Answer answer) { answers.push_back(answer); }

bool WaitUntil(const std::function<bool()>& condition, std::initializer_list<platform::Timer*>) {
  using Clock = std::chrono::steady_clock;
  const auto end = Clock::now() + std::chrono::seconds(10);
  while (!condition() && Clock::now() < end) {
    ::MsgWaitForMultipleObjects(0, nullptr, FALSE, 100, QS_ALLINPUT);
    platform::RunPendingEvents();
  }
  return condition();
}

}  // namespace contract
