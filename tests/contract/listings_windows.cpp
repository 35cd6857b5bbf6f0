// Listings of directories in which Windows cannot read everything.
#include <windows.h>

#include <algorithm>
#include <vector>

#include "tests/contract/machine.h"
#include "tests/contract/replaced_import.h"

extern void* importOfFindNextFileW asm("__imp_FindNextFileW");

namespace {

using namespace contract;

// How many calls from the second one on fail, and how many were made.
int failing = 0, calls = 0;
const auto Original = reinterpret_cast<decltype(&::FindNextFileW)>(importOfFindNextFileW);

BOOL WINAPI FindNextFileThatFails(HANDLE find, LPWIN32_FIND_DATAW data) {
  if (++calls == 1 || calls > failing + 1) return Original(find, data);
  ::SetLastError(ERROR_FILENAME_EXCED_RANGE);
  return FALSE;
}

class BrokenListings : public Machine {
 protected:
  BrokenListings() {
    failing = 0;
    for (const char* name : {"a.zip", "b.zip", "c.zip"}) Put(here_ + name);
  }

  std::size_t Listed(int failingCalls) const {
    failing = failingCalls;
    calls = 0;
    return ListDirectory(here_, "*").size();
  }

 private:
  const ReplacedImport failing_{importOfFindNextFileW, &FindNextFileThatFails};
};

TEST_F(BrokenListings, GoOnBehindAnEntryThatFailsAndEndWhereEverythingDoes) {
  EXPECT_EQ(Listed(0), 3U);
  EXPECT_EQ(Listed(1), 3U);
  EXPECT_LT(Listed(1'000'000), 3U);
  EXPECT_LT(calls, 20) << "a disk that is gone must not keep the program";
}

// Not by a letter that looks like the missing one: here that is another file.
TEST_F(BrokenListings, LeadByTheShortNameToWhatTheCodePageLacks) {
  Put(here_ + "A.smc", "another");
  const std::wstring here(here_.begin(), here_.end());
  for (const wchar_t* name : {L"\u0100.smc", L"\u65E5.smc"}) {
    const HANDLE file = ::CreateFileW((here + name).c_str(), GENERIC_WRITE, 0, nullptr, CREATE_NEW, 0, nullptr);
    EXPECT_NE(file, INVALID_HANDLE_VALUE);
    ::CloseHandle(file);
  }
  std::vector<string> found;
  for (const DirectoryEntry& entry : ListDirectory(here_, "*.smc")) {
    found.push_back(entry.Name + ": " + Content(here_ + entry.PathName()));
  }
  std::sort(found.begin(), found.end());
  EXPECT_EQ(found, (std::vector<string>{"?.smc: ", "?.smc: ", "A.smc: another"}));

  EXPECT_TRUE(::CreateDirectoryW((here + L"\u65E5").c_str(), nullptr));
  const std::vector<string> directories = ListSubdirectories(here_);
  ASSERT_EQ(directories.size(), 1U);
  EXPECT_TRUE(GetFileAttributesA(here_ + directories[0])) << directories[0];
}

}  // namespace
