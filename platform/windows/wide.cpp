#include "platform/windows/wide.h"

#include <windows.h>

#include <algorithm>
#include <utility>

#include "platform/letters.h"
#include "platform/text.h"

namespace platform {
namespace {

// What the code page lacks becomes a character of Windows' choice, which never looks like the one meant.
std::string Encode(std::wstring_view wide) {
  const DWORD flags = ::GetACP() == CP_UTF8 ? 0 : WC_NO_BEST_FIT_CHARS;  // the only one that UTF-8 can do without
  const int length = static_cast<int>(wide.size());
  const auto convert = [&](char* buffer, int room) {
    return ::WideCharToMultiByte(CP_ACP, flags, wide.data(), length, buffer, room, nullptr, nullptr);
  };
  std::string text(static_cast<std::size_t>(wide.empty() ? 0 : convert(nullptr, 0)), '\0');
  convert(text.data(), static_cast<int>(text.size()));
  return text;
}

// Every ANSI code page has the characters of ASCII, at their places.
bool IsAscii(std::wstring_view wide) {
  return std::all_of(wide.begin(), wide.end(), [](wchar_t unit) { return unit < 0x80; });
}

AnsiName Convert(std::wstring_view wide, char (*missing)(char32_t)) {
  if (IsAscii(wide)) return {std::string(wide.begin(), wide.end()), true};
  std::string text = Encode(wide);
  if (ToWide(text) == wide) return {std::move(text), true};
  text.clear();
  while (!wide.empty()) {
    const bool pair = wide.size() > 1 && IS_SURROGATE_PAIR(wide[0], wide[1]);
    const std::wstring_view character = wide.substr(0, pair ? 2 : 1);
    const std::string converted = Encode(character);
    text += ToWide(converted) == character ? converted : std::string(1, missing(wide[0]));
    wide.remove_prefix(character.size());
  }
  return {std::move(text), false};
}

}  // namespace

// No character is longer in UTF-16 than in another code page.
std::wstring Decode(unsigned codePage, unsigned long flags, std::string_view text) {
  const int length = static_cast<int>(text.size());
  std::wstring wide(text.size(), L'\0');
  wide.resize(static_cast<std::size_t>(
      text.empty() ? 0 : ::MultiByteToWideChar(codePage, flags, text.data(), length, wide.data(), length)));
  return wide;
}

bool HasLongCharacters() {
  static const bool has = [] {
    CPINFO page = {};
    return ::GetCPInfo(CP_ACP, &page) && page.MaxCharSize > 1;
  }();
  return has;
}

std::size_t LengthOfFirst(std::string_view text) {
  if (!HasLongCharacters()) return 1;
  if (::GetACP() != CP_UTF8) return text.size() > 1 && ::IsDBCSLeadByte(static_cast<BYTE>(text[0])) ? 2 : 1;
  constexpr std::size_t longest = 4;
  std::size_t length = 1;
  while (length < std::min(text.size(), longest) && !CharacterBeginsAt(text, length)) ++length;
  return length;
}

std::wstring ToWide(std::string_view text) { return Decode(CP_ACP, 0, text); }

std::wstring ToShown(std::string_view text) {
  constexpr UINT older = 1252;
  std::wstring wide = Decode(CP_ACP, MB_ERR_INVALID_CHARS, text);
  if (!wide.empty()) return wide;
  while (!text.empty()) {
    std::string_view character = text.substr(0, LengthOfFirst(text));
    std::wstring decoded = Decode(CP_ACP, MB_ERR_INVALID_CHARS, character);
    if (decoded.empty()) {
      character = text.substr(0, 1);
      decoded = Decode(older, 0, character);
    }
    wide += decoded;
    text.remove_prefix(character.size());
  }
  return wide;
}

std::string ToAnsi(std::wstring_view wide) { return Convert(wide, WithoutAccent).Text; }

AnsiName NameToAnsi(std::wstring_view wide) {
  return Convert(wide, [](char32_t) { return '?'; });
}

std::string Utf8Of(std::wstring_view wide) {
  if (wide.empty()) return {};
  const int length = static_cast<int>(wide.size());
  std::string utf8(3 * wide.size(), '\0');  // the most that a unit of UTF-16 takes
  const int room = static_cast<int>(utf8.size());
  const int converted = ::WideCharToMultiByte(CP_UTF8, 0, wide.data(), length, utf8.data(), room, nullptr, nullptr);
  utf8.resize(static_cast<std::size_t>(converted));
  return utf8;
}

}  // namespace platform
