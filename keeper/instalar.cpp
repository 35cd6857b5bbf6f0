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

  bool Mostra(const std::string& Nome) const { return nomes_.contains(platform::CharUpperBuffA(Nome)); }

  // The catalogue is read again only where an entry of this run may be asked for.
  bool Tem(const Pacote& Novo) {
    if (mudou_ && Mostra(Novo.Nome)) {
      Catalogo().Atualizar();
      mudou_ = false;
    }
    return JaEsta(Novo);
  }

  void Ganhou(const Pacote& Novo) {
    Acrescentar(Novo.Nome);
    mudou_ = true;
  }

 private:
  void Acrescentar(const std::string& Nome) { nomes_.insert(platform::CharUpperBuffA(Nome)); }

  std::set<std::string> nomes_;
  bool mudou_ = false;
};

Motivos MotivosDe(Entrada Fim) {
  switch (Fim) {
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

Motivos InstalarUm(const Pacote& Novo, bool Substituir, Colecao& Destino, Relato& Onde) {
  Motivos motivos = MotivosDoConteudo(Novo);
  if (!motivos.empty() || Destino.Tem(Novo)) return motivos;
  const Entrada fim = PorJogo(
      Novo, Destino.Mostra(Novo.Nome), [Substituir] { return Substituir; }, [] {});
  if (fim == Entrada::Feita) {
    Destino.Ganhou(Novo);
    Onde.Linha(EmColunaDOS(Novo.DOSName) + Novo.Nome);
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
                 [&](const PacoteLido& Lido) { return InstalarUm(Lido.Conteudo, substituir, colecao, Onde); });
}
