#include "tests/windows/installation.h"

#include <array>
#include <fstream>
#include <iterator>
#include <sstream>
#include <vector>

#include "tests/windows/driver/waiting.h"

namespace {

constexpr char SettingsKey[] = "Software\\Roms\\Tolvaris";

bool IsDirectory(const std::string& path) {
  const DWORD attributes = GetFileAttributesA(path.c_str());
  return attributes != INVALID_FILE_ATTRIBUTES && (attributes & FILE_ATTRIBUTE_DIRECTORY) != 0;
}

// `directory` ends with a backslash.
void RemoveTree(const std::string& directory) {
  WIN32_FIND_DATAA found{};
  const HANDLE search = FindFirstFileA((directory + "*").c_str(), &found);
  if (search == INVALID_HANDLE_VALUE) return;
  do {
    const std::string name = found.cFileName;
    if (name == "." || name == "..") continue;
    SetFileAttributesA((directory + name).c_str(), FILE_ATTRIBUTE_NORMAL);
    if (IsDirectory(directory + name)) {
      RemoveTree(directory + name + "\\");
    } else {
      DeleteFileA((directory + name).c_str());
    }
  } while (FindNextFileA(search, &found));
  FindClose(search);
  RemoveDirectoryA(directory.c_str());
}

void CopyProgram(const char* from, const std::string& to) {
  ASSERT_TRUE(CopyFileA(from, to.c_str(), FALSE)) << from << ": error " << GetLastError();
}

std::string HostPathOf(const std::wstring& path) {
  using Translate = char*(CDECL*)(const wchar_t*);
  const auto translate = reinterpret_cast<Translate>(
      reinterpret_cast<void*>(GetProcAddress(GetModuleHandleA("kernel32"), "wine_get_unix_file_name")));
  return translate != nullptr ? translate(path.c_str()) : "";
}

// Where Wine looks for the disk in drive A:.
std::string HostDriveA() {
  std::array<wchar_t, MAX_PATH> prefix{};
  GetEnvironmentVariableW(L"WINECONFIGDIR", prefix.data(), MAX_PATH);
  // The variable holds the path as the kernel names it: "\??\Z:\...".
  return HostPathOf(std::wstring(prefix.data()).substr(4) + L"\\dosdevices") + "/a:";
}

}  // namespace

Installation::Installation() {
  // The user's own settings must never be what a test starts by deleting.
  if (GetEnvironmentVariableA("WINECONFIGDIR", nullptr, 0) == 0) {
    ADD_FAILURE() << "these tests replace the user's settings: they run under Wine only, in a prefix of their own";
    std::exit(1);
  }
  RemoveTree(Directory);
  RegDeleteTreeA(HKEY_CURRENT_USER, SettingsKey);
  RegDeleteKeyA(HKEY_CURRENT_USER, SettingsKey);
  CreateDirectoryA(Directory.c_str(), nullptr);
  CopyProgram(TOLVARIS_PROGRAM, Directory + "tolvaris.exe");
}

void Installation::Put(const std::string& name, const std::string& content) const {
  for (size_t end = name.find('\\'); end != std::string::npos; end = name.find('\\', end + 1)) {
    CreateDirectoryA((Directory + name.substr(0, end)).c_str(), nullptr);
  }
  std::ofstream file(Directory + name, std::ios::binary);
  file << content;
  EXPECT_TRUE(file.flush()) << "cannot write " << name;
}

std::string Installation::Content(const std::string& name) const { return ContentOf(Directory + name); }

void Installation::Remove(const std::string& name) const { DeleteFileA((Directory + name).c_str()); }

void Installation::Set(const std::string& setting, const std::string& text) const {
  RegSetKeyValueA(HKEY_CURRENT_USER, SettingsKey, setting.c_str(), REG_SZ, text.c_str(),
                  static_cast<DWORD>(text.size()) + 1);
}

