// Starting what Windows gives to administrators alone.
#include <windows.h>

#include <utility>

#include "platform/processes.h"
#include "tests/contract/machine.h"
#include "tests/contract/replaced_import.h"

extern void* importOfCreateProcessA asm("__imp_CreateProcessA");

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
  const ReplacedImport refusing(importOfCreateProcessA, &CreateProcessThatFails);
  for (const auto& [error, needed] :
       {std::pair<DWORD, bool>(740, true), {ERROR_BAD_EXE_FORMAT, false}, {ERROR_ACCESS_DENIED, false}}) {
    failure = error;
    const Process process = CreateProcessA("C:\\emu.exe", PriorityNormal, "");
    EXPECT_FALSE(process.Started());
    EXPECT_EQ(process.NeedsElevation(), needed) << error;
  }
}

}  // namespace
