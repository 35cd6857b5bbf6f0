// Playing a game: what the emulator is told, and what is remembered.
#include <filesystem>
#include <fstream>

#include "tests/windows/installation.h"

namespace {

class Play : public Installation {
 protected:
  Play() { Set("LRom", "Zebra"); }

  void PlayZebra() const {
    window->Play.Click();
    ExpectPlayed("ZEBRA.SMC");
  }
};

TEST_F(Play, ByEnterDoubleClickAndButton) {
  const std::string longName = Home + "Roms\\Corrida das Nuvens.smc";
  ASSERT_NE(ShortPath(longName), longName);
  Start();
  ClickEntry(window->List, "Corrida das Nuvens", 2);
  ExpectPlayed("Corrida das Nuvens.smc");
  ClickEntry(window->List, "Água Viva");
  PressKey(VK_RETURN);
  ExpectPlayed("agua.smc");
  Select("Zebra");
  PlayZebra();
}

TEST_F(Play, TellsHowToLeaveAGameAndRemembersThatAndTheGameAndTheWindow) {
  Set("AvisoALTF4", "");
  Set("pl", "1500");
  Set("pt", "2250");
  std::map<std::string, std::string> expected = {
      {"AvisoALTF4", "1"}, {"LRom", "Élan"}, {"Disquete", "0"}, {"pl", "450"}, {"pt", "600"}};
  expected.merge(Settings());  // the others stay
  Start();
  EXPECT_EQ(window->Place().left, 100);
  EXPECT_EQ(window->Place().top, 150);
  SetWindowPos(window->Handle(), nullptr, 30, 40, 0, 0, SWP_NOSIZE | SWP_NOZORDER | SWP_NOACTIVATE);
  Select("Élan");
  window->Play.Click();
  EXPECT_EQ(Answer(IDOK), Of(Mensagem::ComoFecharOJogo));
  ExpectPlayed("elan.ZIP");
  EXPECT_EQ(Settings(), expected);

  Start();
  EXPECT_EQ(Selected(), "Élan");
  EXPECT_EQ(window->Place().left, 30);
  EXPECT_EQ(window->Place().top, 40);
}

TEST_F(Play, StartsTheEmulatorAndNotWhatStandsBeforeABlankInItsPath) {
  const std::string emulator = Home + "Meu Emulador\\zsnesw.exe";
  for (const char* file : {"Meu.exe", "Meu Emulador\\zsnesw.exe"}) PutStandIn(file);
  Set("EmuExe", emulator);
  Start();
  window->Play.Click();
  EXPECT_EQ(NextCall(emulator),
            (Call{"\"" + emulator + "\" " + ShortPath(Home + "Roms\\ZEBRA.SMC"), Home + "Meu Emulador"}));
  EXPECT_EQ(Content("Meu.exe.call"), "");
}

// It is listed under the letters that look most like its own.
TEST_F(Play, ReachesAGameByItsShortNameWhereTheCodePageLacksTheLongOne) {
  const std::filesystem::path foreign = std::filesystem::path(Home + "Roms") / L"\u0100lan.smc";
  std::ofstream(foreign) << "jogo";
  WIN32_FIND_DATAW found{};
  FindClose(FindFirstFileW(foreign.c_str(), &found));
  const std::string shortName = FromWide(found.cAlternateFileName);
  ASSERT_NE(shortName, "");
  Start();
  ClickEntry(window->List, "?lan", 2);
  EXPECT_EQ(NextCall(Emulator), (Call{Emulator + " " + Home + "Roms\\" + shortName, Home + "Emulador"}));
}

// The emulator's configuration file: a comment that mentions the keys, and a last line without an end.
std::string EmulatorConfiguration(const std::string& saves, const std::string& games) {
  return "; SaveDirectory and GameDirectory: \t\x1A\xE9\r\n\r\nOption = 1\r\n" + saves + "\r\n\r\n" + games +
         "\r\nVolume=100";
}

TEST_F(Play, WithTheSavesOnAFloppyDiskRewritesTheEmulatorsConfigurationWhenItDiffers) {
  const std::string games = "GameDirectory = C:\\Ensaio\\Roms";
  const std::filesystem::path file = Home + "Emulador\\zsnesw.cfg";
  Put("Emulador\\zsnesw.cfg", EmulatorConfiguration("SaveDirectory = ", "gamedirectory = D:\\Antigos"));
  Start();
  window->Floppy.Click();
  ASSERT_SOON(window->FloppyChecked());
  const auto before = Settings();
  window->Play.Click();
  EXPECT_EQ(Answer(IDCANCEL), Of(Mensagem::SemDisquete));
  EXPECT_SOON(window->List.Focused());
  EXPECT_EQ(Settings(), before);

  window->Play.Click();
  EXPECT_EQ(Answer(IDRETRY), Of(Mensagem::SemDisquete));
  ASSERT_SOON(FindMessage(*program));
  const FloppyDisk disk;
  EXPECT_EQ(Answer(IDRETRY), Of(Mensagem::SemDisquete));
  ExpectPlayed("ZEBRA.SMC");
  EXPECT_EQ(Content("Emulador\\zsnesw.cfg"), EmulatorConfiguration("SaveDirectory = A:", games));
  last_write_time(file, last_write_time(file) - std::chrono::hours(1000));
  const auto past = last_write_time(file);
  PlayZebra();  // unasked: the disk is there
  EXPECT_TRUE(last_write_time(file) == past);
  {
    Put("Emulador\\zsnesw.cfg", "SaveDirectory = B:");
    const HeldFile held(file.string());
    PlayZebra();  // with a configuration that cannot be read
  }
  EXPECT_EQ(Content("Emulador\\zsnesw.cfg"), "SaveDirectory = B:");
  Put("Emulador\\zsnesw.cfg", EmulatorConfiguration("SaveDirectory = A:", games));
  EXPECT_EQ(Settings()["Disquete"], "1");

  Start();
  EXPECT_TRUE(window->FloppyChecked());
  window->Floppy.Click();
  ASSERT_SOON(!window->FloppyChecked());
  PlayZebra();
  EXPECT_EQ(Content("Emulador\\zsnesw.cfg"), EmulatorConfiguration("SaveDirectory = C:\\Ensaio\\Saves", games));
  EXPECT_EQ(Settings()["Disquete"], "0");
}

}  // namespace
