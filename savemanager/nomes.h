// The names of the emulator's save files and the texts that the save-file manager shows for them. For the files of
// PadraoSalvamentos the two mappings are inverse, as long as no two games of the catalogue share a name.
#pragma once

#include <string>

class cls_DAT;

// The game's own save, and its saved states 0 ("zst") to 9.
inline constexpr const char* PadraoSalvamentos = "*.srm;*.zst;*.zs1;*.zs2;*.zs3;*.zs4;*.zs5;*.zs6;*.zs7;*.zs8;*.zs9";

// The text shown for a file (its name, without directory): the game's name, and the number of a saved state.
std::string NomeExibido(const std::string& Arquivo, const cls_DAT& Catalogo);

// The file name, without directory, that a shown text stands for.
std::string NomeArquivo(const std::string& Texto, const cls_DAT& Catalogo);
