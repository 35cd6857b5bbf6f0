// What the stand-ins for the other programs have in common: each leaves word of how it was started.
#pragma once

#include <windows.h>

#include <array>
#include <cstdio>
#include <string>

namespace standins {

inline std::string OwnPath() {
  std::array<char, MAX_PATH> path{};
  GetModuleFileNameA(nullptr, path.data(), MAX_PATH);
  return path.data();
}

// Writes the command line and the current directory, a line each, to the program's own path + ".call". The file
// appears whole, by a rename.
inline void RecordCall() {
  std::array<char, MAX_PATH> directory{};
  GetCurrentDirectoryA(MAX_PATH, directory.data());
  const std::string unfinished = OwnPath() + ".part";
  std::FILE* file = std::fopen(unfinished.c_str(), "wb");
  if (file == nullptr) return;
  std::fprintf(file, "%s\n%s\n", GetCommandLineA(), directory.data());
  std::fclose(file);
  MoveFileExA(unfinished.c_str(), (OwnPath() + ".call").c_str(), MOVEFILE_REPLACE_EXISTING);
}

}  // namespace standins
