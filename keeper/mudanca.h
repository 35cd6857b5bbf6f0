// What a renaming changes in an installation, so that it can be done and taken back.
#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

#include "catalog/reescrita.h"

// By which a file's content is known again.
struct Impressao {
  std::int64_t Tamanho = 0;  // bytes
  std::uint32_t Soma = 0;    // CRC-32
  bool operator==(const Impressao&) const = default;
};

// Nothing when the file is missing or cannot be read.
std::optional<Impressao> ImpressaoDe(const std::string& Caminho);

// A file of the picture directory. Where another one waits for its name it gets a provisional one first.
struct FiguraMudada {
  std::string De, Provisorio, Para;  // names without a directory; Provisorio can be empty
  Impressao Conteudo;
};

struct Mudanca {
  TextoDoCatalogo Antes, Depois;
  std::vector<FiguraMudada> Figuras;
};

struct Movimento {
  std::string De, Para;
};

// The steps that lead to a change's picture names, in their order: no name is taken that is not free by then.
std::vector<Movimento> MovimentosDe(const Mudanca& Qual);

struct Tropeco {
  std::string Arquivo;  // path of what could not be changed
  bool DeVolta = true;  // all that was changed before is as it was
};

// Renames pictures step by step and then puts one text of the catalogue in the other's place. What fails has everything
// taken back.
std::optional<Tropeco> Mudar(const std::vector<Movimento>& Passos, const TextoDoCatalogo& Antes,
                             const TextoDoCatalogo& Depois);
