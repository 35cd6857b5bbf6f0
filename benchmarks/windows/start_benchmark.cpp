// From the start of a program to its window: Tolvaris with a list of games, in turn with an empty window.
//   start_benchmark TOLVARIS EMPTY_WINDOW ENTRIES ROUNDS
// For each start it prints the program's title, a tab and the milliseconds, and waits for a line before it closes the
// window, so that the process can be looked at meanwhile.
#include <windows.h>

#include <cstdlib>
#include <string>

#include "benchmarks/median.h"

namespace {

using namespace benchmarks;

constexpr double Limit = 30000;     // milliseconds
constexpr DWORD PauseOfSearch = 4;  // the search asks the same server as the program that starts

struct Program {
  std::string Path, Title;
  int Entries;  // that its list must hold
};

struct Search {
  DWORD Process;
  const Program& Wanted;
  HWND Found;
};

bool ListStands(HWND window, int entries) {
  if (entries == 0) return true;
  const HWND list = ::FindWindowExA(window, nullptr, "LISTBOX", nullptr);
  return list != nullptr && ::SendMessageA(list, LB_GETCOUNT, 0, 0) == entries;
}

BOOL CALLBACK LookAt(HWND window, LPARAM parameter) {
  auto& search = *reinterpret_cast<Search*>(parameter);
  DWORD process = 0;
  ::GetWindowThreadProcessId(window, &process);
  if (process != search.Process || !::IsWindowVisible(window)) return TRUE;
  char title[64] = "";
  ::GetWindowTextA(window, title, sizeof title);
  if (title != search.Wanted.Title || !ListStands(window, search.Wanted.Entries)) return TRUE;
  search.Found = window;
  return FALSE;
}

HWND FindWindowOf(DWORD process, const Program& program) {
  Search search{process, program, nullptr};
  ::EnumWindows(LookAt, reinterpret_cast<LPARAM>(&search));
  return search.Found;
}

// The milliseconds until the window stands, or -1.
double Start(const Program& program) {
  std::string command = "\"" + program.Path + "\"";
  STARTUPINFOA start{};
  start.cb = sizeof start;
  PROCESS_INFORMATION process{};
  const Stopwatch watch;
  if (!::CreateProcessA(nullptr, command.data(), nullptr, nullptr, FALSE, 0, nullptr, nullptr, &start, &process)) {
    return -1;
  }
  HWND window = nullptr;
  while (!window && watch.Milliseconds() < Limit) {
    window = FindWindowOf(process.dwProcessId, program);
    if (!window) ::Sleep(PauseOfSearch);
  }
  const double milliseconds = window ? watch.Milliseconds() : -1;
  std::printf("%s\t%.3f\n", program.Title.c_str(), milliseconds);
  std::fflush(stdout);
  std::getchar();
  ::PostMessageA(window, WM_CLOSE, 0, 0);
  if (::WaitForSingleObject(process.hProcess, static_cast<DWORD>(Limit)) != WAIT_OBJECT_0) {
    ::TerminateProcess(process.hProcess, 1);
  }
  ::CloseHandle(process.hThread);
  ::CloseHandle(process.hProcess);
  return milliseconds;
}

}  // namespace

int main(int count, char** arguments) {
  if (count != 5) return 2;
  const Program programs[] = {{arguments[1], "Tolvaris", std::atoi(arguments[3])}, {arguments[2], "Empty window", 0}};
  for (int round = std::atoi(arguments[4]); round > 0; --round) {
    for (const Program& program : programs) {
      if (Start(program) < 0) return 1;
    }
  }
  return 0;
}
