#include "platform/profile.h"

#include <windows.h>

#include "platform/windows/paths.h"

namespace platform {

std::string GetPrivateProfileStringA(const std::string& section, const std::string& key,
                                     const std::string& defaultValue, std::size_t bufferSize, const std::string& file) {
  std::string value(bufferSize, '\0');
  value.resize(::GetPrivateProfileStringA(section.c_str(), key.c_str(), defaultValue.c_str(), value.data(),
                                          static_cast<DWORD>(bufferSize), WindowsPath(file)));
  return value;
}

}  // namespace platform
