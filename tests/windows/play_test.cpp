// Playing a game: what the emulator is told, and what is remembered.
#include <filesystem>

#include "tests/windows/installation.h"

namespace {

class Play : public Installation {};

TEST_F(Play, ByEnterDoubleClickAndButton) {
  const std::string longName = Home + "Roms\\Corrida das Nuvens.smc";
  ASSERT_NE(ShortPath(longName), longName);
  Start();
  Select("Corrida das Nuvens");
  window->Play.Click();
  ExpectPlayed("Corrida das Nuvens.smc");
  ClickEntry(window->List, "Zebra", 2);
  ExpectPlayed("ZEBRA.SMC");
  ClickEntry(window->List, "Água Viva");
  PressKey(VK_RETURN);
  ExpectPlayed("agua.smc");
}

TEST_F(Play, RemembersTheGameAndTheWindow) {
  Set("pl", "1500");
  Set("pt", "2250");
  auto expected = Settings();
  Start();
  EXPECT_EQ(window->Place().left, 100);
  EXPECT_EQ(window->Place().top, 150);
  SetWindowPos(window->Handle(), nullptr, 30, 40, 0, 0, SWP_NOSIZE | SWP_NOZORDER | SWP_NOACTIVATE);
  Select("Élan");
  window->Play.Click();
  ExpectPlayed("elan.ZIP");
  expected.insert_or_assign("LRom", "Élan");
  expected.insert_or_assign("Disquete", "0");
  expected.insert_or_assign("pl", "450");
  expected.insert_or_assign("pt", "600");
  EXPECT_EQ(Settings(), expected);

  Start();
  EXPECT_EQ(Selected(), "Élan");
  EXPECT_EQ(window->Place().left, 30);
  EXPECT_EQ(window->Place().top, 40);
}

TEST_F(Play, TellsOnceHowToLeaveAGame) {
  Set("AvisoALTF4", "");
  Set("LRom", "Zebra");
  Start();
  window->Play.Click();
  EXPECT_EQ(Answer(IDOK),
            (Message{"Informação",
                     "Para fechar o jogo precione e segure a tecla 'ALT' e simultaneamente aperte e tecla 'F4'",
                     {IDOK}}));
  ExpectPlayed("ZEBRA.SMC");
  EXPECT_EQ(Settings()["AvisoALTF4"], "1");
  window->Play.Click();
  ExpectPlayed("ZEBRA.SMC");
}

TEST_F(Play, WithTheSavesOnAFloppyDisk) {
  const std::string games = "GameDirectory = C:\\Ensaio\\Roms\r\n";
  Set("LRom", "Zebra");
  Start();
  window->Floppy.Click();
  ASSERT_SOON(window->FloppyChecked());
  const auto before = Settings();
  window->Play.Click();
  EXPECT_EQ(Answer(IDCANCEL), NoDisk);
  EXPECT_SOON(window->List.Focused());
  EXPECT_EQ(Settings(), before);

  window->Play.Click();
  EXPECT_EQ(Answer(IDRETRY), NoDisk);
  ASSERT_SOON(FindMessage(*program));
  const FloppyDisk disk;
  EXPECT_EQ(Answer(IDRETRY), NoDisk);
  ExpectPlayed("ZEBRA.SMC");
  EXPECT_EQ(Content("Emulador\\zsnesw.cfg"), "\r\nSaveDirectory = A:\r\n" + games);
  window->Play.Click();
  ExpectPlayed("ZEBRA.SMC");  // unasked: the disk is there
  EXPECT_EQ(Settings()["Disquete"], "1");

  Start();
  EXPECT_TRUE(window->FloppyChecked());
  window->Floppy.Click();
  ASSERT_SOON(!window->FloppyChecked());
  window->Play.Click();
  ExpectPlayed("ZEBRA.SMC");
  EXPECT_EQ(Content("Emulador\\zsnesw.cfg"), "\r\nSaveDirectory = C:\\Ensaio\\Saves\r\n" + games);
  EXPECT_EQ(Settings()["Disquete"], "0");
}

// The emulator's configuration file, in the shape of one of its time: comments that mention the keys, and a last line
// without an end.
std::string EmulatorConfiguration(const std::string& saves, const std::string& games) {
  return "; Settings of the emulator. Lines with a semicolon are comments.\r\n\r\n"
         "; SaveDirectory: where the saved games are kept; empty for the directory of the game.\r\n"
         "; GameDirectory: where the file window opens. (savedirectory=... is not an entry.)\r\n"
         "; \t\x1A\xE9\r\nOption = 1\r\n" +
         saves + "\r\n\r\n; What is played\r\n" + games + "\r\nVolume=100";
}

TEST_F(Play, RewritesTheTwoEntriesOfTheEmulatorsConfigurationOnlyWhenTheyDiffer) {
  const std::filesystem::path file = Home + "Emulador\\zsnesw.cfg";
  const std::string fitting =
      EmulatorConfiguration("SaveDirectory = C:\\Ensaio\\Saves", "GameDirectory = C:\\Ensaio\\Roms");
  Put("Emulador\\zsnesw.cfg", EmulatorConfiguration("SaveDirectory = ", "gamedirectory = D:\\Antigos"));
  Set("LRom", "Zebra");
  Start();
  window->Play.Click();
  ExpectPlayed("ZEBRA.SMC");
  EXPECT_EQ(Content("Emulador\\zsnesw.cfg"), fitting);

  last_write_time(file, last_write_time(file) - std::chrono::hours(1000));
  const auto past = last_write_time(file);
  window->Play.Click();
  ExpectPlayed("ZEBRA.SMC");
  EXPECT_EQ(Content("Emulador\\zsnesw.cfg"), fitting);
  EXPECT_TRUE(last_write_time(file) == past);
}

}  // namespace
