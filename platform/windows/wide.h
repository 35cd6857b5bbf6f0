// Texts as Windows itself keeps them. Where it documents a limit for the ANSI form of a function, or converts at its
// own risk, the program calls the wide one and converts here.
#pragma once

#include <cstddef>
#include <string>
#include <string_view>

namespace platform {

// From any code page of Windows; empty when, with MB_ERR_INVALID_CHARS, a byte of it is no character there.
std::wstring Decode(unsigned codePage, unsigned long flags, std::string_view text);

// From the ANSI code page, as the ANSI form of a function does it.
std::wstring ToWide(std::string_view text);

// The same for what is shown: bytes that are no character of the code page are shown as those of code page 1252, in
// which older catalogues are.
std::wstring ToShown(std::string_view text);

// Whether characters of the ANSI code page can have several bytes.
bool HasLongCharacters();

// How many bytes the first character of a text has, which is not empty.
std::size_t LengthOfFirst(std::string_view text);

// To the ANSI code page. For a character that it lacks stands its letter without an accent, or "?".
std::string ToAnsi(std::wstring_view wide);

// The same for the name of a file, with "?" for all that the code page lacks: a letter that only looks like the one
// meant would name another file.
struct AnsiName {
  std::string Text;
  bool IsExact;  // it converts back to the very name
};
AnsiName NameToAnsi(std::wstring_view wide);

// To UTF-8; half a character becomes the replacement character.
std::string Utf8Of(std::wstring_view wide);

}  // namespace platform
