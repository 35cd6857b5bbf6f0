#include <windows.h>

#include <cstdlib>

#include "platform/files.h"
#include "tests/contract/machine.h"

namespace contract {
namespace {

constexpr DWORD Limit = 60'000;  // milliseconds that a stand-in which nobody tells to end lives on

bool IsWine() { return ::GetProcAddress(::GetModuleHandleA("ntdll.dll"), "wine_get_version") != nullptr; }

std::string OwnFile() {
  char path[MAX_PATH] = "";
  ::GetModuleFileNameA(nullptr, path, MAX_PATH);
  return path;
}

// The stand-in is this very test program. Its first argument is an inherited event, as a number.
bool PlayStandIn() {
  const std::string commandLine = ::GetCommandLineA();
  const std::string mark = " --stand-in=";
  const std::size_t place = commandLine.find(mark);
  if (place == std::string::npos) return false;
  const auto event = std::strtoull(commandLine.c_str() + place + mark.size(), nullptr, 10);
  if (::WaitForSingleObject(reinterpret_cast<HANDLE>(event), Limit) != WAIT_OBJECT_0) ::ExitProcess(1);
  platform::File("here.txt", platform::Access::ReplaceContent)
      .Write(0, std::to_string(::GetPriorityClass(::GetCurrentProcess())) + " " + commandLine);
  ::ExitProcess(0);
}
const bool standIn = PlayStandIn();  // before any test

void RemoveContents(const std::string& directory) {
  WIN32_FIND_DATAA data;
  const HANDLE find = ::FindFirstFileA((directory + "*").c_str(), &data);
  for (BOOL more = find != INVALID_HANDLE_VALUE; more; more = ::FindNextFileA(find, &data)) {
    const std::string name = data.cFileName, path = directory + name;
    if (name == "." || name == "..") continue;
    ::SetFileAttributesA(path.c_str(), FILE_ATTRIBUTE_NORMAL);
    if (data.dwFileAttributes & FILE_ATTRIBUTE_DIRECTORY) {
      RemoveContents(path + "\\");
      ::RemoveDirectoryA(path.c_str());
    } else {
      ::DeleteFileA(path.c_str());
    }
  }
  if (find != INVALID_HANDLE_VALUE) ::FindClose(find);
}

}  // namespace

FreshDirectory::FreshDirectory() {
  static int made = 0;
  char temporary[MAX_PATH] = "", longForm[MAX_PATH] = "";
  ::GetTempPathA(MAX_PATH, temporary);
  ::GetLongPathNameA(temporary, longForm, MAX_PATH);
  path_ = longForm + ("tolvaris-" + std::to_string(::GetCurrentProcessId()) + "-" + std::to_string(++made));
  ::CreateDirectoryA(path_.c_str(), nullptr);
  path_ += "\\";
}

FreshDirectory::~FreshDirectory() {
  RemoveContents(path_);
  ::RemoveDirectoryA(path_.c_str());
}

FreshKey::FreshKey() : path_("Software\\Tolvaris test " + std::to_string(::GetCurrentProcessId())) {
  ::RegDeleteTreeA(HKEY_CURRENT_USER, path_.c_str());
  HKEY key = nullptr;
  ::RegCreateKeyA(HKEY_CURRENT_USER, path_.c_str(), &key);
  ::RegCloseKey(key);
}

FreshKey::~FreshKey() { ::RegDeleteTreeA(HKEY_CURRENT_USER, path_.c_str()); }

void SetAttributes(const std::string& path, std::uint32_t attributes) {
  ::SetFileAttributesA(path.c_str(), attributes);
}

bool ProtectsReadOnlyFiles() { return !IsWine(); }

bool StartsWithPriority() { return !IsWine(); }

void SetEnvironment(const std::string& name, const std::string& value) {
  ::SetEnvironmentVariableA(name.c_str(), value.c_str());
}

StandIn::StandIn() {
  SECURITY_ATTRIBUTES inherited{sizeof inherited, nullptr, TRUE};
  signal_ = reinterpret_cast<std::intptr_t>(::CreateEventA(&inherited, TRUE, FALSE, nullptr));
  commandLine_ = OwnFile() + " --stand-in=" + std::to_string(signal_);
}

StandIn::~StandIn() {
  TellToEnd();
  ::CloseHandle(reinterpret_cast<HANDLE>(signal_));
}

void StandIn::TellToEnd() { ::SetEvent(reinterpret_cast<HANDLE>(signal_)); }

}  // namespace contract
