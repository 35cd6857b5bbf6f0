#include <windows.h>

#include "tests/contract/machine.h"

namespace {

using namespace contract;

class RealFiles : public Machine {};

TEST_F(RealFiles, AreNoDevices) {
  EXPECT_FALSE(File("nul", Access::Read).IsOpen());
  EXPECT_FALSE(File("nul", Access::ReadWrite).IsOpen());
}

string FullPath(const string& path) {
  char full[MAX_PATH] = "";
  ::GetFullPathNameA(path.c_str(), MAX_PATH, full, nullptr);
  return full;
}

TEST_F(RealFiles, OnlyTheDrivesOwnDirectoryIsSet) {
  const string drive = here_.substr(0, 2), root = drive + "\\";
  for (const string& current : {string("C:\\"), root}) {
    ::SetCurrentDirectoryA(current.c_str());
    EXPECT_TRUE(SetDriveDirectory(here_));
    EXPECT_EQ(FullPath(drive + "x"), here_ + "x");
    EXPECT_EQ(FullPath("x"), (current == root ? here_ : current) + "x");
  }
}

}  // namespace
