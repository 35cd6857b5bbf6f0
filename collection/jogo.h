// A game of the collection: one ROM file of the ROM directory, what the catalogue says of it, and its picture.
#pragma once

#include <array>
#include <string>

#include "platform/files.h"

struct Jogo {
  std::string Nome;          // shown in the list: the catalogue's name, or the file's base name
  std::string DOSName;       // the catalogue's DOS name of Nome; empty when the game is not in the catalogue
  std::string ArquivoCurto;  // Arquivo in 8.3 form, for the emulator's command line
  std::string Arquivo;       // full path of the ROM file; empty for a file without an extension, which is no game
  bool Catalogado = false;   // the catalogue has an entry for the file's base name
  bool SemCaminho = false;   // no path leads to the file: the code page lacks its name, and the disk has no short one
};

// The game of a file of the ROM directory, whose path in 8.3 form is given. The listing carries each file's own short
// name: asking the disk again, file by file, costs milliseconds each in a large directory.
Jogo LerJogo(const platform::DirectoryEntry& Entrada, const std::string& DirCurto);

// The files of the ROM directory that are games, as a listing takes it.
inline constexpr const char* PadraoRoms = "*.zip;*.smc";

// Those that a picture file may have: the first one present is shown.
inline constexpr std::array<const char*, 4> ExtensoesDeImagem = {".gif", ".bmp", ".jpg", ".png"};

// The picture file of the game of this name, or the empty text: the first one of ".gif", ".bmp", ".jpg", ".png" that is
// there and not empty, or of which that cannot be told.
std::string ImagemDoJogo(const std::string& Nome);

// The same in any directory, whose path ends with a backslash or is empty.
std::string ImagemEm(const std::string& Diretorio, const std::string& Nome);
