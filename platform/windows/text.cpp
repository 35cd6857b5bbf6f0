#include "platform/text.h"

#include <windows.h>

namespace platform {
namespace {

std::wstring WideFromUtf8(std::string_view utf8) {
  const int length = static_cast<int>(utf8.size());
  std::wstring wide(utf8.size(), L'\0');  // no character is longer in UTF-16 than in UTF-8
  const int converted = ::MultiByteToWideChar(CP_UTF8, 0, utf8.data(), length, wide.data(), length);
  wide.resize(static_cast<std::size_t>(converted));
  return wide;
}

// The pointer of an empty view may be null, which Windows takes for an error.
const char* Pointer(std::string_view text) { return text.empty() ? "" : text.data(); }

}  // namespace

std::string FromUtf8(std::string_view utf8) {
  if (utf8.empty() || ::GetACP() == CP_UTF8) return std::string(utf8);
  const std::wstring wide = WideFromUtf8(utf8);
  const int length = static_cast<int>(wide.size());
  // Without "best fits": a letter that only looks like the one meant would name another file.
  const auto convert = [&](char* buffer, int room) {
    return ::WideCharToMultiByte(CP_ACP, WC_NO_BEST_FIT_CHARS, wide.data(), length, buffer, room, "?", nullptr);
  };
  std::string text(static_cast<std::size_t>(convert(nullptr, 0)), '\0');
  convert(text.data(), static_cast<int>(text.size()));
  return text;
}

std::string CharUpperBuffA(std::string text) {
  ::CharUpperBuffA(text.data(), static_cast<DWORD>(text.size()));
  return text;
}

int CompareStringA(std::string_view left, std::string_view right) {
  const int result = ::CompareStringA(LOCALE_USER_DEFAULT, NORM_IGNORECASE, Pointer(left),
                                      static_cast<int>(left.size()), Pointer(right), static_cast<int>(right.size()));
  return result == 0 ? left.compare(right) : result - CSTR_EQUAL;
}

}  // namespace platform
