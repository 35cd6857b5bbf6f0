#include "platform/windows/system_library.h"

#include <string>
#include <string_view>

namespace platform {
namespace {

// With a backslash at its end; empty when it cannot be told.
std::wstring SystemDirectory() {
  std::wstring directory(MAX_PATH, L'\0');
  const UINT length = ::GetSystemDirectoryW(directory.data(), MAX_PATH);
  if (length == 0 || length >= MAX_PATH) return {};
  directory.resize(length);
  return directory + L'\\';
}

}  // namespace

// By its full path: Windows 7 refuses LOAD_LIBRARY_SEARCH_SYSTEM32 until one of its updates.
HMODULE SystemLibrary(const char* library) {
  static const std::wstring directory = SystemDirectory();
  if (directory.empty()) return nullptr;
  const std::string_view name = library;
  const std::wstring path = directory + std::wstring(name.begin(), name.end());
  return ::LoadLibraryExW(path.c_str(), nullptr, LOAD_WITH_ALTERED_SEARCH_PATH);
}

}  // namespace platform
