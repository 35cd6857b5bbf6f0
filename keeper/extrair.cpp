// tvk extrair: a package's ROM and picture as files.
#include "keeper/arquivos.h"
#include "keeper/figuras.h"
#include "keeper/motivos.h"
#include "keeper/pacotes.h"
#include "keeper/rom.h"
#include "keeper/verbos.h"
#include "support/gravacao.h"
#include "support/textos.h"

namespace {

// A file that is there with another content stays: it may be the person's own.
void Por(const std::string& caminho, std::string_view conteudo, Motivos& motivos, Relato& onde) {
  switch (GravarSeMuda(caminho, conteudo, platform::Existing::Keep)) {
    case Escrita::Feita:
      return onde.Linha(caminho);
    case Escrita::Outro:
      return motivos.push_back(Traduzir(Texto::JaExisteOutro, {caminho}));
    case Escrita::Falhou:
      return motivos.push_back(Traduzir(Texto::NaoPodeSerGravado, {caminho}));
    default:
      return;
  }
}

Motivos ExtrairUm(const Pacote& pacote, const std::string& saida, Relato& onde) {
  Motivos motivos = MotivosDoConteudo(pacote);
  if (pacote.DOSName.empty() || pacote.Nome.empty()) motivos.push_back(Traduzir(Texto::NomeVazio));
  if (!motivos.empty()) return motivos;
  const std::string_view tipo = TipoDaFigura(pacote.Imagem);
  Por(saida + pacote.DOSName + (PareceZip(pacote.Rom) ? ".zip" : ".smc"), pacote.Rom, motivos, onde);
  Por(saida + pacote.Nome + "." + std::string(tipo == "?" ? "gif" : tipo), pacote.Imagem, motivos, onde);
  return motivos;
}

}  // namespace

void Extrair(const Pedido& Feito, Relato& Onde) {
  const std::string saida = ComoDiretorio(Feito.Valor("--saida"));
  ApagarRestos(saida.empty() ? ".\\" : saida);
  ParaCadaPacote(Feito, Onde, [&](const PacoteLido& lido) { return ExtrairUm(lido.Conteudo, saida, Onde); });
}
