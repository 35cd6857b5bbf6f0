#include <gtest/gtest.h>

#include "mainwindow/configuracao_emulador.h"

namespace {

constexpr char SaveDirectory[] = "C:\\T\\Saves\\", GameDirectory[] = "C:\\T\\Roms\\";
const std::string SavesLine = "SaveDirectory = C:\\T\\Saves", RomsLine = "GameDirectory = C:\\T\\Roms";

TEST(EmulatorConfiguration, KeepsItsTwoEntriesAndEveryOtherByte) {
  std::string bytes;  // all of them, on 150 lines
  for (int i = 0; i < 150 * 256; ++i) bytes += static_cast<char>(i);
  const std::string head = bytes + "\r\n; SaveDirectory and GameDirectory stand below\r\n";
  const std::tuple<const char*, std::string, std::string> cases[] = {
      // nothing afterwards: no change
      {"right in any letter case", "savedirectory = c:\\t\\SAVES\r\nGAMEDIRECTORY = C:\\T\\ROMS\r\n", ""},
      {"in the middle, between other lines", "a\r\nsavedirectory = C:\\Old\r\nb=1\r\nGameDirectory = D:\r\n\r\nc",
       "a\r\n" + SavesLine + "\r\nb=1\r\n" + RomsLine + "\r\n\r\nc"},
      {"missing entries are appended", "x = 1\r\n", "x = 1\r\n\r\n" + SavesLine + "\r\n\r\n" + RomsLine + "\r\n"},
      {"without the blank it is another key", SavesLine + "\r\nGameDirectory=C:\\Old\r\n",
       SavesLine + "\r\nGameDirectory=C:\\Old\r\n\r\n" + RomsLine + "\r\n"},
      {"no blank behind the sign", RomsLine + "\r\nSaveDirectory =\r\nz", RomsLine + "\r\n" + SavesLine + "\r\nz"},
      {"the last of several counts", "SaveDirectory = C:\\Old\r\n" + SavesLine + "\r\n" + RomsLine, ""},
      {"copies of the old entry change with it", "SaveDirectory = X\r\n;SaveDirectory = X\r\n" + RomsLine,
       SavesLine + "\r\n;" + SavesLine + "\r\n" + RomsLine},
      {"but not in another letter case", "SAVEDIRECTORY = X\r\nSaveDirectory = X\r\n" + RomsLine,
       "SAVEDIRECTORY = X\r\n" + SavesLine + "\r\n" + RomsLine},
      {"a lone line feed ends an entry", "SaveDirectory = X\nb\nGameDirectory = Y\nc",
       SavesLine + "\nb\n" + RomsLine + "\nc"},
      {"any bytes, an empty value and a last line without its end",
       head + "SaveDirectory = \r\n" + bytes + "GameDirectory = ", head + SavesLine + "\r\n" + bytes + RomsLine},
  };
  for (const auto& [name, before, after] : cases) {
    const auto updated = ConfiguracaoAtualizada(before, SaveDirectory, GameDirectory);
    EXPECT_EQ(updated.value_or(""), after) << name;
    EXPECT_EQ(ConfiguracaoAtualizada(updated.value_or(before), SaveDirectory, GameDirectory), std::nullopt)
        << name << ", again";
  }
}

}  // namespace
