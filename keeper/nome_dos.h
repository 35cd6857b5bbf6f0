// DOS names for games that have none: saved games go by them, so the same file always gets the same one.
#pragma once

#include <optional>
#include <string>

// A base name of 1 to 8 characters that a DOS name may have stays, in upper case. Any other becomes up to four of its
// letters and digits and the first 20 bits of the SHA-256 of the name, in UTF-8, as four digits of RFC 4648's base 32.
// Nothing when the system gives no SHA-256.
std::optional<std::string> FazerNomeDOS(const std::string& NomeBase);
