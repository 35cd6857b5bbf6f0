// tvk nomear: other names for games of an installation.
#include "catalog/cls_DAT.h"
#include "keeper/diario.h"
#include "keeper/instalacao.h"
#include "keeper/levas.h"
#include "keeper/verbos.h"
#include "platform/clock.h"
#include "support/caminhos.h"
#include "support/gravacao.h"
#include "support/mod_Globais.h"
#include "support/textos.h"

namespace {

// The first of the day that no file has, without its extension.
std::string NomeDoDiario() {
  const std::string dia = "desfazer-" + platform::LocalDate();
  std::string nome = dia;
  for (int i = 2; platform::GetFileAttributesA(DirPrograma + nome + ".txt"); ++i) nome = dia + "-" + std::to_string(i);
  return nome;
}

class Renomeacao {
 public:
  explicit Renomeacao(Relato& Onde) : onde_(Onde), nome_(NomeDoDiario()) {}

  // What is to be done; whatever cannot be is told.
  void Preparar(const std::string& Lista) {
    if (!LerSozinho(mudanca_.Antes)) return onde_.Recusar(CaminhoCatalogo(), Traduzir(Texto::CatalogoEmUso));
    trocas_ = LerTrocas(Lista, NomesDaColecao(mudanca_.Antes), onde_);
    if (onde_.Recusados() > 0) return;
    mudanca_.Figuras = FigurasQueMudam(trocas_, nome_, onde_);
    std::vector<NomeNovo> nomes;
    for (const Troca& troca : trocas_.Mudam) nomes.push_back({troca.NomeDOS, troca.Novo});
    mudanca_.Depois = ComNomes(mudanca_.Antes.value_or(""), nomes);
  }

  bool MudaAlgo() const { return !trocas_.Mudam.empty(); }

  // The file to undo it is on the disk before anything changes. False: it could not be done, and that is told.
  bool Fazer() {
    if (!Substituicao(Diario(), EmTexto(mudanca_), platform::Existing::Keep).Concluir()) {
      onde_.Recusar(Diario(), Traduzir(Texto::NaoPodeSerFeito));
      return false;
    }
    const auto tropeco = Mudar(MovimentosDe(mudanca_), mudanca_.Antes, mudanca_.Depois);
    if (!tropeco) return true;
    if (tropeco->DeVolta) platform::DeleteFileA(Diario());
    onde_.Recusar(tropeco->Arquivo,
                  tropeco->DeVolta ? Traduzir(Texto::NaoPodeMudar) : Traduzir(Texto::MudouEmParte, {Diario()}));
    return false;
  }

  void Contar(bool Simulada) const {
    for (const Troca& troca : trocas_.Mudam) {
      onde_.Linha(EmColunaDOS(troca.NomeDOS) + troca.Velho + " -> " + troca.Novo);
    }
    for (const FiguraMudada& figura : mudanca_.Figuras) {
      onde_.Linha(EmColunaDOS("") + DirImgs + figura.De + " -> " + figura.Para);
    }
    onde_.Linha(Traduzir(Simulada ? Texto::NomesMudariam : Texto::NomesMudados,
                         {std::to_string(trocas_.Mudam.size()), std::to_string(mudanca_.Figuras.size()),
                          std::to_string(trocas_.Iguais)}));
    if (!Simulada && MudaAlgo()) onde_.Linha(Traduzir(Texto::ParaDesfazer, {Diario()}));
  }

 private:
  std::string Diario() const { return DirPrograma + nome_ + ".txt"; }

  Relato& onde_;
  std::string nome_;
  Trocas trocas_;
  Mudanca mudanca_;
};

}  // namespace

// One line that cannot be keeps all others from being done: names of a list hang together.
void Nomear(const Pedido& Feito, Relato& Onde) {
  if (!TemUmArquivoEInstalacao(Feito, Onde) || !UsarInstalacao(Feito.Valor("--instalacao"), Onde)) return;
  const bool simular = Feito.Tem("--simular");
  if (!simular) ApagarRestos(DirPrograma);
  Renomeacao renomeacao(Onde);
  renomeacao.Preparar(Feito.Arquivos[0]);
  if (Onde.Recusados() > 0) return Onde.Linha(Traduzir(Texto::NadaMudou));
  if (simular || !renomeacao.MudaAlgo() || renomeacao.Fazer()) renomeacao.Contar(simular);
}
