#include <tuple>

#include "platform/registry.h"
#include "tests/contract/machine.h"

namespace {

using namespace contract;

const RegistryKey Root = RootKey(RootCurrentUser);

class Registry : public Machine {
 protected:
  Registry() { EXPECT_EQ(RegCreateKeyA(Root, Key, key_), 0); }
  ~Registry() override { EXPECT_EQ(RegCloseKey(key_), 0); }

  // The type and the data of a value that fits into so many bytes; or "failed".
  string Query(const string& name, std::size_t room) {
    string buffer(room, '\0');
    std::uint32_t type = 0, size = static_cast<std::uint32_t>(room);
    if (RegQueryValueExA(key_, name, type, buffer.data(), size) != 0) return "failed";
    return std::to_string(type) + ":" + buffer.substr(0, size);
  }

  bool Exists(const string& subkey) {
    RegistryKey opened = 0;
    return RegOpenKeyExA(key_, subkey, KeyQueryAndSet, opened) == 0 && RegCloseKey(opened) == 0;
  }

  RegistryKey key_ = 0;
};

TEST_F(Registry, ValuesKeepTheirTypeAndBytesAndMustFitTheRoom) {
  const std::tuple<const char*, std::uint32_t, string> cases[] = {
      {"text", RegistryText, string("C:\\A\xE7\xE3o\0", 8)},
      {"text without its zero", RegistryText, "without its zero"},
      {"number", RegistryNumber, string("\1\0\0\0", 4)},
      {"bytes", RegistryBinary, string("\0\xFF\0", 3)},
      {"no bytes", RegistryBinary, ""},
  };
  for (const auto& [name, type, data] : cases) {  // each over the one before; what lies behind its data is not taken
    SCOPED_TRACE(name);
    ASSERT_EQ(RegSetValueExA(key_, "Valor", type, (data + "+").data(), static_cast<std::uint32_t>(data.size())), 0);
    const string stored = std::to_string(type) + ":" + data;
    EXPECT_EQ(Query("Valor", data.size()), stored);
    EXPECT_EQ(Query("VALOR", 255), stored);
    EXPECT_EQ(Query("Valor", data.empty() ? 0 : data.size() - 1), data.empty() ? stored : "failed");
  }
  EXPECT_EQ(Query("Outro", 255), "failed");
}

TEST_F(Registry, KeysAreMadeOnceAndDeletedWithoutKeysBelow) {
  EXPECT_FALSE(Exists("Um"));
  RegistryKey made = 0;
  for (const char* subkey : {"Um\\", "Um\\Dois", ""}) {  // the empty one is the parent itself, which stands already
    ASSERT_EQ(RegCreateKeyA(key_, subkey, made), 0);
    EXPECT_EQ(RegSetValueExA(made, "Valor", RegistryNumber, "1234", 4), 0);
    EXPECT_EQ(RegCloseKey(made), 0);
  }
  EXPECT_EQ(Query("Valor", 4), "4:1234");
  EXPECT_NE(RegDeleteKeyA(key_, "Um"), 0);
  for (const char* key : {"um", "Um\\Dois", ""}) EXPECT_TRUE(Exists(key)) << key;
  for (const char* subkey : {"UM\\dois", "Um"}) {
    EXPECT_EQ(RegDeleteKeyA(key_, subkey), 0);
    EXPECT_FALSE(Exists(subkey));
    EXPECT_NE(RegDeleteKeyA(key_, subkey), 0);
  }
}

}  // namespace
