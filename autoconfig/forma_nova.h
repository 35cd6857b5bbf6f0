// The configuration file of emulators from version 1.50 on: lines of key, "=" and value without blanks between them, a
// text in double quotes with its backslashes doubled.
#pragma once

#include <optional>
#include <string>
#include <string_view>

// Whether the text is of that form: a line of it sets ROMPath or SRAMPath.
bool FormaNova(std::string_view Texto);

// The text with ROMPath naming the directory of the games and SRAMPath that of the saves, every other byte as it was;
// nothing when both do already, in any letter case. A key that is missing is added at the end.
std::optional<std::string> ComDiretorios(std::string_view Texto, const std::string& Roms, const std::string& Saves);
