// Which games of the collection get which names.
#pragma once

#include <map>
#include <string>
#include <vector>

#include "catalog/reescrita.h"
#include "keeper/relato.h"

using NomesMostrados = std::map<std::string, std::string>;  // by DOS name, which is the file's, in upper case

// The games of the ROM directory, as the menu lists them with this text of the catalogue.
NomesMostrados NomesDaColecao(const TextoDoCatalogo& Catalogo);

struct Troca {
  std::string Onde;                  // the list and its line
  std::string NomeDOS, Velho, Novo;  // the former in upper case
};

struct Trocas {
  std::vector<Troca> Mudam;       // in the order of the list
  std::size_t Iguais = 0;         // lines that give a game the name that it has
  NomesMostrados ComOutrosNomes;  // the collection afterwards
};

// What a list with the columns dos and nome asks for. What cannot be is told.
Trocas LerTrocas(const std::string& Lista, const NomesMostrados& Nomes, Relato& Onde);
