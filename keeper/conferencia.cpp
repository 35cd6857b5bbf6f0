#include "keeper/conferencia.h"

#include <algorithm>
#include <iterator>

#include "keeper/motivos.h"
#include "platform/text.h"
#include "repository/indice.h"
#include "support/textos.h"

Motivos Conferencia::Conferir(const PacoteLido& Lido) {
  const Pacote& pacote = Lido.Conteudo;
  Motivos motivos = MotivosDoConteudo(pacote);
  // Where the game is missing, the picture may be cut as well.
  if (!pacote.Rom.empty()) std::ranges::move(MotivosDaFigura(pacote.Imagem), std::back_inserter(motivos));
  std::ranges::move(MotivosDosNomes(pacote.Nome, pacote.DOSName), std::back_inserter(motivos));
  const std::string mesmoNome = Ver(nomes_, pacote.Nome, Lido.Arquivo);
  if (!mesmoNome.empty()) motivos.push_back(Traduzir(Texto::NomeDeOutro, {pacote.Nome, mesmoNome}));
  const std::string mesmoDOS = Ver(nomesDOS_, pacote.DOSName, Lido.Arquivo);
  if (!mesmoDOS.empty()) motivos.push_back(Traduzir(Texto::NomeDOSDeOutro, {pacote.DOSName, mesmoDOS}));
  return motivos;
}

// The file that had the name before, or the empty text.
std::string Conferencia::Ver(Vistos& Nomes, const std::string& Nome, const std::string& Arquivo) {
  const auto [visto, novo] = Nomes.emplace(SemCaixa(platform::ToUtf8(Nome)), Arquivo);
  return novo ? "" : visto->second;
}
