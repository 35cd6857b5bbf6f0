#include <gtest/gtest.h>

#include <random>

#include "mainwindow/configuracao_emulador.h"
#include "platform/text.h"

namespace {

constexpr char Saves[] = "C:\\T\\Saves\\";
constexpr char Roms[] = "C:\\T\\Roms\\";
const std::string SavesLine = "SaveDirectory = C:\\T\\Saves";
const std::string RomsLine = "GameDirectory = C:\\T\\Roms";

TEST(EmulatorConfiguration, KeepsItsTwoEntriesAndNothingElse) {
  struct Case {
    const char* Name;
    std::string Before, After;  // an empty After: no change
  };
  const Case cases[] = {
      {"right in any letter case", "savedirectory = c:\\t\\SAVES\r\nGAMEDIRECTORY = C:\\T\\ROMS\r\n", ""},
      {"in the middle, between other lines", "a\r\nsavedirectory = C:\\Old\r\nb=1\r\nGameDirectory = D:\r\n\r\nc",
       "a\r\n" + SavesLine + "\r\nb=1\r\n" + RomsLine + "\r\n\r\nc"},
      {"missing entries are appended", "x = 1\r\n", "x = 1\r\n\r\n" + SavesLine + "\r\n\r\n" + RomsLine + "\r\n"},
      {"without the blank it is another key", SavesLine + "\r\nGameDirectory=C:\\Old\r\n",
       SavesLine + "\r\nGameDirectory=C:\\Old\r\n\r\n" + RomsLine + "\r\n"},
      {"a last line without its end, and an empty value",
       RomsLine + "\r\nSaveDirectory = ", RomsLine + "\r\n" + SavesLine},
      {"no blank behind the sign", RomsLine + "\r\nSaveDirectory =\r\nz", RomsLine + "\r\n" + SavesLine + "\r\nz"},
      {"the last of several counts", "SaveDirectory = C:\\Old\r\n" + SavesLine + "\r\n" + RomsLine, ""},
      {"copies of the old entry change with it", "SaveDirectory = X\r\n;SaveDirectory = X\r\n" + RomsLine,
       SavesLine + "\r\n;" + SavesLine + "\r\n" + RomsLine},
      {"but not in another letter case", "SAVEDIRECTORY = X\r\nSaveDirectory = X\r\n" + RomsLine,
       "SAVEDIRECTORY = X\r\n" + SavesLine + "\r\n" + RomsLine},
      {"a lone line feed ends an entry", "SaveDirectory = X\nb\nGameDirectory = Y\nc",
       SavesLine + "\nb\n" + RomsLine + "\nc"},
      {"empty", "", "\r\n" + SavesLine + "\r\n\r\n" + RomsLine + "\r\n"},
  };
  for (const Case& each : cases) {
    const auto after = ConfiguracaoAtualizada(each.Before, Saves, Roms);
    EXPECT_EQ(after.value_or(""), each.After) << each.Name;
    EXPECT_EQ(ConfiguracaoAtualizada(after.value_or(each.Before), Saves, Roms), std::nullopt) << each.Name << ", again";
  }
  EXPECT_EQ(ConfiguracaoNova("A:\\", Roms), "\r\nSaveDirectory = A:\r\n" + RomsLine + "\r\n");
}

// A file in the shape of the emulator's own: remarks that mention the keys, many entries, accents, an empty entry and a
// last line without its end.
TEST(EmulatorConfiguration, EveryOtherByteOfALongFileStays) {
  std::mt19937 random(7);
  std::string head = "; Configuração do emulador\r\n; SaveDirectory e GameDirectory ficam adiante\r\n"_ansi, middle;
  for (int i = 0; i < 120; ++i) {
    std::string& part = i % 2 ? head : middle;
    part += "Opcao" + std::to_string(i) + " = ";
    for (auto length = random() % 30; length > 0; --length) part += static_cast<char>(' ' + random() % 220);
    part += i % 10 ? "\r\n" : "\r\n\r\n";
  }
  const auto after = ConfiguracaoAtualizada(head + "SaveDirectory = \r\n" + middle + "GameDirectory = .", Saves, Roms);
  EXPECT_EQ(after, head + SavesLine + "\r\n" + middle + RomsLine);
}

}  // namespace
