// Texts of the platform: one byte a character, in the system's ANSI code page.
#pragma once

#include <cstddef>
#include <string>
#include <string_view>

namespace platform {

// The text converted from UTF-8. A character that the code page lacks becomes "?".
std::string FromUtf8(std::string_view utf8);

// The text in upper case by the rules of the user's language. The length stays the same.
std::string CharUpperBuffA(std::string text);

// Compares as a sorted list box does: by the user's language, without regard to letter case.
// Negative, zero or positive, as `left` sorts before, with or after `right`.
int CompareStringA(std::string_view left, std::string_view right);

}  // namespace platform

// A literal of a source file (UTF-8), in the ANSI code page: "Não"_ansi.
inline std::string operator""_ansi(const char* utf8, std::size_t length) { return platform::FromUtf8({utf8, length}); }
