// What only a real disk can show.
#include <windows.h>

#include "tests/contract/machine.h"

namespace {

using namespace contract;

class RealFiles : public Machine {};

TEST_F(RealFiles, AreNoDevices) {
  for (const Access how : {Access::Read, Access::ReadWrite, Access::ReplaceContent}) {
    EXPECT_FALSE(File("nul", how).IsOpen());
  }
}

string FullPath(const string& path) {
  char full[MAX_PATH] = "";
  ::GetFullPathNameA(path.c_str(), MAX_PATH, full, nullptr);
  return full;
}

TEST_F(RealFiles, OnlyTheDrivesOwnDirectoryIsSet) {
  const string drive = here_.substr(0, 2), root = drive + "\\", before = FullPath(".");
  for (const string& current : {drive == "C:" ? string("Z:\\") : string("C:\\"), root}) {
    if (!::SetCurrentDirectoryA(current.c_str())) continue;  // one disk only
    for (const string& directory : {here_, root}) {
      EXPECT_TRUE(SetDriveDirectory(directory));
      EXPECT_EQ(FullPath(drive + "x"), directory + "x");
    }
    EXPECT_EQ(FullPath("x"), current + "x");
  }
  ::SetCurrentDirectoryA(before.c_str());
}

}  // namespace
