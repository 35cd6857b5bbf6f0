// Disks, drives, and where the program stands on them.
#include <windows.h>

#include "platform/files.h"
#include "platform/text.h"
#include "platform/windows/paths.h"

namespace platform {
namespace {

char CurrentDrive() {
  char directory[MAX_PATH] = "";
  return ::GetCurrentDirectoryA(MAX_PATH, directory) < MAX_PATH ? directory[0] : '\0';
}

}  // namespace

std::optional<DiskFreeSpace> GetDiskFreeSpaceA(const std::string& root) {
  DWORD sectorsPerCluster, bytesPerSector, freeClusters, totalClusters;
  if (!::GetDiskFreeSpaceA(WindowsPath(root), &sectorsPerCluster, &bytesPerSector, &freeClusters, &totalClusters)) {
    return std::nullopt;
  }
  return DiskFreeSpace{sectorsPerCluster, bytesPerSector, freeClusters, totalClusters};
}

std::vector<std::string> FixedDrives() {
  std::vector<std::string> roots;
  const DWORD present = ::GetLogicalDrives();  // a bit for each letter
  for (char letter = 'A'; letter <= 'Z'; ++letter) {
    const std::string root = {letter, ':', '\\'};
    if ((present >> (letter - 'A') & 1) != 0 && ::GetDriveTypeA(WindowsPath(root)) == DRIVE_FIXED)
      roots.push_back(root);
  }
  return roots;
}

// Windows knows one current directory only; that of each other drive stands in the environment variable "=A:".
// Going to the drive and back would move the current drive for a moment, and fail where the way back has vanished.
bool SetDriveDirectory(const std::string& directory) {
  if (directory.size() < 2 || directory[1] != ':') return false;  // names no drive
  const DWORD attributes = ::GetFileAttributesA(WindowsPath(directory));
  if (attributes == INVALID_FILE_ATTRIBUTES || !(attributes & FILE_ATTRIBUTE_DIRECTORY)) return false;
  const std::string drive = CharUpperBuffA(directory.substr(0, 1));
  if (drive == CharUpperBuffA({CurrentDrive()})) return ::SetCurrentDirectoryA(WindowsPath(directory)) != 0;
  return ::SetEnvironmentVariableA(("=" + drive + ":").c_str(), directory.c_str()) != 0;
}

std::string ProgramDirectory() {
  std::string path(MAX_PATH, '\0');
  DWORD length = 0;
  while ((length = ::GetModuleFileNameA(nullptr, path.data(), static_cast<DWORD>(path.size()))) == path.size()) {
    path.resize(2 * path.size());  // a result that fills the whole buffer was cut
  }
  path.resize(length);
  std::size_t backslash = path.rfind('\\');
  while (backslash != std::string::npos && !CharacterBeginsAt(path, backslash))
    backslash = path.rfind('\\', backslash - 1);
  if (backslash == std::string::npos) return "";
  const bool root = backslash == 2 && path[1] == ':';
  return path.substr(0, root ? backslash + 1 : backslash);
}

}  // namespace platform
