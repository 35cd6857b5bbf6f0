#include <windows.h>

#include <cstdlib>
#include <deque>

#include "platform/windows/control.h"
#include "tests/contract/hand.h"

namespace contract {

// In the test program's own directory, where the last test's files are left; with the mouse's pointer over no window of
// a test, wherever it was left: what it is over is told so, and drawn another way.
Machine::Machine() : here_(ProgramDirectory() + "\\Pasta de teste\\") {
  ::SetCursorPos(0, 0);
  std::system(("rmdir /s /q \"" + here_.substr(0, here_.size() - 1) + "\"").c_str());
  EXPECT_TRUE(CreateDirectoryA(here_));
}

Machine::~Machine() { ::RegDeleteTreeA(HKEY_CURRENT_USER, Key); }

void SetAttributes(const string& path, std::uint32_t attributes) { ::SetFileAttributesA(path.c_str(), attributes); }

void SetAge(const string& path, unsigned seconds) {
  FILETIME now = {};
  ::GetSystemTimeAsFileTime(&now);
  const ULONGLONG then = (ULONGLONG{now.dwHighDateTime} << 32 | now.dwLowDateTime) - seconds * 10'000'000ULL;
  const FILETIME changed = {static_cast<DWORD>(then), static_cast<DWORD>(then >> 32)};
  const HANDLE file =
      ::CreateFileA(path.c_str(), FILE_WRITE_ATTRIBUTES, FILE_SHARE_READ, nullptr, OPEN_EXISTING, 0, nullptr);
  EXPECT_TRUE(::SetFileTime(file, nullptr, nullptr, &changed)) << path;
  ::CloseHandle(file);
}

void SetEnvironment(const string& name, const string& value) { ::SetEnvironmentVariableA(name.c_str(), value.c_str()); }
bool IsWine() { return ::GetProcAddress(::GetModuleHandleA("ntdll.dll"), "wine_get_version") != nullptr; }

// This very test program, told to run no test and to write down so.
string StandIn() {
  char program[MAX_PATH] = "";
  ::GetModuleFileNameA(nullptr, program, MAX_PATH);
  return program + string(" --gtest_filter=-* --gtest_output=xml:here");
}

namespace {

// Presses the mouse in the middle of the control, or of an entry of it, if the user can reach the control.
void Press(const Control& control, int entry = -1) {
  const HWND handle = control.State().Handle;
  for (const HWND window : {handle, ::GetAncestor(handle, GA_ROOT)}) {
    if (!::IsWindowVisible(window) || !::IsWindowEnabled(window)) return;
  }
  RECT area = {};
  ::GetClientRect(handle, &area);
  if (entry >= 0) ::SendMessageA(handle, LB_GETITEMRECT, static_cast<WPARAM>(entry), reinterpret_cast<LPARAM>(&area));
  const LPARAM place = MAKELPARAM((area.left + area.right) / 2, (area.top + area.bottom) / 2);
  ::PostMessageA(handle, WM_LBUTTONDOWN, MK_LBUTTON, place);
  ::PostMessageA(handle, WM_LBUTTONUP, 0, place);
  RunPendingEvents();
}

}  // namespace

void Click(Button& button) { Press(button); }
void Click(ImageButton& button) { Press(button); }
void Click(CheckBox& box) { Press(box); }
void Choose(ListBox& list, int index) { Press(list, index); }
void HoldKey(ListBox& list, int keyCode, int repeats) {
  const HWND handle = list.State().Handle;
  const auto key = static_cast<WPARAM>(keyCode);
  for (int i = 0; i <= repeats; ++i) ::PostMessageA(handle, WM_KEYDOWN, key, MAKELPARAM(1, i > 0 ? KF_REPEAT : 0));
  ::PostMessageA(handle, WM_KEYUP, key, MAKELPARAM(1, KF_UP | KF_REPEAT));
  RunPendingEvents();
}
void UseCloseBox(Window& window) { ::SendMessageA(window.State().Handle, WM_CLOSE, 0, 0); }

// Sent to a window of their own through the thread's message queue.
void QueueEvent(std::function<void()> event) {
  static std::deque<std::function<void()>> events;
  static const HWND window = ::CreateWindowExA(0, "STATIC", "", 0, 0, 0, 0, 0, HWND_MESSAGE, nullptr, nullptr, nullptr);
  const WNDPROC run = [](HWND handle, UINT message, WPARAM wParam, LPARAM lParam) -> LRESULT {
    if (message != WM_APP || events.empty()) return ::DefWindowProcA(handle, message, wParam, lParam);
    const std::function<void()> next = std::move(events.front());
    events.pop_front();
    next();
    return 0;
  };
  ::SetWindowLongPtrA(window, GWLP_WNDPROC, reinterpret_cast<LONG_PTR>(run));
  events.push_back(std::move(event));
  ::PostMessageA(window, WM_APP, 0, 0);
}

void QueueModal(std::function<void()> script) { QueueEvent(std::move(script)); }

}  // namespace contract
