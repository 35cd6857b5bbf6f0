// The command line of a verb: its options and files.
#pragma once

#include <map>
#include <span>
#include <string>
#include <string_view>
#include <vector>

#include "keeper/relato.h"
#include "platform/console.h"
#include "support/textos.h"

struct Opcao {
  std::string_view Nome;   // with its two hyphens
  std::string_view Valor;  // the word that stands for its value in the help; empty: it has none
  Texto Descricao;
  bool Varias = false;  // it may be given more than once
};

struct Pedido {
  std::map<std::string_view, std::vector<std::string>> Opcoes;  // those that were given, with their values
  std::vector<std::string> Arquivos;  // wildcards are expanded; backslashes part their directories

  bool Tem(std::string_view Nome) const { return Opcoes.contains(Nome); }
  const std::string& Valor(std::string_view Nome) const;  // the empty text when it was not given
  std::vector<std::string> Valores(std::string_view Nome) const;
};

// The arguments with each "@FILE" replaced by the lines of that file, up to "--". A file that cannot be read is
// refused.
std::vector<platform::Argument> ComListas(const std::vector<platform::Argument>& Argumentos, Relato& Onde);

// What the arguments behind the verb ask for. What is wrong with them is told.
Pedido LerPedido(std::span<const platform::Argument> Argumentos, std::span<const Opcao> Opcoes, Relato& Onde);

// Puts the files of a directory that match the pattern behind the others. One whose name is not in the code page is
// refused; when none matches, that is told in the given words, of what was named.
void AcrescentarListados(std::vector<std::string>& Arquivos, const std::string& Diretorio, const std::string& Padrao,
                         const std::string& Nomeado, Texto SeNenhum, Relato& Onde);

// A path with backslashes in place of slashes; the same as a directory, with a backslash at its end.
std::string CaminhoDoWindows(std::string Caminho);
std::string ComoDiretorio(const std::string& Caminho);
