// The packages that a verb is given.
#pragma once

#include <cstdint>
#include <functional>
#include <string>
#include <string_view>
#include <vector>

#include "keeper/argumentos.h"
#include "keeper/relato.h"
#include "package/pacote.h"

struct PacoteLido {
  const std::string& Arquivo;
  std::int64_t Tamanho;  // bytes of the file
  const Pacote& Conteudo;
  std::string_view Bytes;  // the whole file
};

using Motivos = std::vector<std::string>;  // why something is refused; none: it is not

// What a verb does with a package that could be read.
using ComPacote = std::function<Motivos(const PacoteLido&)>;

// What it does afterwards with each package, read or not.
using DepoisDoPacote = std::function<void(const std::string& Arquivo, const Motivos& Porque)>;

// Goes through the packages, those in a directory that is named included, one in memory at a time, and tells each
// reason why one is refused.
void ParaCadaPacote(const Pedido& Feito, Relato& Onde, const ComPacote& Fazer, const DepoisDoPacote& Depois = {});
