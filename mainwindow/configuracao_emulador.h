// The emulator's configuration file: lines of key, " = " and value, of which the program keeps two.
#pragma once

#include <optional>
#include <string>

// The contents of a new file with only the two entries. Directories end with a backslash, which is left out.
std::string ConfiguracaoInicial(const std::string& DirSaves, const std::string& DirRoms);

// The text with its entries SaveDirectory and GameDirectory naming these directories, all else as it was; nothing
// when both already do, in any letter case.
std::optional<std::string> ConfiguracaoAtualizada(std::string Texto, const std::string& DirSaves,
                                                  const std::string& DirRoms);
