// Sees the windows of other programs come, and closes them.
//
// Each line of its input names a window: its title, a tab, and the number of entries that its list must hold (0: it has
// none). Once it stands the answer is "stands"; after another line of input the window is closed, and the answer is
// "closed" when its program has ended. A window stands when it is visible and its program answers a message.
#include <windows.h>

#include <cstdlib>
#include <iostream>
#include <string>

#include "benchmarks/median.h"

namespace {

using namespace benchmarks;

constexpr double Limit = 30000;     // milliseconds
constexpr DWORD PauseOfSearch = 4;  // the search asks the same server as the program that starts

struct Wanted {
  std::string Title;
  int Entries;
};

struct Search {
  const Wanted& For;
  HWND Found;
};

// A program answers once it has shown and painted its window and waits for its user.
bool Answers(HWND window) {
  DWORD_PTR answer = 0;
  return ::SendMessageTimeoutA(window, WM_NULL, 0, 0, SMTO_NORMAL, static_cast<UINT>(Limit), &answer) != 0;
}

bool ListStands(HWND window, int entries) {
  if (entries == 0) return true;
  const HWND list = ::FindWindowExA(window, nullptr, "LISTBOX", nullptr);
  return list != nullptr && ::SendMessageA(list, LB_GETCOUNT, 0, 0) == entries;
}

BOOL CALLBACK LookAt(HWND window, LPARAM parameter) {
  auto& search = *reinterpret_cast<Search*>(parameter);
  if (!::IsWindowVisible(window)) return TRUE;
  char title[64] = "";
  ::GetWindowTextA(window, title, sizeof title);
  if (title != search.For.Title || !Answers(window) || !ListStands(window, search.For.Entries)) return TRUE;
  search.Found = window;
  return FALSE;
}

HWND WaitForWindow(const Wanted& wanted) {
  const Stopwatch watch;
  Search search{wanted, nullptr};
  while (watch.Milliseconds() < Limit) {
    ::EnumWindows(LookAt, reinterpret_cast<LPARAM>(&search));
    if (search.Found != nullptr) break;
    ::Sleep(PauseOfSearch);
  }
  return search.Found;
}

bool Close(HWND window) {
  DWORD id = 0;
  ::GetWindowThreadProcessId(window, &id);
  const HANDLE process = ::OpenProcess(SYNCHRONIZE, FALSE, id);
  ::PostMessageA(window, WM_CLOSE, 0, 0);
  const bool ended = ::WaitForSingleObject(process, static_cast<DWORD>(Limit)) == WAIT_OBJECT_0;
  ::CloseHandle(process);
  return ended;
}

}  // namespace

int main() {
  for (std::string line; std::getline(std::cin, line);) {
    const std::size_t tab = line.find('\t');
    if (tab == std::string::npos) return 2;
    const HWND window = WaitForWindow({line.substr(0, tab), std::atoi(line.c_str() + tab)});
    if (window == nullptr) return 1;
    std::cout << "stands" << std::endl;
    std::getline(std::cin, line);
    if (!Close(window)) return 1;
    std::cout << "closed" << std::endl;
  }
  return 0;
}
