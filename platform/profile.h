// Initialisation files: sections in brackets, one key=value a line.
#pragma once

#include <cstddef>
#include <string>

namespace platform {

// The value of a key, at most `bufferSize` - 1 bytes of it and no half character, or `defaultValue` when the file, the
// section or the key is missing. Section and key match without regard to letter case; blanks around key and value are
// dropped, and one pair of quotes around the value. Under code page 1252 the file is in it; under another one, where
// the file came from elsewhere, it is in UTF-8 when it has that one's mark or can be read as it, else in 1252.
std::string GetPrivateProfileStringA(const std::string& section, const std::string& key,
                                     const std::string& defaultValue, std::size_t bufferSize, const std::string& file);

}  // namespace platform
