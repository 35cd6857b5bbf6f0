// Stands in for the auto-configuration program: writes the settings that the file beside it lists, one name=value a
// line, and ends.
#include <fstream>

#include "tests/windows/standins/recording.h"

int WINAPI WinMain(HINSTANCE, HINSTANCE, LPSTR, int) {
  std::ifstream settings(standins::OwnPath() + ".settings");
  for (std::string line; std::getline(settings, line);) {
    const size_t equals = line.find('=');
    if (equals == std::string::npos) continue;
    const std::string value = line.substr(equals + 1);
    RegSetKeyValueA(HKEY_CURRENT_USER, "Software\\Roms\\Tolvaris", line.substr(0, equals).c_str(), REG_SZ,
                    value.c_str(), static_cast<DWORD>(value.size()) + 1);
  }
  standins::RecordCall();
  return 0;
}
