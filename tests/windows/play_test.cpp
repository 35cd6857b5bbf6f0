// Playing a game: what the emulator is told, and what is remembered.
#include "tests/windows/installation.h"
#include "tests/windows/main_window.h"

namespace {

using driver::Answer;
using driver::Message;
using driver::Program;

class Play : public testing::Test {
 protected:
  Play() {
    installation.Configure();
    installation.PutGames();
  }

  Call CallFor(const std::string& rom) {
    return {installation.Emulator + " " + ShortPath(installation.Directory + "Roms\\" + rom), "C:\\Ensaio\\Emulador"};
  }

  Installation installation;
};

TEST_F(Play, ByEnterDoubleClickAndButton) {
  ASSERT_NE(ShortPath(installation.Directory + "Roms\\Corrida das Nuvens.smc"),
            installation.Directory + "Roms\\Corrida das Nuvens.smc");
  const Program program(installation.CommandLine());
  const MainWindow window(program);

  ClickEntry(window.List, "Corrida das Nuvens");
  ASSERT_SOON(window.Play.Enabled());
  window.Play.Click();
  EXPECT_EQ(NextCall(installation.Emulator), CallFor("Corrida das Nuvens.smc"));

  ClickEntry(window.List, "Zebra", 2);
  EXPECT_EQ(NextCall(installation.Emulator), CallFor("ZEBRA.SMC"));

  ClickEntry(window.List, "Água Viva");
  driver::PressKey(VK_RETURN);
  EXPECT_EQ(NextCall(installation.Emulator), CallFor("agua.smc"));
}

TEST_F(Play, RemembersTheGameAndTheWindow) {
  installation.Set("pl", "1500");
  installation.Set("pt", "2250");
  std::map<std::string, std::string> expected = {{"EmuExe", "\\Emulador\\zsnesw.exe"},
                                                 {"EmuCFG", "\\Emulador\\zsnesw.cfg"},
                                                 {"AvisoControle", "2"},
                                                 {"AvisoALTF4", "1"},
                                                 {"LRom", "Élan"},
                                                 {"Disquete", "0"},
                                                 {"pl", "1500"},
                                                 {"pt", "2250"}};
  {
    const Program program(installation.CommandLine());
    const MainWindow window(program);
    EXPECT_EQ(window.Window.Place().left, 100);
    EXPECT_EQ(window.Window.Place().top, 150);
    ClickEntry(window.List, "Élan");
    driver::PressKey(VK_RETURN);
    EXPECT_EQ(NextCall(installation.Emulator), CallFor("elan.ZIP"));
    EXPECT_EQ(installation.Settings(), expected);

    SetWindowPos(window.Window.Handle(), nullptr, 30, 40, 0, 0, SWP_NOSIZE | SWP_NOZORDER | SWP_NOACTIVATE);
    ClickEntry(window.List, "Zebra");
    driver::PressKey(VK_RETURN);
    EXPECT_EQ(NextCall(installation.Emulator), CallFor("ZEBRA.SMC"));
    expected["LRom"] = "Zebra";
    expected["pl"] = "450";
    expected["pt"] = "600";
    EXPECT_EQ(installation.Settings(), expected);
  }
  const Program program(installation.CommandLine());
  const MainWindow window(program);
  EXPECT_EQ(SelectedEntry(window.List), 4);
  EXPECT_EQ(window.Window.Place().left, 30);
  EXPECT_EQ(window.Window.Place().top, 40);
}

TEST_F(Play, TellsOnceHowToLeaveAGame) {
  installation.Set("AvisoALTF4", "");
  installation.Set("LRom", "Zebra");
  const Program program(installation.CommandLine());
  const MainWindow window(program);
  window.Play.Click();
  const Message notice = {
      "Informação", "Para fechar o jogo precione e segure a tecla 'ALT' e simultaneamente aperte e tecla 'F4'", {IDOK}};
  EXPECT_EQ(Answer(program, IDOK), notice);
  EXPECT_EQ(NextCall(installation.Emulator), CallFor("ZEBRA.SMC"));
  EXPECT_EQ(installation.Settings()["AvisoALTF4"], "1");

  window.Play.Click();
  EXPECT_EQ(NextCall(installation.Emulator), CallFor("ZEBRA.SMC"));
}

TEST_F(Play, SaysWhatIsMissingAndRemembersNothing) {
  installation.Set("LRom", "Zebra");
  const auto before = installation.Settings();
  const Program program(installation.CommandLine());
  const MainWindow window(program);
  installation.Remove("Emulador\\zsnesw.exe");
  window.Play.Click();
  EXPECT_EQ(Answer(program, IDOK), (Message{"Erro", "O emulador ZSnes não foi encontrado.", {IDOK}}));
  installation.Remove("Roms\\ZEBRA.SMC");
  window.Play.Click();
  EXPECT_EQ(Answer(program, IDOK), (Message{"Erro", "O jogo não foi encontrado.", {IDOK}}));
  EXPECT_EQ(installation.Settings(), before);
}

TEST_F(Play, WithTheSavesOnAFloppyDisk) {
  installation.Set("LRom", "Zebra");
  const Message prompt = {"Disquete A:",
                          "Não há disquete na unidade A:\\\r\n\r\nColoque um disquete e clique em 'Repetir'.",
                          {IDRETRY, IDCANCEL}};
  {
    const Program program(installation.CommandLine());
    const MainWindow window(program);
    window.Floppy.Click();
    ASSERT_SOON(window.FloppyChecked());

    const auto before = installation.Settings();
    window.Play.Click();
    EXPECT_EQ(Answer(program, IDCANCEL), prompt);
    EXPECT_SOON(window.List.Focused());
    EXPECT_EQ(installation.Settings(), before);

    window.Play.Click();
    EXPECT_EQ(Answer(program, IDRETRY), prompt);
    ASSERT_SOON(driver::FindMessage(program));
    const FloppyDisk disk(installation.Directory + "Disquete");
    EXPECT_EQ(Answer(program, IDRETRY), prompt);
    EXPECT_EQ(NextCall(installation.Emulator), CallFor("ZEBRA.SMC"));
    EXPECT_EQ(installation.Content("Emulador\\zsnesw.cfg"),
              "\r\nSaveDirectory = A:\r\nGameDirectory = C:\\Ensaio\\Roms\r\n");

    window.Play.Click();
    EXPECT_EQ(NextCall(installation.Emulator), CallFor("ZEBRA.SMC")) << "the disk is there: no question";
    EXPECT_EQ(installation.Settings()["Disquete"], "1");
  }
  const Program program(installation.CommandLine());
  const MainWindow window(program);
  EXPECT_TRUE(window.FloppyChecked());
  window.Floppy.Click();
  ASSERT_SOON(!window.FloppyChecked());
  window.Play.Click();
  EXPECT_EQ(NextCall(installation.Emulator), CallFor("ZEBRA.SMC"));
  EXPECT_EQ(installation.Content("Emulador\\zsnesw.cfg"),
            "\r\nSaveDirectory = C:\\Ensaio\\Saves\r\nGameDirectory = C:\\Ensaio\\Roms\r\n");
  EXPECT_EQ(installation.Settings()["Disquete"], "0");
}

// --- The emulator's configuration file.

// In the shape of one of its time: comments that mention the keys, an empty save directory, many lines, and a last one
// without a line end. `directories` are the lines of the two entries.
std::string EmulatorConfiguration(const std::string& saves, const std::string& games) {
  std::string text =
      "; Settings of the emulator. Lines with a semicolon are comments.\r\n\r\n"
      "; SaveDirectory: where the saved games are kept; empty for the directory of the game.\r\n"
      "; GameDirectory: where the file window opens. (savedirectory=... is not an entry.)\r\n";
  for (int i = 0; i < 60; ++i)
    text += "; comment \t\x1A\xE9 " + std::to_string(i) + "\r\nOption" + std::to_string(i) + " = 1\r\n";
  text += saves + "\r\n\r\n; What is played\r\n" + games + "\r\nVolume=100";
  return text;
}

TEST_F(Play, RewritesTheTwoEntriesOfTheEmulatorsConfigurationOnly) {
  installation.Put("Emulador\\zsnesw.cfg", EmulatorConfiguration("SaveDirectory = ", "gamedirectory = D:\\Antigos"));
  installation.Set("LRom", "Zebra");
  const Program program(installation.CommandLine());
  const MainWindow window(program);
  window.Play.Click();
  EXPECT_EQ(NextCall(installation.Emulator), CallFor("ZEBRA.SMC"));
  EXPECT_EQ(installation.Content("Emulador\\zsnesw.cfg"),
            EmulatorConfiguration("SaveDirectory = C:\\Ensaio\\Saves", "GameDirectory = C:\\Ensaio\\Roms"));
}

TEST_F(Play, LeavesTheEmulatorsConfigurationAloneWhenItFits) {
  const std::string fitting =
      EmulatorConfiguration("savedirectory = c:\\ENSAIO\\saves", "GameDirectory = C:\\Ensaio\\Roms");
  installation.Put("Emulador\\zsnesw.cfg", fitting);
  const FILETIME past = {0, 0x01C00000};  // in the year 2000
  const HANDLE file = CreateFileA(installation.Configuration.c_str(), FILE_WRITE_ATTRIBUTES, 0, nullptr, OPEN_EXISTING,
                                  FILE_ATTRIBUTE_NORMAL, nullptr);
  ASSERT_TRUE(SetFileTime(file, nullptr, nullptr, &past));
  CloseHandle(file);

  installation.Set("LRom", "Zebra");
  const Program program(installation.CommandLine());
  const MainWindow window(program);
  window.Play.Click();
  EXPECT_EQ(NextCall(installation.Emulator), CallFor("ZEBRA.SMC"));
  EXPECT_EQ(installation.Content("Emulador\\zsnesw.cfg"), fitting);
  WIN32_FILE_ATTRIBUTE_DATA now{};
  ASSERT_TRUE(GetFileAttributesExA(installation.Configuration.c_str(), GetFileExInfoStandard, &now));
  EXPECT_EQ(CompareFileTime(&now.ftLastWriteTime, &past), 0);
}

}  // namespace