void Installation::Configure() const {
  Put("Emulador\\zsnesw.cfg", "");
  CopyProgram(EMULATOR_STANDIN, Emulator);
  Set("EmuExe", "\\Emulador\\zsnesw.exe");
  Set("EmuCFG", "\\Emulador\\zsnesw.cfg");
  Set("AvisoControle", "2");
  Set("AvisoALTF4", "1");
}

void Installation::PutGames() const {
  Put("tolvaris.dat", "|AGUA=Água Viva||ZEBRA=Zebra||ELAN=Élan||AGUA=Outra||SUMIU=Sumiu|");
  for (const char* file : {"ZEBRA.SMC", "abelha.zip", "agua.smc", "Corrida das Nuvens.smc", "elan.ZIP", "leia.txt"}) {
    Put(std::string("Roms\\") + file, "jogo");
  }
}

std::map<std::string, std::string> Installation::Settings() const {
  std::map<std::string, std::string> settings;
  std::istringstream lines(driver::OutputOf(std::string("reg.exe query HKCU\\") + SettingsKey));
  const std::string type = "    REG_SZ    ";
  for (std::string line; std::getline(lines, line);) {
    const size_t at = line.find(type);
    if (line.compare(0, 4, "    ") != 0 || at == std::string::npos) continue;
    const std::string value = line.substr(at + type.size());
    settings[line.substr(4, at - 4)] = value.substr(0, value.find_last_not_of('\r') + 1);
  }
  return settings;
}

void PrintTo(const Call& call, std::ostream* out) { *out << call.CommandLine << " in " << call.Directory; }

Call NextCall(const std::string& program) {
  const std::string record = program + ".call";
  Call call;
  // The file can be there for a moment before it can be opened: who renamed it still holds it.
  const auto read = [&] {
    std::ifstream file(record, std::ios::binary);
    return std::getline(file, call.CommandLine) && std::getline(file, call.Directory);
  };
  EXPECT_SOON(read()) << " of " << program;
  EXPECT_SOON(DeleteFileA(record.c_str()));
  return call;
}

std::string ContentOf(const std::string& path) {
  std::ifstream file(path, std::ios::binary);
  return {std::istreambuf_iterator<char>(file), {}};
}

Files FilesIn(const std::string& directory) {
  Files files;
  WIN32_FIND_DATAA found{};
  const HANDLE search = FindFirstFileA((directory + "*").c_str(), &found);
  if (search == INVALID_HANDLE_VALUE) return files;
  do {
    if ((found.dwFileAttributes & FILE_ATTRIBUTE_DIRECTORY) != 0) continue;
    files[found.cFileName] = ContentOf(directory + found.cFileName);
  } while (FindNextFileA(search, &found));
  FindClose(search);
  return files;
}

std::string Bytes(unsigned kind, size_t size) {
  std::string bytes;
  for (unsigned i = 0; i < size; ++i) bytes += static_cast<char>(i * (2 * kind + 1) + i / 256);
  return bytes;
}

std::string HostPath(const std::string& path) {
  return HostPathOf(std::wstring(path.begin(), path.end()));  // plain ASCII
}

std::string ShortPath(const std::string& path) {
  std::array<char, MAX_PATH> shortPath{};
  GetShortPathNameA(path.c_str(), shortPath.data(), MAX_PATH);
  return shortPath.data();
}

FloppyDisk::FloppyDisk(const std::string& directory) {
  CreateDirectoryA(directory.c_str(), nullptr);
  driver::StartOnHost("/bin/ln -sfn " + HostPath(directory) + " " + HostDriveA());
  EXPECT_SOON(IsReady());
}

FloppyDisk::~FloppyDisk() {
  driver::StartOnHost("/bin/rm -f " + HostDriveA());
  EXPECT_SOON(!IsReady());
}

bool FloppyDisk::IsReady() { return IsDirectory("a:\\"); }

bool FloppyDisk::IsSmall() {
  ULARGE_INTEGER size{};
  return GetDiskFreeSpaceExA("A:\\", nullptr, &size, nullptr) && size.QuadPart <= 1440 * 1024;
}
