// What only a real disk can show.
#include <gtest/gtest.h>
#include <windows.h>

#include "platform/files.h"
#include "tests/contract/machine.h"

namespace {

using namespace platform;

TEST(RealFiles, MayBeLongerThanThirtyTwoBitsTell) {
  const contract::FreshDirectory directory;
  const std::string path = directory / "long.smc";
  constexpr std::int64_t distant = (std::int64_t{5} << 30) + 7;
  File file(path, Access::ReadWrite);
  ASSERT_TRUE(file.SetSize(distant));
  ASSERT_TRUE(file.Write(distant - 2, "end"));
  char bytes[9] = {};
  EXPECT_EQ(file.Read(distant - 3, bytes, sizeof bytes), 4);
  EXPECT_EQ(std::string(bytes, 4), std::string("\0end", 4));
  EXPECT_EQ(file.Size(), distant + 1);
  EXPECT_EQ(FileSize(path), distant + 1);
}

TEST(RealFiles, DevicesAreNoFiles) {
  for (const Access access : {Access::Read, Access::ReadWrite, Access::ReplaceContent}) {
    EXPECT_FALSE(File("nul", access).IsOpen());
  }
}

// The root of a disk that can be read and is not this one; empty when there is none.
std::string OtherDisk(char letter) {
  for (char other = 'C'; other <= 'Z'; ++other) {
    const std::string root = std::string(1, other) + ":\\";
    if (other != letter && GetFileAttributesA(root)) return root;
  }
  return "";
}

std::string FullPath(const std::string& path) {
  char full[MAX_PATH] = "";
  ::GetFullPathNameA(path.c_str(), MAX_PATH, full, nullptr);
  return full;
}

TEST(RealDisks, OnlyTheDrivesOwnDirectoryIsSet) {
  const contract::FreshDirectory directory;
  const std::string drive = directory.Path().substr(0, 2), root = drive + "\\", other = OtherDisk(drive[0]);
  if (other.empty()) GTEST_SKIP() << "one disk only";
  const std::string before = FullPath(".");
  for (const std::string& current : {other, root}) {
    ASSERT_TRUE(::SetCurrentDirectoryA(current.c_str()));
    EXPECT_TRUE(SetDriveDirectory(directory.Path()));
    EXPECT_EQ(FullPath(drive + "x"), directory / "x");
    EXPECT_TRUE(SetDriveDirectory(root));
    EXPECT_EQ(FullPath(drive + "x"), root + "x");
    EXPECT_EQ(FullPath("x"), current + "x");
  }
  ::SetCurrentDirectoryA(before.c_str());
}

}  // namespace
