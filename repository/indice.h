// The index of a repository: which packages there are. It never changes once written, for it is called as its hash.
#pragma once

#include <string>
#include <string_view>
#include <vector>

#include "repository/entrada.h"
#include "repository/estrofes.h"
#include "repository/valores.h"

inline constexpr std::int64_t MaiorPacote = 256 << 20;  // bytes

// A game as the index has it. Texts are UTF-8, and all but the names may be empty.
struct JogoPublicado {
  std::string Nome, NomeDOS;
  ArquivoPublicado Pacote, Figura;
  std::string ExtensaoDaFigura;  // "gif", "bmp" or "jpg"; empty: there is no picture
  std::string Autor, Licenca, Descricao, Versao;

  bool operator==(const JogoPublicado&) const = default;
};

struct IndiceLido {
  std::vector<JogoPublicado> Jogos;  // in the order of their names' bytes
  Recusa Porque;
};

IndiceLido LerIndice(std::string_view Conteudo);

// The bytes of an index of these games, which need not be in order. LerIndice refuses it where a value is none that
// there may be.
std::string EscreverIndice(std::vector<JogoPublicado> Jogos);

// A name as it counts where letter case does not: two that are equal so are one. UTF-8, of code page 1252's letters.
std::string SemCaixa(std::string_view Utf8);

// Where a game's files lie, from the repository's own directory.
std::string ArquivoDoPacote(const JogoPublicado& Jogo);
std::string ArquivoDaFigura(const JogoPublicado& Jogo);
