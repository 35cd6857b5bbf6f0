// A collection of games for the benchmarks: files, and a catalogue that names them.
#pragma once

#include <cstdio>
#include <string>

#include "support/mod_Arquivos.h"
#include "support/mod_Globais.h"

namespace benchmarks {

inline std::string DOSNameOf(int game) {
  char name[16];
  std::snprintf(name, sizeof name, "JG%06d", game);
  return name;
}

// As long as names of games are, and in another order than the DOS names.
inline std::string NameOf(int game) {
  constexpr const char* words[] = {"Aventura", "Corrida", "Futebol", "Luta", "Magia", "Nave", "Plataforma"};
  return std::string("Super ") + words[game % 7] + " " + std::to_string(game) + " (Brasil)";
}

inline std::string CatalogueOf(int games) {
  std::string text;
  for (int game = 0; game < games; ++game) text += "|" + DOSNameOf(game) + "=" + NameOf(game) + "|";
  return text;
}

// An installation below a directory (with a backslash at its end): the catalogue, and a ROM file for each game.
inline bool InstallGames(const std::string& directory, int games) {
  DirPrograma = directory;
  DirRoms = directory + "Roms" + std::to_string(games) + "\\";
  DirSaves = directory + "Saves\\";
  DirImgs = directory + "Imgs\\";
  for (const std::string& each : {DirRoms, DirSaves, DirImgs}) CriarCaminho(each);
  bool written = GravarArquivo(directory + "tolvaris.dat", CatalogueOf(games), 1, true) == 1;
  for (int game = 0; written && game < games; ++game) {
    const std::string rom = DirRoms + DOSNameOf(game) + ".SMC";
    written = ArquivoExiste(rom) || GravarArquivo(rom, "rom", 1, false) == 1;
  }
  return written;
}

}  // namespace benchmarks
