// From what is downloaded to a game that runs, and back: the installer and the zip on a machine that never saw either.
#include <functional>

#include "tests/windows/installation.h"
#include "tests/windows/main_window.h"

namespace {

using driver::Answer;
using driver::Message;
using driver::Program;
using driver::Window;

constexpr char Uninstall[] = "Software\\Microsoft\\Windows\\CurrentVersion\\Uninstall\\Tolvaris";
constexpr char Settings[] = "Software\\Roms\\Tolvaris";
constexpr char Emulator[] = "C:\\Program Files\\Emulador ZSNES\\zsnesw.exe";
constexpr char Game[] = "Roms\\Corrida das Nuvens.smc";

// A text of the user's registry; the empty text when it is missing.
std::string Registered(const char* key, const char* name) {
  std::string text(1024, '\0');
  DWORD size = static_cast<DWORD>(text.size());
  if (RegGetValueA(HKEY_CURRENT_USER, key, name, RRF_RT_REG_SZ, nullptr, text.data(), &size) != ERROR_SUCCESS) return {};
  return text.c_str();
}

// The names in a directory, those in directories of it with their path; empty ones end with a backslash.
std::vector<std::string> Files(const std::string& directory, const std::string& prefix = "") {
  std::vector<std::string> files;
  WIN32_FIND_DATAA found{};
  const HANDLE search = FindFirstFileA((directory + prefix + "*").c_str(), &found);
  if (search == INVALID_HANDLE_VALUE) return files;
  do {
    const std::string name = prefix + found.cFileName;
    if (found.cFileName == std::string(".") || found.cFileName == std::string("..")) continue;
    std::vector<std::string> inside = {name};
    if ((found.dwFileAttributes & FILE_ATTRIBUTE_DIRECTORY) != 0) {
      inside = Files(directory, name + "\\");
      if (inside.empty()) inside = {name + "\\"};
    }
    files.insert(files.end(), inside.begin(), inside.end());
  } while (FindNextFileA(search, &found));
  FindClose(search);
  std::sort(files.begin(), files.end());
  return files;
}

std::string Folder(const char* variable) {
  std::array<char, MAX_PATH> folder{};
  GetEnvironmentVariableA(variable, folder.data(), MAX_PATH);
  return folder.data();
}

// Where the start menu has its entry.
std::string Shortcut() {
  return Folder("APPDATA") + "\\Microsoft\\Windows\\Start Menu\\Programs\\Tolvaris.lnk";
}

// Runs an installer or uninstaller to its end.
void RunSilently(const std::string& commandLine) {
  const Program program(commandLine);
  ASSERT_SOON(program.HasEnded()) << commandLine;
}

// The uninstaller goes on as a copy of itself after its own end. It lets what was installed be until the last of it.
void UninstallFrom(const std::string& directory) {
  STARTUPINFOA how{};
  how.cb = sizeof how;
  PROCESS_INFORMATION process{};
  std::string commandLine = Registered(Uninstall, "QuietUninstallString");
  EXPECT_EQ(commandLine, "\"" + directory + "desinstalar.exe\" /S");
  ASSERT_TRUE(CreateProcessA(nullptr, commandLine.data(), nullptr, nullptr, FALSE, 0, nullptr, "C:\\", &how, &process));
  CloseHandle(process.hThread);
  CloseHandle(process.hProcess);
}

// What a person sees from the first start to the first game.
struct Words {
  std::string Configuration, Save, Controller, Close, Play, Information;
};
const Words Portuguese = {"Configuração do Tolvaris", "&Gravar", "Controle", "&Fechar", "Jogar", "Informação"};
const Words English = {"Tolvaris configuration", "&Save", "Controller", "&Close", "Play", "Information"};

class Release : public testing::Test {
 protected:
  Release() {
    RegDeleteTreeA(HKEY_CURRENT_USER, Settings);
    CreateDirectoryA("C:\\Program Files\\Emulador ZSNES", nullptr);
    EXPECT_TRUE(CopyFileA(EMULATOR_STANDIN, Emulator, FALSE));
  }

  // The auto-configuration program finds the emulator by itself and saves it.
  static void Configure(const Program& program, const Words& words) {
    EXPECT_EQ(Answer(program, IDYES).Buttons, (std::vector<int>{IDYES, IDNO, IDCANCEL}));
    Window configuration;
    ASSERT_SOON(configuration = Window(FindWindowA(nullptr, words.Configuration.c_str())));
    const Window save = configuration.Child(words.Save);
    EXPECT_SOON_EQ(std::vector<std::string>{Emulator}, Entries(configuration.ChildAt(120, 375)));
    ASSERT_SOON(save.Enabled());
    save.Click();
    EXPECT_SOON(!configuration);
  }

  // The first start in a directory with one game, and that game.
  static void PlayFirstGame(const std::string& directory, const Words& words) {
    CreateDirectoryA((directory + "Roms").c_str(), nullptr);
    ASSERT_TRUE(CopyFileA(EMULATOR_STANDIN, (directory + Game).c_str(), FALSE)) << directory;
    const Program program(directory + "tolvaris.exe");
    Configure(program, words);
    EXPECT_EQ(Answer(program, IDOK).Title, words.Information);
    driver::FindVisible(program, words.Controller).Child(words.Close).Click();
    const MainWindow window(program);
    EXPECT_EQ(window.Play.Text(), words.Play);
    EXPECT_EQ(Entries(window.List), std::vector<std::string>{"Corrida das Nuvens"});
    ClickEntry(window.List, "Corrida das Nuvens");
    ASSERT_SOON(window.Play.Enabled());
    window.Play.Click();
    EXPECT_EQ(Answer(program, IDOK).Title, words.Information);

    // Without quotes, so that no path in it may have blanks.
    const std::string emulator = ShortPath(Emulator);
    EXPECT_EQ(emulator.find(' '), std::string::npos);
    const Call expected = {emulator + " " + ShortPath(directory + Game),
                           emulator.substr(0, emulator.rfind('\\'))};
    EXPECT_EQ(NextCall(Emulator), expected);
    window.Window.CloseByUser();
    EXPECT_SOON(program.HasEnded());
  }
};

TEST_F(Release, InstalledPlayedAndRemovedAgain) {
  const std::string directory = Folder("LOCALAPPDATA") + "\\Programs\\Tolvaris\\";
  RunSilently(std::string(INSTALLER) + " /S");
  const std::vector<std::string> installed = {"CHANGELOG.txt", "LEIAME.txt", "desinstalar.exe", "tolvaris.exe",
                                              "tolvariscfg.exe"};
  ASSERT_EQ(Files(directory), installed);
  EXPECT_EQ(Registered(Uninstall, "DisplayName"), "Tolvaris");
  EXPECT_EQ(Registered(Uninstall, "InstallLocation") + "\\", directory);
  EXPECT_FALSE(ContentOf(Shortcut()).empty());

  PlayFirstGame(directory, Portuguese);
  const std::vector<std::string> own = {"Imgs\\", Game, "Saves\\", "tolvaris.dat"};
  {
    const Program program(directory + "tolvaris.exe");
    const MainWindow window(program);
    UninstallFrom(directory);
    UninstallFrom(directory);
  }
}

}  // namespace
