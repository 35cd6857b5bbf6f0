// tvk instalar: the games of packages into a collection, as the menu imports them.
#include <set>

#include "catalog/cls_DAT.h"
#include "collection/entrada.h"
#include "collection/jogo.h"
#include "keeper/instalacao.h"
#include "keeper/motivos.h"
#include "keeper/pacotes.h"
#include "keeper/verbos.h"
#include "platform/text.h"
#include "support/gravacao.h"
#include "support/mod_Arquivos.h"
#include "support/mod_Globais.h"
#include "support/textos.h"

namespace {

// The collection as the menu would list it.
class Colecao {
 public:
  Colecao() {
    for (const std::string* diretorio : {&DirRoms, &DirImgs}) {
      CriarCaminho(*diretorio);
      ApagarRestos(*diretorio);
    }
    Catalogo().Carregar();
    for (const auto& arquivo : platform::ListDirectory(DirRoms, PadraoRoms)) Acrescentar(LerJogo(arquivo, "").Nome);
  }
  ~Colecao() { Catalogo().Fechar(); }
  Colecao(const Colecao&) = delete;
  Colecao& operator=(const Colecao&) = delete;

  bool Mostra(const std::string& nome) const { return nomes_.contains(platform::CharUpperBuffA(nome)); }

  // The catalogue is read again only where an entry of this run may be asked for.
  bool Tem(const Pacote& pacote) {
    if (mudou_ && Mostra(pacote.Nome)) {
      Catalogo().Atualizar();
      mudou_ = false;
    }
    return JaEsta(pacote);
  }

  void Ganhou(const Pacote& pacote) {
    Acrescentar(pacote.Nome);
    mudou_ = true;
  }

 private:
  void Acrescentar(const std::string& nome) { nomes_.insert(platform::CharUpperBuffA(nome)); }

  std::set<std::string> nomes_;
  bool mudou_ = false;
};

Motivos MotivosDe(Entrada fim) {
  switch (fim) {
    case Entrada::Feita:
      return {};
    case Entrada::Negada:
      return {Traduzir(Texto::JaHaOutroJogo)};
    case Entrada::SemCatalogo:
      return {Traduzir(Texto::CatalogoNaoGravado)};
    case Entrada::NaoGravada:
      return {Traduzir(Texto::NaoPodeSerInstalado)};
    default:
      return {Traduzir(Texto::OutraSoma)};
  }
}

Motivos InstalarUm(const Pacote& pacote, bool substituir, Colecao& colecao, Relato& onde) {
  Motivos motivos = MotivosDoConteudo(pacote);
  if (!motivos.empty() || colecao.Tem(pacote)) return motivos;
  const Entrada fim = PorJogo(
      pacote, colecao.Mostra(pacote.Nome), [&] { return substituir; }, [] {});
  if (fim == Entrada::Feita) {
    colecao.Ganhou(pacote);
    onde.Linha(EmColunaDOS(pacote.DOSName) + pacote.Nome);
  }
  return MotivosDe(fim);
}

}  // namespace

void Instalar(const Pedido& Feito, Relato& Onde) {
  const bool propria = !Feito.Tem("--instalacao");
  if (!(propria ? UsarConfigurada(Onde) : UsarInstalacao(Feito.Valor("--instalacao"), Onde))) return;
  Colecao colecao;
  const bool substituir = Feito.Tem("--substituir");
  ParaCadaPacote(Feito, Onde,
                 [&](const PacoteLido& lido) { return InstalarUm(lido.Conteudo, substituir, colecao, Onde); });
}
