#include <gtest/gtest.h>

#include "platform/registry.h"
#include "tests/contract/machine.h"

namespace {

using namespace platform;

const RegistryKey root = RootKey(RootCurrentUser);

class Registry : public testing::Test {
 protected:
  void SetUp() override { ASSERT_EQ(RegOpenKeyExA(root, fresh_.Path(), KeyQueryAndSet, key_), 0); }
  void TearDown() override { EXPECT_EQ(RegCloseKey(key_), 0); }

  bool Set(const std::string& name, std::uint32_t type, std::string_view data) {
    return RegSetValueExA(key_, name, type, data.data(), static_cast<std::uint32_t>(data.size())) == 0;
  }

  // The type and the data of a value that fits into so many bytes; or "failed".
  std::string Query(const std::string& name, std::uint32_t room = 255) {
    std::string buffer(room, '\0');
    std::uint32_t type = 0, size = room;
    if (RegQueryValueExA(key_, name, type, buffer.data(), size) != 0) return "failed";
    return std::to_string(type) + ":" + buffer.substr(0, size);
  }

  bool Exists(const std::string& subkey) {
    RegistryKey opened = 0;
    if (RegOpenKeyExA(key_, subkey, KeyQueryAndSet, opened) != 0) return false;
    return opened != 0 && RegCloseKey(opened) == 0;
  }

  long Create(const std::string& subkey) {
    RegistryKey made = 0;
    const long error = RegCreateKeyA(key_, subkey, made);
    return error != 0 ? error : RegCloseKey(made);
  }

  contract::FreshKey fresh_;
  RegistryKey key_ = 0;
};

TEST_F(Registry, ValuesKeepTheirTypeAndBytes) {
  using namespace std::string_view_literals;
  struct {
    std::uint32_t Type;
    std::string_view Data;
  } const cases[] = {{RegistryText, "C:\\Jogos\\A\xE7\xE3o\0"sv},
                     {RegistryText, "\0"sv},
                     {RegistryNumber, "\1\0\0\0"sv},
                     {RegistryBinary, "\0\xFF\0"sv},
                     {RegistryBinary, ""sv},
                     {2, "%PATH%\0"sv}};
  for (const auto& each : cases) {  // each over the one before it
    ASSERT_TRUE(Set("Valor", each.Type, each.Data));
    EXPECT_EQ(Query("Valor"), std::to_string(each.Type) + ":" + std::string(each.Data));
    EXPECT_EQ(Query("VALOR"), Query("Valor"));
  }
  EXPECT_EQ(Query("Outro"), "failed");
}

TEST_F(Registry, TextStoredWithoutItsZeroHasNone) {
  ASSERT_TRUE(Set("Valor", RegistryText, std::string_view("abcd").substr(0, 3)));
  EXPECT_EQ(Query("Valor"), "1:abc");
}

TEST_F(Registry, DataLongerThanTheRoomFails) {
  ASSERT_TRUE(Set("Cabe", RegistryText, std::string(254, 'x') + '\0'));
  ASSERT_TRUE(Set("Sobra", RegistryText, std::string(255, 'x') + '\0'));
  ASSERT_TRUE(Set("Bytes", RegistryBinary, "12345"));
  EXPECT_EQ(Query("Cabe"), "1:" + std::string(254, 'x') + '\0');
  EXPECT_EQ(Query("Sobra"), "failed");
  EXPECT_EQ(Query("Bytes", 4), "failed");
  EXPECT_EQ(Query("Bytes", 5), "3:12345");
}

TEST_F(Registry, KeysAreMadeOnceAndOpenedAfterwards) {
  EXPECT_FALSE(Exists("Um"));
  EXPECT_EQ(Create("Um\\"), 0);
  EXPECT_TRUE(Exists("um"));
  RegistryKey below = 0;
  ASSERT_EQ(RegCreateKeyA(key_, "Um\\Dois", below), 0);
  EXPECT_EQ(RegSetValueExA(below, "Valor", RegistryNumber, "1234", 4), 0);
  EXPECT_EQ(RegCloseKey(below), 0);
  EXPECT_EQ(Create("UM\\DOIS"), 0);  // stands already: keeps what is in it
  ASSERT_EQ(RegOpenKeyExA(key_, "Um\\Dois", KeyQueryAndSet, below), 0);
  std::uint32_t type = 0, size = 4, number = 0;
  EXPECT_EQ(RegQueryValueExA(below, "Valor", type, &number, size), 0);
  EXPECT_EQ(number, 0x34333231u);
  EXPECT_EQ(RegCloseKey(below), 0);
}

TEST_F(Registry, AnEmptySubkeyIsTheParentItself) {
  RegistryKey same = 0, user = 0;
  ASSERT_EQ(RegOpenKeyExA(key_, "", KeyQueryAndSet, same), 0);
  EXPECT_EQ(RegSetValueExA(same, "Valor", RegistryNumber, "1234", 4), 0);
  EXPECT_EQ(RegCloseKey(same), 0);
  EXPECT_EQ(Query("Valor"), "4:1234");
  ASSERT_EQ(RegOpenKeyExA(root, "", KeyQueryAndSet, user), 0);
  EXPECT_EQ(RegCloseKey(user), 0);
  EXPECT_TRUE(Exists(""));
}

TEST_F(Registry, OnlyKeysWithoutKeysBelowAreDeleted) {
  ASSERT_EQ(Create("Um"), 0);
  ASSERT_EQ(Create("Um\\Dois"), 0);
  EXPECT_NE(RegDeleteKeyA(key_, "Um"), 0);
  EXPECT_TRUE(Exists("Um\\Dois"));
  EXPECT_EQ(RegDeleteKeyA(key_, "UM\\dois"), 0);
  EXPECT_FALSE(Exists("Um\\Dois"));
  EXPECT_EQ(RegDeleteKeyA(key_, "Um"), 0);
  EXPECT_NE(RegDeleteKeyA(key_, "Um"), 0);
}

TEST_F(Registry, AFailedOpenLeavesTheResultAlone) {
  RegistryKey result = 77;
  EXPECT_NE(RegOpenKeyExA(key_, "Nada", KeyQueryAndSet, result), 0);
  EXPECT_EQ(result, 77);
}

}  // namespace
