// How pictures get the names back that they had before a change.
#pragma once

#include <cstddef>
#include <string>
#include <vector>

#include "keeper/mudanca.h"
#include "support/textos.h"

struct Empecilho {
  std::string Arquivo;  // name of a picture file
  Texto Porque;
};

struct VoltaDasFiguras {
  std::vector<Movimento> Passos;
  std::size_t Figuras = 0;           // how many come back
  std::vector<Empecilho> Impedem;    // what has changed since, and would be lost or left alone
  std::vector<std::string> Sumidas;  // names of files that are nowhere any more: they have no steps
};

// Reads the pictures. The change may have been broken off after any of its steps, and so may taking it back.
VoltaDasFiguras VoltaDe(const Mudanca& Qual);
