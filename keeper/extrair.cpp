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
void Por(const std::string& Caminho, std::string_view Conteudo, Motivos& Faltas, Relato& Onde) {
  switch (GravarSeMuda(Caminho, Conteudo, platform::Existing::Keep)) {
    case Escrita::Feita:
      return Onde.Linha(Caminho);
    case Escrita::Outro:
      return Faltas.push_back(Traduzir(Texto::JaExisteOutro, {Caminho}));
    case Escrita::Falhou:
      return Faltas.push_back(Traduzir(Texto::NaoPodeSerGravado, {Caminho}));
    default:
      return;
  }
}

Motivos ExtrairUm(const Pacote& Lido, const std::string& Saida, Relato& Onde) {
  Motivos motivos = MotivosDoConteudo(Lido);
  if (Lido.DOSName.empty() || Lido.Nome.empty()) motivos.push_back(Traduzir(Texto::NomeVazio));
  if (!motivos.empty()) return motivos;
  const std::string_view tipo = TipoDaFigura(Lido.Imagem);
  Por(Saida + Lido.DOSName + (PareceZip(Lido.Rom) ? ".zip" : ".smc"), Lido.Rom, motivos, Onde);
  Por(Saida + Lido.Nome + "." + std::string(tipo == "?" ? "gif" : tipo), Lido.Imagem, motivos, Onde);
  return motivos;
}

}  // namespace

void Extrair(const Pedido& Feito, Relato& Onde) {
  const std::string saida = ComoDiretorio(Feito.Valor("--saida"));
  ApagarRestos(saida.empty() ? ".\\" : saida);
  ParaCadaPacote(Feito, Onde, [&](const PacoteLido& Lido) { return ExtrairUm(Lido.Conteudo, saida, Onde); });
}
