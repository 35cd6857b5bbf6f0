// Lists of games that keepers write: tables with a line of column names.
#pragma once

#include <map>
#include <string>
#include <vector>

#include "keeper/relato.h"

struct LinhaDaLista {
  std::string Onde;                           // "lista.csv:12", for refusals
  std::map<std::string, std::string> Campos;  // in the ANSI code page, by the column's name in small letters

  std::string Campo(const std::string& Nome) const;  // the empty text where there is no such column
};

// The lines of a list. What is wrong with the file, or with a line, is told, and that line left out; a field of one of
// the required columns is never empty.
std::vector<LinhaDaLista> LerLista(const std::string& Arquivo, const std::vector<std::string>& Exigidas, Relato& Onde);
