// A repository as one sees it who may read it at any moment.
#pragma once

#include "repository/chave.h"
#include "repository/entrada.h"
#include "repository/indice.h"
#include "tests/keeper/keeper.h"

struct Seen {
  std::string Fault;  // why the repository cannot be used; empty when it can
  EntradaDoRepositorio Entry = {};
  std::vector<JogoPublicado> Games = {};
};

// Whether a file is there with the content that its name and length promise.
inline bool IsWhole(const std::string& repository, std::string file, const ArquivoPublicado& promised) {
  std::replace(file.begin(), file.end(), '/', '\\');
  const auto content = Content(repository + file);
  return content && std::ssize(*content) == promised.Tamanho &&
         EmHexadecimal(platform::Sha256(*content).value()) == promised.Soma;
}

// Reads all of it: entry, index, packages and pictures.
inline Seen LookAt(const std::string& repository) {
  const std::string text = Content(repository + "entrada.txt").value_or("");
  const EntradaLida entry = LerEntrada(text);
  if (entry.Porque.Qual != Recusa::Tipo::Nenhuma) return {"the entry"};
  const std::string index = ArquivoDoIndice(entry.Entrada.Indice);
  if (!IsWhole(repository, index, entry.Entrada.Indice)) return {index};
  const IndiceLido read = LerIndice(*Content(repository + "indice\\" + entry.Entrada.Indice.Soma + ".txt"));
  if (read.Porque.Qual != Recusa::Tipo::Nenhuma) return {"the index"};
  for (const JogoPublicado& game : read.Jogos) {
    if (!IsWhole(repository, ArquivoDoPacote(game), game.Pacote)) return {ArquivoDoPacote(game)};
    if (!IsWhole(repository, ArquivoDaFigura(game), game.Figura)) return {ArquivoDaFigura(game)};
  }
  return {"", entry.Entrada, read.Jogos};
}
