// A game's file as a package carries it.
#pragma once

#include <string>
#include <string_view>

#include "keeper/zip.h"

struct RomPronta {
  std::string Zip;
  std::string Falta;  // why there is none; empty when there is one
};

// Whether the file's name ends as a game's does: .zip, .smc or .sfc.
bool EhRom(const std::string& Arquivo);

// An archive stays as it is, and anything else is put into one, under its own name with .smc. Where the archive's
// length would be one that has no checksum, it becomes one byte longer.
RomPronta PrepararRom(const std::string& Arquivo, std::string Conteudo);
