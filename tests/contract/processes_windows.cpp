// Starting what Windows gives to administrators alone.
#include <windows.h>

#include <utility>

#include "platform/processes.h"
#include "tests/contract/machine.h"

// NOLINTNEXTLINE(readability-identifier-naming): the linker has named it.
extern "C" decltype(&::CreateProcessA) __imp_CreateProcessA;  // where the program's calls of the function lead

namespace {

using namespace contract;

DWORD failure = 0;

BOOL WINAPI CreateProcessThatFails(LPCSTR, LPSTR, LPSECURITY_ATTRIBUTES, LPSECURITY_ATTRIBUTES, BOOL, DWORD, LPVOID,
                                   LPCSTR, LPSTARTUPINFOA, LPPROCESS_INFORMATION) {
  ::SetLastError(failure);
  return FALSE;
}

// Wine starts every program, whatever it asks for.
TEST(Elevation, IsToldApartFromOtherFailures) {
  DWORD access = 0;
  ::VirtualProtect(&__imp_CreateProcessA, sizeof __imp_CreateProcessA, PAGE_READWRITE, &access);
  const auto original = std::exchange(__imp_CreateProcessA, CreateProcessThatFails);
  for (const auto& [error, needed] :
       {std::pair<DWORD, bool>(740, true), {ERROR_BAD_EXE_FORMAT, false}, {ERROR_ACCESS_DENIED, false}}) {
    failure = error;
    const Process process = CreateProcessA("C:\\emu.exe", PriorityNormal, "");
    EXPECT_FALSE(process.Started());
    EXPECT_EQ(process.NeedsElevation(), needed) << error;
  }
  __imp_CreateProcessA = original;
}

}  // namespace
