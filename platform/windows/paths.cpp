#include "platform/windows/paths.h"

#include <windows.h>

namespace platform {
namespace {

// Of the thread and not of the process, as started programs would inherit the latter.
bool StopAskingForDisks() { return ::SetThreadErrorMode(SEM_FAILCRITICALERRORS, nullptr) != 0; }

}  // namespace

const char* WindowsPath(const std::string& path) {
  thread_local const bool stopped = StopAskingForDisks();
  static_cast<void>(stopped);
  return path.find('\0') == std::string::npos ? path.c_str() : "";
}

}  // namespace platform
