#include "tests/windows/installation.h"

#include <cstdio>
#include <filesystem>

namespace {

constexpr char SettingsKey[] = "Software\\Roms\\Tolvaris";
constexpr char Disk[] = "C:\\Disquete1440\\Disco";  // where drive A: points to

}  // namespace

Installation::Installation() {
  // The user's own settings must never be what a test starts by deleting.
  if (GetEnvironmentVariableA("WINECONFIGDIR", nullptr, 0) == 0) {
    ADD_FAILURE() << "these tests replace the user's settings: they run under Wine only, in a prefix of their own";
    std::exit(1);
  }
  for (const std::string& directory : {Home, Outside}) std::filesystem::remove_all(directory);
  RemoveSettings();
  PutFile(Outside + "leia.txt", "texto");
  Put("tolvaris.exe", ContentOf(TOLVARIS_PROGRAM));
  Put("tolvaris.dat", "|AGUA=Água Viva||ZEBRA=Zebra||ELAN=Élan||AGUA=Outra||SUMIU=Sumiu|");
  for (const char* file : {"ZEBRA.SMC", "abelha.zip", "agua.smc", "Corrida das Nuvens.smc", "elan.ZIP", "leia.txt"}) {
    Put(std::string("Roms\\") + file, "jogo");
  }
  Put("Emulador\\zsnesw.cfg", "");
  PutStandIn("Emulador\\zsnesw.exe");
  Set("EmuExe", "\\Emulador\\zsnesw.exe");
  Set("EmuCFG", "\\Emulador\\zsnesw.cfg");
  Set("AvisoControle", "2");
  Set("AvisoALTF4", "1");
}

void Installation::PutStandIn(const std::string& name) { Put(name, ContentOf(STANDIN)); }

void Installation::Set(const std::string& setting, const std::string& text) {
  RegSetKeyValueA(HKEY_CURRENT_USER, SettingsKey, setting.c_str(), REG_SZ, text.c_str(),
                  static_cast<DWORD>(text.size()) + 1);
}

void Installation::RemoveSettings() { RegDeleteTreeA(HKEY_CURRENT_USER, SettingsKey); }

std::map<std::string, std::string> Installation::Settings() {
  std::map<std::string, std::string> settings;
  const std::string type = "    REG_SZ    ";
  const std::string key = std::string("HKEY_CURRENT_USER\\") + SettingsKey + "    ";
  for (const std::string& line : Registry(std::string("HKCU\\") + SettingsKey)) {
    const size_t at = line.find(type);
    if (at != std::string::npos) settings[line.substr(key.size(), at - key.size())] = line.substr(at + type.size());
  }
  return settings;
}

void Installation::Run() { program.emplace(Home + "tolvaris.exe"); }

void Installation::Start() {
  Run();
  window.emplace(*program);
}

void Installation::Select(const std::string& game) const {
  ClickEntry(window->List, game);
  EXPECT_SOON(window->Pictures[Export].Enabled());
  EXPECT_SOON(window->Pictures[Delete].Enabled());
}

void Installation::Choose(Command command, const std::string& path) const {
  Click(command);
  FileDialog(*program).Enter(path);
}

void Installation::ExpectQuietEnd() const {
  EXPECT_SOON(window->Pictures[Import].Enabled());
  EXPECT_FALSE(FindMessage(*program));
  EXPECT_FALSE(window->Pictures[Export].Enabled());
  EXPECT_FALSE(window->Pictures[Delete].Enabled());
}

void Installation::ExpectPlayed(const std::string& rom) {
  EXPECT_EQ(NextCall(Emulator), (Call{Emulator + " " + ShortPath(Home + "Roms\\" + rom), "C:\\Ensaio\\Emulador"}));
}

std::set<std::string> Registry(const std::string& key) {
  std::string output;
  std::FILE* const tool = _popen(("reg.exe query " + key + " /s").c_str(), "rb");
  for (int letter; (letter = std::fgetc(tool)) != EOF;) output += static_cast<char>(letter);
  _pclose(tool);
  OemToCharBuffA(output.data(), output.data(), static_cast<DWORD>(output.size()));
  std::set<std::string> lines;
  std::string current;
  for (size_t start = 0, end = 0; (end = output.find("\r\n", start)) != std::string::npos; start = end + 2) {
    const std::string line = output.substr(start, end - start);
    if (line.starts_with("HKEY_")) current = line;
    if (!line.empty()) lines.insert(line == current ? line : current + line);
  }
  return lines;
}

FloppyDisk::FloppyDisk() {
  std::filesystem::create_directories(Disk);
  EXPECT_SOON(GetFileAttributesA("A:\\") != INVALID_FILE_ATTRIBUTES) << "\ndrive A: does not point to " << Disk;
}

FloppyDisk::~FloppyDisk() { std::filesystem::remove_all(Disk); }

bool FloppyDisk::IsSmall() {
  ULARGE_INTEGER size{};
  return GetDiskFreeSpaceExA("A:\\", nullptr, &size, nullptr) && size.QuadPart <= 1440 * 1024;
}
