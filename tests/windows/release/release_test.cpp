// From what is downloaded to a game that runs, and back: the installer and the zip on a machine that never saw either.
#include <array>
#include <cstdlib>

#include "tests/windows/files.h"
#include "tests/windows/messages.h"
#include "tests/windows/program_windows.h"

namespace {

constexpr char UninstallKey[] = "Software\\Microsoft\\Windows\\CurrentVersion\\Uninstall\\Tolvaris";
constexpr char SettingsKey[] = "Software\\Roms\\Tolvaris";
constexpr char Downloaded[] = "C:\\setup.exe";
constexpr char Emulator[] = "C:\\Program Files\\Emulador ZSNES\\zsnesw.exe";
constexpr char Game[] = "Roms\\Corrida das Nuvens.smc";

// A text of the user's registry; the empty text when it is missing.
std::string Registered(const char* key, const char* name) {
  std::array<char, 1024> text{};
  DWORD size = static_cast<DWORD>(text.size());
  RegGetValueA(HKEY_CURRENT_USER, key, name, RRF_RT_REG_SZ, nullptr, text.data(), &size);
  return text.data();
}

std::vector<std::string> NamesIn(const std::string& directory) {
  std::vector<std::string> names;
  for (const auto& [name, content] : FilesIn(directory)) names.push_back(name);
  return names;
}

std::string Shortcut() {
  return std::string(std::getenv("APPDATA")) + "\\Microsoft\\Windows\\Start Menu\\Programs\\Tolvaris.lnk";
}

void RunToItsEnd(const std::string& commandLine) {
  const Program program(commandLine);
  EXPECT_SOON(program.HasEnded()) << commandLine;
}

// As the list of installed programs does it; the uninstaller goes on as a copy of itself.
void Uninstall() {
  const Program program(Registered(UninstallKey, "QuietUninstallString"));
  EXPECT_SOON(Registered(UninstallKey, "DisplayName").empty());
  EXPECT_EQ(ContentOf(Shortcut()), "");
}

// As a person does it who wants nothing to stay. It goes in place, as one program, and so cannot delete itself.
void UninstallWithTheSettings(const std::string& directory) {
  const Program program(directory + "desinstalar.exe _?=" + directory.substr(0, directory.size() - 1));
  const auto button = [&](int id) { return Window(GetDlgItem(FindMessage(program).Handle(), id)); };
  ASSERT_SOON(button(IDOK).Visible());
  button(IDOK).Click();
  ASSERT_SOON(button(IDYES));
  EXPECT_EQ(Answer(program, IDYES).Buttons, (std::vector<int>{IDYES, IDNO}));
  ASSERT_SOON(button(IDOK).Enabled());
  button(IDOK).Click();
  EXPECT_SOON(program.HasEnded());
}

// The person is told what hinders, and gives up.
void RefuseWriteProtected(const std::string& directory) {
  const std::string file = directory + "tolvaris.exe";
  SetFileAttributesA(file.c_str(), FILE_ATTRIBUTE_READONLY);
  const Program program("\"" + directory + "desinstalar.exe\" _?=" + directory.substr(0, directory.size() - 1));
  const auto button = [&](int id) { return Window(GetDlgItem(FindMessage(program).Handle(), id)); };
  ASSERT_SOON(button(IDOK).Visible());
  button(IDOK).Click();
  ASSERT_SOON(button(IDRETRY));
  const std::string told = Answer(program, IDCANCEL).Text;
  EXPECT_TRUE(told.starts_with("This file is write-protected.")) << told;
  EXPECT_TRUE(told.ends_with(file)) << told;
  SetFileAttributesA(file.c_str(), FILE_ATTRIBUTE_NORMAL);
}

// What a person reads from the first start to the first game.
struct Words {
  std::string Configuration, Frame, Save, Controller, Close, Play, Information;
};
const Words Portuguese = {
    "Configuração do Tolvaris",          " Configuração ", "&Gravar", "Controle", "&Fechar", "Jogar",
    TitleOf(Mensagem::GuardeOsComandos),
};
const Words English = {
    "Tolvaris configuration", "Configuration", "&Save", "Controller", "&Close", "Play", "Information"};

class Release : public testing::Test {
 protected:
  Release() {
    RegDeleteTreeA(HKEY_CURRENT_USER, SettingsKey);
    PutFile(Emulator, ContentOf(STANDIN));
    EXPECT_TRUE(CopyFileA(INSTALLER, Downloaded, FALSE)) << INSTALLER << " could not be built: is nsis installed?";
  }

  // The auto-configuration program finds the emulator by itself.
  static void Configure(const Program& program, const Words& words) {
    EXPECT_EQ(Answer(program, IDYES).Buttons, (std::vector<int>{IDYES, IDNO, IDCANCEL}));
    Window window;
    ASSERT_SOON(window = Window(FindWindowA(nullptr, words.Configuration.c_str())));
    EXPECT_SOON(window.Child(words.Frame));
    EXPECT_SOON_EQ(std::vector<std::string>{Emulator}, Entries(window.ChildAt(120, 375)));
    const Window save = window.Child(words.Save);
    ASSERT_SOON(save.Enabled());
    save.Click();
    EXPECT_SOON(!window);
  }

