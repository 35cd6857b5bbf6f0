#include "keeper/fichas.h"

#include <utility>

#include "keeper/lista.h"
#include "platform/text.h"
#include "support/textos.h"

namespace {

struct Coluna {
  const char *Nome, *Chave;
  std::string JogoPublicado::*Texto;
};

constexpr Coluna Colunas[] = {
    {"autor", "Autor", &JogoPublicado::Autor},
    {"licenca", "Licenca", &JogoPublicado::Licenca},
    {"descricao", "Descricao", &JogoPublicado::Descricao},
    {"versao", "Versao", &JogoPublicado::Versao},
};

// The texts of a line, in UTF-8; those that an index cannot hold are told.
JogoPublicado LerTextos(const LinhaDaLista& Linha, Relato& Onde) {
  JogoPublicado jogo;
  for (const auto& [nome, chave, texto] : Colunas) {
    jogo.*texto = platform::ToUtf8(Linha.Campo(nome));
    if (!PodeSerValor(chave, jogo.*texto)) Onde.Recusar(Linha.Onde, Traduzir(Texto::CampoErrado, {nome}));
  }
  return jogo;
}

}  // namespace

Fichas::Fichas(const std::vector<JogoPublicado>& Jogos) {
  for (const JogoPublicado& jogo : Jogos) fichas_[jogo.NomeDOS] = {"", jogo, true};
}

Fichas::Fichas(const std::string& Lista, Relato& Onde) {
  for (const LinhaDaLista& linha : LerLista(Lista, {"dos"}, Onde)) {
    const std::string nomeDOS = platform::CharUpperBuffA(linha.Campo("dos"));
    const bool nova = fichas_.emplace(nomeDOS, Ficha{linha.Onde, LerTextos(linha, Onde)}).second;
    if (!nova) Onde.Recusar(linha.Onde, Traduzir(Texto::NomeDOSRepetido, {nomeDOS}));
  }
}

void Fichas::Preencher(JogoPublicado& Jogo) {
  const auto ficha = fichas_.find(Jogo.NomeDOS);
  if (ficha == fichas_.end()) return;
  ficha->second.Usada = true;
  for (const Coluna& coluna : Colunas) Jogo.*coluna.Texto = ficha->second.Textos.*coluna.Texto;
}

void Fichas::RecusarSobras(Relato& Onde) const {
  for (const auto& [nomeDOS, ficha] : fichas_) {
    if (!ficha.Usada) Onde.Recusar(ficha.Onde, Traduzir(Texto::SemPacoteDaLinha, {nomeDOS}));
  }
}
