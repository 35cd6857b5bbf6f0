// tvk desfazer: takes back what tvk nomear changed.
#include <cstddef>
#include <utility>

#include "catalog/cls_DAT.h"
#include "keeper/arquivos.h"
#include "keeper/diario.h"
#include "keeper/instalacao.h"
#include "keeper/verbos.h"
#include "keeper/volta.h"
#include "support/gravacao.h"
#include "support/mod_Globais.h"
#include "support/textos.h"

namespace {

class Retorno {
 public:
  Retorno(Mudanca Qual, Relato& Onde) : qual_(std::move(Qual)), onde_(Onde) {}

  // What is to be done; what has changed since is told.
  void Preparar() {
    if (!LerSozinho(agora_)) return Impedir(CaminhoCatalogo(), Texto::CatalogoEmUso);
    PrepararCatalogo();
    PrepararFiguras();
  }

  bool MudaAlgo() const { return !passos_.empty() || agora_ != depois_; }
  bool Impedida() const { return impedida_; }

  void Fazer() {
    const auto tropeco = Mudar(passos_, agora_, depois_);
    if (!tropeco) return onde_.Linha(Traduzir(Texto::Desfeito, {std::to_string(figuras_)}));
    onde_.Recusar(tropeco->Arquivo, Traduzir(tropeco->DeVolta ? Texto::NaoPodeMudar : Texto::VoltouEmParte));
  }

 private:
  void Impedir(const std::string& Arquivo, Texto Porque) {
    impedida_ = true;
    onde_.Recusar(Arquivo, Traduzir(Porque));
  }

  // What other programs have added since stays.
  void PrepararCatalogo() {
    depois_ = agora_;
    const std::string antes = qual_.Antes.value_or(""), novo = qual_.Depois.value_or("");
    if (agora_ && agora_->starts_with(novo)) {
      depois_ = antes + agora_->substr(novo.size());
      if (depois_->empty() && !qual_.Antes) depois_.reset();
      return;
    }
    const std::string agora = agora_.value_or("");
    const bool aindaNao = antes.empty() ? agora.empty() : agora.starts_with(antes);
    if (!aindaNao) Impedir(CaminhoCatalogo(), Texto::NomesMudaramDeNovo);
  }

  void PrepararFiguras() {
    VoltaDasFiguras volta = VoltaDe(qual_);
    for (const Empecilho& cada : volta.Impedem) Impedir(DirImgs + cada.Arquivo, cada.Porque);
    for (const std::string& cada : volta.Sumidas) onde_.Recusar(DirImgs + cada, Traduzir(Texto::FiguraSumiu));
    passos_ = std::move(volta.Passos);
    figuras_ = volta.Figuras;
  }

  Mudanca qual_;
  Relato& onde_;
  TextoDoCatalogo agora_, depois_;
  std::vector<Movimento> passos_;
  std::size_t figuras_ = 0;
  bool impedida_ = false;
};

}  // namespace

void Desfazer(const Pedido& Feito, Relato& Onde) {
  if (!TemUmArquivoEInstalacao(Feito, Onde) || !UsarInstalacao(Feito.Valor("--instalacao"), Onde)) return;
  const std::string& arquivo = Feito.Arquivos[0];
  const Leitura lido = LerTudo(arquivo);
  if (!lido.Falta.empty()) return Onde.Recusar(arquivo, lido.Falta);
  const auto mudanca = DeTexto(lido.Conteudo);
  if (!mudanca) return Onde.Recusar(arquivo, Traduzir(Texto::NaoEhDesfazer));
  ApagarRestos(DirPrograma);
  Retorno retorno(*mudanca, Onde);
  retorno.Preparar();
  if (retorno.Impedida()) return;
  if (retorno.MudaAlgo()) return retorno.Fazer();
  Onde.Linha(Traduzir(Texto::NadaADesfazer));
}
