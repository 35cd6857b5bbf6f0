// What packages have to be to be given on.
#pragma once

#include <map>
#include <string>

#include "keeper/pacotes.h"

// Looks at one package after the other: at each by itself, and whether its names are those of one before.
class Conferencia {
 public:
  // Everything for which the package is refused.
  Motivos Conferir(const PacoteLido& Lido);

 private:
  using Vistos = std::map<std::string, std::string>;  // the file that had a name first, letter case aside

  static std::string Ver(Vistos& Nomes, const std::string& Nome, const std::string& Arquivo);

  Vistos nomes_, nomesDOS_;
};
