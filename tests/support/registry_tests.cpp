#include "support/cls_REG.h"
#include "tests/fresh_machine.h"

namespace {

constexpr std::uint32_t Root = platform::RootCurrentUser;
const std::string Key = ChaveConfiguracao;
const cls_REG Settings;

struct Registry : FreshMachine {};

TEST_F(Registry, AValueIsReadByItsTypeAndKeepsItWhenItIsSet) {
  const std::string one = "\x01\0\0\0"s, longest(254, 'x');
  using Stored = std::optional<RegistryValue>;
  const std::tuple<const char*, Stored, Valor, Valor, RegistryValue> cases[] = {
      // before, what is read, what is set, after
      {"nothing", {}, {}, std::int32_t{1}, {1, "1\0"s}},
      {"text", {{1, "Jogo Um\0"s}}, "Jogo Um", std::int32_t{-7}, {1, "-7\0"s}},
      {"text without a byte", {{1, ""}}, {}, "novo", {1, "novo\0"s}},
      {"longest text", {{1, longest + '\0'}}, longest, "curto", {1, "curto\0"s}},
      {"too long a text", {{1, longest + "x\0"s}}, {}, "curto", {1, "curto\0"s}},
      {"number", {{4, "\x01\x02\xFF\xFF"s}}, std::int32_t{-65023}, " -2 ", {4, "\xFE\xFF\xFF\xFF"s}},
      {"number, then words", {{4, one}}, std::int32_t{1}, "um", {4, one}},
      {"number of five bytes", {{4, "12345"}}, std::int16_t{0}, "1", {4, one}},
      {"bytes", {{3, "\x05\x01"s}}, std::uint8_t{5}, "255", {3, "\xFF"s}},
      {"no bytes, then too large a one", {{3, ""}}, std::uint8_t{0}, std::int32_t{256}, {3, ""}},
      {"five bytes, then a negative one", {{3, "12345"}}, std::int16_t{0}, "-1", {3, "12345"}},
      {"text with variables", {{2, "%TEMP%\0"s}}, {}, "7", {2, "%TEMP%\0"s}},
  };
  for (const auto& [name, before, read, set, after] : cases) {
    if (before) PutValue(Key, name, before->Type, before->Data);
    EXPECT_EQ(Settings.GetValue(Root, "\\" + Key, name), read) << name;
    EXPECT_TRUE(Settings.SetValue(Root, "\\" + Key, name, set)) << name;
    const auto value = StoredValue(Key, name).value_or(RegistryValue());
    EXPECT_EQ(value.Type, after.Type) << name;
    EXPECT_EQ(value.Data, after.Data) << name;
  }
  EXPECT_EQ(Settings.GetValue(Root, "Software\\Outro", "text"), Valor());
}

TEST_F(Registry, AValueBringsTheKeysOnItsPathAndNoOthers) {
  EXPECT_TRUE(Settings.SetValue(Root, "\\Um\\Dois\\Três"_ansi, "a", "b"));
  EXPECT_EQ(Keys(), (Texts{"Um", "Um\\Dois", "Um\\Dois\\Três"_ansi}));
}

TEST_F(Registry, AKeyThatIsDeniedHoldsNothingAndStays) {
  PutText(Key, "LRom", "Jogo");
  DenyKey(Key);
  EXPECT_TRUE(Settings.SetValue(Root, Key, "LRom", "Outro"));
  EXPECT_EQ(Settings.GetValue(Root, Key, "LRom"), Valor());
  EXPECT_FALSE(Settings.DeletKey(Root, Key));
  EXPECT_EQ(StoredText(Key, "LRom"), "Jogo");
}

// A key with another one below it stays.
TEST_F(Registry, DeletKeyTellsWhetherTheKeyWasThere) {
  PutText("Software\\Roms\\Um", "a", "b");
  const std::string above = "Software\\Roms", below = above + "\\Um";
  const std::tuple<const char*, std::string, bool> steps[] = {
      {"no name", "", false},
      {"no such key", above + "\\Dois", false},
      {"one with a key below it", above, true},
      {"the key below", below, true},
      {"the key below, again", below, false},
      {"one without a key below it any more", above, true},
      {"that one again", above, false},
  };
  for (const auto& [name, key, wasThere] : steps) EXPECT_EQ(Settings.DeletKey(Root, key), wasThere) << name;
}

TEST(Values, AreWholeNumbersOf32BitsOrNone) {
  const std::tuple<const char*, const char*, std::optional<std::int32_t>> cases[] = {
      {"nothing", "", {}},
      {"blanks", "  ", {}},
      {"blanks around a number", " 12 ", 12},
      {"a plus", "+3", 3},
      {"two signs", "+-3", {}},
      {"a letter behind", "12a", {}},
      {"the lowest", "-2147483648", -2147483647 - 1},
      {"one more than the highest", "2147483648", {}},
  };
  for (const auto& [name, text, number] : cases) EXPECT_EQ(InteiroDe(text), number) << name;
  EXPECT_EQ(TextoDe(std::uint8_t{200}), "200");
  EXPECT_EQ(TextoDe(std::int16_t{-200}), "-200");
  EXPECT_EQ(TextoDe({}), "");
}

}  // namespace
