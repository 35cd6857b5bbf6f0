// Texts of the platform: in the system's ANSI code page. In 1252 a character is one byte; in others it may be several.
#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>
#include <utility>

namespace platform {

// The text converted from UTF-8. A letter that the code page lacks loses its accent; what else it lacks becomes "?".
std::string FromUtf8(std::string_view utf8);

// The text converted to UTF-8.
std::string ToUtf8(std::string_view text);

// The text converted from UTF-8; nothing when the code page lacks one of its characters, or it is no UTF-8.
inline std::optional<std::string> FromUtf8Exactly(std::string_view utf8) {
  std::string text = FromUtf8(utf8);
  return ToUtf8(text) == utf8 ? std::optional(std::move(text)) : std::nullopt;
}

// The text in upper case by the rules of the user's language. The length stays the same.
std::string CharUpperBuffA(std::string text);

// Whether a character begins at this position of the text. Those of code page 1252 have one byte each; in others one
// may have several, the later ones of which may equal plain characters.
bool CharacterBeginsAt(std::string_view text, std::size_t position);

// The longest beginning of the text that has at most so many bytes and no half character at its end.
inline std::string_view WholeCharacters(std::string_view text, std::size_t most) {
  if (text.size() <= most) return text;
  while (most > 0 && !CharacterBeginsAt(text, most)) --most;
  return text.substr(0, most);
}

// Compares as a sorted list box does: by the user's language, without regard to letter case.
// Negative, zero or positive, as `left` sorts before, with or after `right`.
int CompareStringA(std::string_view left, std::string_view right);

}  // namespace platform

// A literal of a source file (UTF-8), in the ANSI code page: "Não"_ansi.
inline std::string operator""_ansi(const char* utf8, std::size_t length) { return platform::FromUtf8({utf8, length}); }
