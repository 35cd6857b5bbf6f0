// The games that are to be packed, as arguments, an installation or a list name them.
#pragma once

#include <string>
#include <vector>

#include "keeper/argumentos.h"
#include "keeper/relato.h"

struct Encomenda {
  std::string Onde;     // what a refusal is about: the ROM, or the list and its line
  std::string Rom;      // path
  std::string Nome;     // of the game; never empty
  std::string NomeDOS;  // empty: one is made of the ROM's base name
  std::string Figura;   // path; empty: there is none
};

// What was asked for. What cannot be, such as a line of the list, is told and left out.
std::vector<Encomenda> LerEncomendas(const Pedido& Feito, Relato& Onde);
