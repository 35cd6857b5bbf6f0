// Stands in for the programs that Tolvaris starts: writes the settings that a file beside it lists, one name=value a
// line, leaves word of how it was started, and ends.
#include <windows.h>

#include <array>
#include <cstdio>
#include <fstream>
#include <string>

int WINAPI WinMain(HINSTANCE, HINSTANCE, LPSTR, int) {
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
  MoveFileExA((program + ".part").c_str(), (program + ".call").c_str(), MOVEFILE_REPLACE_EXISTING);
  return 0;
}
