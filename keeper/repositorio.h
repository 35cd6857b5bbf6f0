// The directory of a repository, as its keeper has it.
#pragma once

#include <optional>
#include <set>
#include <string>
#include <string_view>
#include <vector>

#include "keeper/relato.h"
#include "platform/files.h"
#include "repository/entrada.h"
#include "repository/indice.h"

// What stands in a repository.
struct Publicado {
  std::optional<EntradaDoRepositorio> Entrada;  // nothing: it has none yet
  std::vector<JogoPublicado> Jogos;
};

// Files are named from the repository's own directory, as the client does.
class Repositorio {
 public:
  // A path with a backslash at its end; it need not be there yet.
  explicit Repositorio(std::string Diretorio) : diretorio_(std::move(Diretorio)) {}

  // Reads entry and index. Nothing, and told, where they cannot be gone on from: they are damaged, of a newer format,
  // or signed by another key.
  std::optional<Publicado> Ler(const platform::PublicKey& Chave, Relato& Onde) const;

  // Whether a file lies in the directory or below it, however both are named; true, too, where that cannot be told.
  bool Contem(const std::string& Caminho) const;

  std::string Caminho(const std::string& Arquivo) const;
  bool Tem(const std::string& Arquivo, std::string_view Conteudo) const;

  // Writes a file whole or not at all; one that has the content already is left alone. False, and told, when it cannot
  // be written.
  bool Por(const std::string& Arquivo, std::string_view Conteudo, platform::Existing Existente, Relato& Onde) const;

  // The files with a hash for a name that are none of these.
  std::vector<std::string> Sobras(const std::set<std::string>& Usados) const;

  // Deletes a file; told when it cannot be.
  bool Apagar(const std::string& Arquivo, Relato& Onde) const;

  // Deletes what was left half written.
  void ApagarRestosDeEscrita() const;

 private:
  std::optional<std::vector<JogoPublicado>> LerJogos(const ArquivoPublicado& Indice, Relato& Onde) const;

  std::string diretorio_;
};
