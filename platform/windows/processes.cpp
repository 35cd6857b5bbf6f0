#include "platform/processes.h"

#include <windows.h>

#include <utility>

namespace platform {
namespace {

void Release(std::intptr_t handle) {
  if (handle != 0) ::CloseHandle(reinterpret_cast<HANDLE>(handle));
}

}  // namespace

Process::Process(Process&& other) noexcept
    : process_(std::exchange(other.process_, 0)), thread_(std::exchange(other.thread_, 0)) {}

Process& Process::operator=(Process&& other) noexcept {
  std::swap(process_, other.process_);
  std::swap(thread_, other.thread_);
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
  if ((commandLine + directory).find('\0') != std::string::npos) return process;  // another program, another place
  std::string writable = commandLine;                                             // Windows may write into it
  STARTUPINFOA start{};
  start.cb = sizeof start;
  PROCESS_INFORMATION started{};
  if (::CreateProcessA(nullptr, writable.data(), nullptr, nullptr, TRUE, creationFlags, nullptr,
                       directory.empty() ? nullptr : directory.c_str(), &start, &started)) {
    process.process_ = reinterpret_cast<std::intptr_t>(started.hProcess);
    process.thread_ = reinterpret_cast<std::intptr_t>(started.hThread);
  }
  return process;
}

}  // namespace platform
