// Texts as Windows itself keeps them. Where it documents a limit for the ANSI form of a function, or converts at its
// own risk, the program calls the wide one and converts here, exactly as the ANSI form does.
#pragma once

#include <string>
#include <string_view>

namespace platform {

// From the ANSI code page.
std::wstring ToWide(std::string_view text);

// To the ANSI code page. A character that it lacks becomes the one that looks most like it, or "?".
std::string ToAnsi(std::wstring_view wide);

}  // namespace platform
