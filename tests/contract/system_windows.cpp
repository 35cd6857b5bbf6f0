// What older Windows lacks.
#include <gtest/gtest.h>
#include <windows.h>

#include "platform/windows/system_library.h"
#include "tests/contract/replaced_import.h"

extern void* importOfLoadLibraryExA asm("__imp_LoadLibraryExA");
extern void* importOfLoadLibraryExW asm("__imp_LoadLibraryExW");

// Such addresses may be written only while somebody says so.
void contract::ReplacedImport::Set(void* function) {
  DWORD protection = 0;
  ::VirtualProtect(&import_, sizeof import_, PAGE_READWRITE, &protection);
  import_ = function;
  ::VirtualProtect(&import_, sizeof import_, protection, &protection);
}

namespace {

using contract::ReplacedImport;
using platform::SystemFunction;

bool KnownToWindows7(DWORD flags) {
  constexpr DWORD known = DONT_RESOLVE_DLL_REFERENCES | LOAD_LIBRARY_AS_DATAFILE | LOAD_WITH_ALTERED_SEARCH_PATH |
                          LOAD_IGNORE_CODE_AUTHZ_LEVEL | LOAD_LIBRARY_AS_IMAGE_RESOURCE |
                          LOAD_LIBRARY_AS_DATAFILE_EXCLUSIVE;
  if ((flags & ~known) != 0) ::SetLastError(ERROR_INVALID_PARAMETER);
  return (flags & ~known) == 0;
}

HMODULE WINAPI LoadAsWindows7(LPCSTR name, HANDLE, DWORD flags) {
  return KnownToWindows7(flags) ? ::LoadLibraryA(name) : nullptr;
}

HMODULE WINAPI LoadAsWindows7Wide(LPCWSTR name, HANDLE, DWORD flags) {
  return KnownToWindows7(flags) ? ::LoadLibraryW(name) : nullptr;
}

TEST(SystemLibraries, AreLoadedAlsoByWindows7WithoutItsLaterUpdates) {
  const ReplacedImport ansi(importOfLoadLibraryExA, LoadAsWindows7), wide(importOfLoadLibraryExW, LoadAsWindows7Wide);
  EXPECT_NE(SystemFunction<void()>("comdlg32.dll", "GetSaveFileNameA"), nullptr);
  EXPECT_NE(SystemFunction<void()>("ole32.dll", "CoCreateInstance"), nullptr);
  EXPECT_EQ(SystemFunction<void()>("comdlg32.dll", "NoSuchFunction"), nullptr);
  EXPECT_EQ(SystemFunction<void()>("nosuch.dll", "GetSaveFileNameA"), nullptr);
}

}  // namespace
