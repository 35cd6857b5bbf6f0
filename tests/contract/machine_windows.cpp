#include <windows.h>

// After it, as it needs its types.
#include <shellapi.h>

#include <cstdlib>

#include "tests/contract/machine.h"

namespace contract {
namespace {

constexpr DWORD Limit = 60'000;  // milliseconds that a stand-in lives on, and that a test waits for its turn

// The stand-in is this very test program. Its first argument is an inherited event, as a number.
bool PlayStandIn() {
  const string commandLine = ::GetCommandLineA(), mark = " --stand-in=";
  const std::size_t place = commandLine.find(mark);
  if (place == string::npos) return false;
  const auto event = std::strtoull(commandLine.c_str() + place + mark.size(), nullptr, 10);
  if (::WaitForSingleObject(reinterpret_cast<HANDLE>(event), Limit) != WAIT_OBJECT_0) ::ExitProcess(1);
  Put("here.txt", std::to_string(::GetPriorityClass(::GetCurrentProcess())) + " " + commandLine);
  ::ExitProcess(0);
}
const bool standIn = PlayStandIn();  // before any test

SECURITY_ATTRIBUTES inherited{sizeof inherited, nullptr, TRUE};
const HANDLE endSignal = ::CreateEventA(&inherited, TRUE, FALSE, nullptr);

// One test program at a time has the screen: another would take the keyboard away.
const HANDLE turn = ::CreateMutexA(nullptr, FALSE, "Tolvaris contract tests");

string MakeDirectory() {
  char temporary[MAX_PATH] = "", path[MAX_PATH] = "";
  ::GetTempPathA(MAX_PATH, temporary);
  ::GetLongPathNameA(temporary, path, MAX_PATH);
  ::lstrcatA(path, ("tolvaris-" + std::to_string(::GetCurrentProcessId())).c_str());
  ::CreateDirectoryA(path, nullptr);
  return path + string("\\");
}

}  // namespace

Machine::Machine() : here_(MakeDirectory()) {
  ::WaitForSingleObject(turn, Limit);
  ::RegDeleteTreeA(HKEY_CURRENT_USER, Key);  // of a run that was ended
}

Machine::~Machine() {
  TellStandInToEnd();
  ::RegDeleteTreeA(HKEY_CURRENT_USER, Key);
  ::ReleaseMutex(turn);
  const string paths = here_.substr(0, here_.size() - 1) + Zero;  // a list that ends with an empty path
  constexpr FILEOP_FLAGS silently = FOF_SILENT | FOF_NOCONFIRMATION | FOF_NOERRORUI;
  SHFILEOPSTRUCTA removal{nullptr, FO_DELETE, paths.c_str(), nullptr, silently, FALSE, nullptr, nullptr};
  EXPECT_EQ(::SHFileOperationA(&removal), 0) << here_;
}

void SetAttributes(const string& path, std::uint32_t attributes) { ::SetFileAttributesA(path.c_str(), attributes); }
void SetEnvironment(const string& name, const string& value) { ::SetEnvironmentVariableA(name.c_str(), value.c_str()); }
bool IsWine() { return ::GetProcAddress(::GetModuleHandleA("ntdll.dll"), "wine_get_version") != nullptr; }

string StandIn() {
  char program[MAX_PATH] = "";
  ::GetModuleFileNameA(nullptr, program, MAX_PATH);
  ::ResetEvent(endSignal);
  return program + (" --stand-in=" + std::to_string(reinterpret_cast<std::uintptr_t>(endSignal)));
}

void TellStandInToEnd() { ::SetEvent(endSignal); }

}  // namespace contract
