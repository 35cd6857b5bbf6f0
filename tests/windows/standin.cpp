// Stands in for the programs that Tolvaris starts: writes the settings that a file beside it lists, one name=value a
// line, leaves word of how it was started, and ends. Where a test waits for a download it goes on as the downloader:
// it sleeps until it is woken, adds a game with its catalogue entry, and gives the window back by the handle of its
// command line.
#include <windows.h>

#include <array>
#include <cstdlib>
#include <fstream>
#include <string>

namespace {

// Opened for nobody else: the program has closed its catalogue.
void Append(const std::string& path, const std::string& text) {
  const HANDLE file = CreateFileA(path.c_str(), FILE_APPEND_DATA, 0, nullptr, OPEN_ALWAYS, 0, nullptr);
  DWORD written = 0;
  WriteFile(file, text.data(), static_cast<DWORD>(text.size()), &written, nullptr);
  CloseHandle(file);
}

void Download(HANDLE wake, const std::string& directory, const char* arguments) {
  if (WaitForSingleObject(wake, 60'000) != WAIT_OBJECT_0) return;
  Append(directory + "Roms\\NOVO.zip", "jogo");
  Append(directory + "tolvaris.dat", "|NOVO=Nave Nova|");
  EnableWindow(reinterpret_cast<HWND>(std::strtoll(arguments, nullptr, 10)), TRUE);
}

}  // namespace

int WINAPI WinMain(HINSTANCE, HINSTANCE, LPSTR arguments, int) {
  std::array<char, MAX_PATH> path{};
  std::array<char, MAX_PATH> directory{};
  GetModuleFileNameA(nullptr, path.data(), MAX_PATH);
  GetCurrentDirectoryA(MAX_PATH, directory.data());
  const std::string program = path.data();
  std::ifstream settings(program + ".settings");
  for (std::string name, value; std::getline(settings, name, '=') && std::getline(settings, value);) {
    RegSetKeyValueA(HKEY_CURRENT_USER, "Software\\Roms\\Tolvaris", name.c_str(), REG_SZ, value.c_str(),
                    static_cast<DWORD>(value.size()) + 1);
  }
  // Appears whole, by a rename.
  std::ofstream(program + ".part", std::ios::binary) << GetCommandLineA() << '\n' << directory.data() << '\n';
  const HANDLE wake = OpenEventA(SYNCHRONIZE, FALSE, "TolvarisDownload");
  MoveFileExA((program + ".part").c_str(), (program + ".call").c_str(), MOVEFILE_REPLACE_EXISTING);
  if (wake != nullptr) Download(wake, program.substr(0, program.rfind('\\') + 1), arguments);
  return 0;
}
