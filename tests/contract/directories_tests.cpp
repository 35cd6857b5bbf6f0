#include <gtest/gtest.h>

#include <algorithm>

#include "platform/environment.h"
#include "platform/files.h"
#include "platform/text.h"
#include "tests/contract/machine.h"

namespace {

using namespace platform;
using Names = std::vector<std::string>;

TEST(Directories, AreListedInTheOrderOfTheirNamesAndWithoutThoseThatCannotBeSeen) {
  const contract::FreshDirectory directory;
  for (const char* name : {"Zebra", "emu 10", "\xC1gua", "EMU 2.zip", "hidden", "system", "readonly"}) {
    ASSERT_TRUE(CreateDirectoryA(directory / name)) << name;
  }
  ASSERT_TRUE(CreateDirectoryA(directory / "Zebra\\inside"));
  ASSERT_TRUE(File(directory / "file", Access::ReplaceContent).IsOpen());
  contract::SetAttributes(directory / "hidden", AttributeHidden);
  contract::SetAttributes(directory / "system", AttributeSystem);
  contract::SetAttributes(directory / "readonly", AttributeReadOnly);
  const Names expected = {"\xC1gua", "emu 10", "EMU 2.zip", "readonly", "Zebra"};
  EXPECT_EQ(ListSubdirectories(directory.Path()), expected);
  EXPECT_EQ(ListSubdirectories(directory / "Zebra\\"), Names{"inside"});
  for (const std::string& none : {directory / "Zebra\\inside\\", directory / "missing\\", directory / "file\\",
                                  directory.Path() + std::string("\0", 1), std::string("q:\\")}) {
    EXPECT_EQ(ListSubdirectories(none), Names()) << none;
  }
}

TEST(Directories, BuiltInDisksAreTheRootsOfPaths) {
  const contract::FreshDirectory directory;
  const Names roots = FixedDrives();
  EXPECT_EQ(std::count(roots.begin(), roots.end(), directory.Path().substr(0, 3)), 1);
  EXPECT_TRUE(std::is_sorted(roots.begin(), roots.end()));
  for (const std::string& root : roots) EXPECT_TRUE(GetFileAttributesA(root)) << root;
}

TEST(Environment, IsReadWithoutRegardToCase) {
  const std::string longValue(3000, 'x');
  for (const std::string& value : {std::string("C:\\Jogos;D:\\A\xE7\xE3o"), longValue, std::string()}) {
    contract::SetEnvironment("Tolvaris_Teste", value);
    EXPECT_EQ(GetEnvironmentVariableA("TOLVARIS_teste"), value);
  }
  EXPECT_EQ(GetEnvironmentVariableA("Tolvaris_Nada"), "");
}

}  // namespace
