#include "platform/windows/wide.h"

#include <windows.h>

namespace platform {

// No character is longer in UTF-16 than in an ANSI code page.
std::wstring ToWide(std::string_view text) {
  if (text.empty()) return {};
  const int length = static_cast<int>(text.size());
  std::wstring wide(text.size(), L'\0');
  wide.resize(static_cast<std::size_t>(::MultiByteToWideChar(CP_ACP, 0, text.data(), length, wide.data(), length)));
  return wide;
}

std::string ToAnsi(std::wstring_view wide) {
  if (wide.empty()) return {};
  const int length = static_cast<int>(wide.size());
  const auto convert = [&](char* buffer, int room) {
    return ::WideCharToMultiByte(CP_ACP, 0, wide.data(), length, buffer, room, nullptr, nullptr);
  };
  std::string text(static_cast<std::size_t>(convert(nullptr, 0)), '\0');
  convert(text.data(), static_cast<int>(text.size()));
  return text;
}

}  // namespace platform
