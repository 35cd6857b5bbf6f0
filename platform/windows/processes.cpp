#include "platform/processes.h"

// clang-format off
#include <windows.h>
#include <shellapi.h>
// clang-format on

#include <utility>

#include "platform/windows/com.h"
#include "platform/windows/events.h"
#include "platform/windows/system_library.h"

namespace platform {
namespace {

constexpr DWORD ElevationRequired = 740;  // ERROR_ELEVATION_REQUIRED, which some headers lack

void Release(std::intptr_t handle) {
  if (handle != 0) ::CloseHandle(reinterpret_cast<HANDLE>(handle));
}

bool HasNul(const std::string& text) { return text.find('\0') != std::string::npos; }

}  // namespace

Process::Process(Process&& other) noexcept
    : process_(std::exchange(other.process_, 0)),
      thread_(std::exchange(other.thread_, 0)),
      needsElevation_(other.needsElevation_) {}

Process& Process::operator=(Process&& other) noexcept {
  std::swap(process_, other.process_);
  std::swap(thread_, other.thread_);
  needsElevation_ = other.needsElevation_;
  return *this;
}

Process::~Process() {
  Release(thread_);
  Release(process_);
}

// Anything but "not yet" counts as the end: a wait that fails would fail for ever.
bool Process::WaitForEnd(std::uint32_t milliseconds) const {
  return !Started() || ::WaitForSingleObject(reinterpret_cast<HANDLE>(process_), milliseconds) != WAIT_TIMEOUT;
}

Process CreateProcessA(const std::string& commandLine, std::uint32_t creationFlags, const std::string& directory) {
  Process process;
  if (HasNul(commandLine + directory)) return process;  // another program, another place
  std::string writable = commandLine;                   // Windows may write into it
  STARTUPINFOA start{};
  start.cb = sizeof start;
  PROCESS_INFORMATION started{};
  if (::CreateProcessA(nullptr, writable.data(), nullptr, nullptr, TRUE, creationFlags, nullptr,
                       directory.empty() ? nullptr : directory.c_str(), &start, &started)) {
    process.process_ = reinterpret_cast<std::intptr_t>(started.hProcess);
    process.thread_ = reinterpret_cast<std::intptr_t>(started.hThread);
  } else {
    process.needsElevation_ = ::GetLastError() == ElevationRequired;
  }
  return process;
}

// The shell may need COM. The question to the person belongs to the active window; without one it would wait in the
// taskbar.
Process ShellExecuteExA(const std::string& verb, const std::string& file, const std::string& parameters,
                        const std::string& directory) {
  Process process;
  const auto execute = SystemFunction<BOOL WINAPI(SHELLEXECUTEINFOA*)>("shell32.dll", "ShellExecuteExA");
  if (!PrepareCom() || execute == nullptr || HasNul(verb + file + parameters + directory)) return process;
  SHELLEXECUTEINFOA request{};
  request.cbSize = sizeof request;
  request.fMask = SEE_MASK_NOCLOSEPROCESS | SEE_MASK_NOASYNC | SEE_MASK_FLAG_NO_UI;
  request.hwnd = ::GetActiveWindow();
  request.lpVerb = verb.c_str();
  request.lpFile = file.c_str();
  request.lpParameters = parameters.c_str();
  request.lpDirectory = directory.empty() ? nullptr : directory.c_str();
  request.nShow = SW_SHOWNORMAL;
  const OwnEventLoop loop;
  if (execute(&request)) process.process_ = reinterpret_cast<std::intptr_t>(request.hProcess);
  return process;
}

}  // namespace platform