  // The first start in a directory, and the game that it holds.
  static void PlayFirstGame(const std::string& directory, const Words& words) {
    PutFile(directory + Game, "jogo");
    const Program program(directory + "tolvaris.exe");
    Configure(program, words);
    EXPECT_EQ(Answer(program, IDOK).Title, words.Information);
    FindVisible(program, words.Controller).Child(words.Close).Click();
    const MainWindow window(program);
    EXPECT_EQ(window.Play.Text(), words.Play);
    EXPECT_EQ(Entries(window.List), std::vector<std::string>{"Corrida das Nuvens"});
    ClickEntry(window.List, "Corrida das Nuvens");
    ASSERT_SOON(window.Play.Enabled());
    window.Play.Click();
    EXPECT_EQ(Answer(program, IDOK).Title, words.Information);

    const std::string emulator = Emulator;
    const Call expected = {'"' + emulator + "\" " + ShortPath(directory + Game),
                           emulator.substr(0, emulator.rfind('\\'))};
    EXPECT_EQ(NextCall(Emulator), expected);
    window.CloseByUser();
    EXPECT_SOON(program.HasEnded());
  }
};

TEST_F(Release, InstalledForOneUserPlayedAndUninstalled) {
  const std::string directory = std::string(std::getenv("LOCALAPPDATA")) + "\\Programs\\Tolvaris\\";
  RunToItsEnd(std::string(Downloaded) + " /S");
  const std::vector<std::string> installed = {"CHANGELOG.txt", "LEIAME.txt", "desinstalar.exe", "tolvaris.exe",
                                              "tolvariscfg.exe"};
  ASSERT_EQ(NamesIn(directory), installed);
  EXPECT_EQ(Registered(UninstallKey, "InstallLocation") + "\\", directory);
  EXPECT_EQ(Registered(UninstallKey, "Publisher"), "Tolvaris");
  EXPECT_NE(ContentOf(Shortcut()), "");
  PlayFirstGame(directory, Portuguese);
  {
    const Program program(directory + "tolvaris.exe");
    const MainWindow window(program);
    const std::vector<std::string> before = NamesIn(directory);
    RunToItsEnd("\"" + directory + "desinstalar.exe\" /S _?=" + directory.substr(0, directory.size() - 1));
    EXPECT_EQ(NamesIn(directory), before) << "nothing goes while the program is open";
  }
  RefuseWriteProtected(directory);
  PutFile(directory + "Imgs\\Corrida das Nuvens.gif", "figura");
  PutFile(directory + "language.ini", "[TOLVARIS20]\r\n");
  Uninstall();
  const std::vector<std::string> left = {"Imgs\\Corrida das Nuvens.gif", Game, "language.ini", "tolvaris.dat"};
  EXPECT_SOON_EQ(left, NamesIn(directory));
  EXPECT_EQ(Registered(SettingsKey, "LRom"), "Corrida das Nuvens");
}

TEST_F(Release, InstalledInEnglishWhereThePersonLikes) {
  const std::string directory = "C:\\Área de Jogos\\";
  PutFile(directory + "language.ini", "[TOLVARIS20]\r\nJogar=Jugar\r\n");
  RunToItsEnd(std::string(Downloaded) + " /S /INGLES /TVK /D=C:\\Área de Jogos");
  PlayFirstGame(directory, English);
  RunToItsEnd(std::string(Downloaded) + " /S");  // once more, over it
  const std::vector<std::string> installed = {"CHANGELOG.txt",
                                              "Imgs\\",
                                              "LEIAME-tvk.txt",
                                              "LEIAME.txt",
                                              Game,
                                              "Saves\\",
                                              "desinstalar.exe",
                                              "language.antes1.ini",
                                              "language.ini",
                                              "tolvaris.dat",
                                              "tolvaris.exe",
                                              "tolvariscfg.exe",
                                              "tvk.exe"};
  EXPECT_EQ(NamesIn(directory), installed);
  UninstallWithTheSettings(directory);
  const std::vector<std::string> left = {Game, "desinstalar.exe", "language.antes1.ini", "tolvaris.dat"};
  EXPECT_EQ(NamesIn(directory), left);
  EXPECT_EQ(Registered(SettingsKey, "LRom"), "");
}

// Unpacked before the tests run.
TEST_F(Release, Unzipped) {
  const std::string directory = "C:\\Jogos do João\\Tolvaris\\";
  const std::vector<std::string> unpacked = {"CHANGELOG.txt", "LEIAME-tvk.txt",  "LEIAME.txt",
                                             "tolvaris.exe",  "tolvariscfg.exe", "translation\\language.ini",
                                             "tvk.exe"};
  EXPECT_EQ(NamesIn(directory), unpacked);
  PlayFirstGame(directory, Portuguese);
}

}  // namespace
