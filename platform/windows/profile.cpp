#include "platform/profile.h"

#include <windows.h>

#include <algorithm>

#include "platform/files.h"
#include "platform/profile_text.h"
#include "platform/text.h"
#include "platform/windows/paths.h"
#include "platform/windows/wide.h"

namespace platform {
namespace {

constexpr UINT Western = 1252;

std::string ContentOf(const std::string& path) {
  File file(path, Access::Read);
  std::string content(static_cast<std::size_t>(std::max<std::int64_t>(file.Size(), 0)), '\0');
  content.resize(static_cast<std::size_t>(std::max<std::int64_t>(file.Read(0, content.data(), content.size()), 0)));
  return content;
}

std::wstring DecodedFile(std::string_view content) {
  constexpr std::string_view mark = "\xEF\xBB\xBF";
  if (content.starts_with(mark)) return Decode(CP_UTF8, 0, content.substr(mark.size()));
  const std::wstring utf8 = Decode(CP_UTF8, MB_ERR_INVALID_CHARS, content);
  return utf8.empty() ? Decode(Western, 0, content) : utf8;
}

}  // namespace

std::string GetPrivateProfileStringA(const std::string& section, const std::string& key,
                                     const std::string& defaultValue, std::size_t bufferSize, const std::string& file) {
  std::string value(bufferSize, '\0');
  if (::GetACP() == Western) {
    value.resize(::GetPrivateProfileStringA(section.c_str(), key.c_str(), defaultValue.c_str(), value.data(),
                                            static_cast<DWORD>(bufferSize), WindowsPath(file)));
    return value;
  }
  // Windows itself would read the file in the code page, and find no key with an accent.
  value = FindProfileValue(ToAnsi(DecodedFile(ContentOf(file))), section, key, CharUpperBuffA).value_or(defaultValue);
  return std::string(WholeCharacters(value, bufferSize == 0 ? 0 : bufferSize - 1));
}

}  // namespace platform
