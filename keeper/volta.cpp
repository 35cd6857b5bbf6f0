#include "keeper/volta.h"

#include <cstddef>
#include <map>
#include <optional>
#include <set>

#include "platform/files.h"
#include "platform/text.h"
#include "support/mod_Globais.h"

namespace {

using Lugares = std::map<std::string, std::optional<Impressao>>;  // by names in upper case; nothing: no file

std::string Chave(const std::string& Nome) { return platform::CharUpperBuffA(Nome); }

struct Passo {
  Movimento Qual;
  const FiguraMudada* Figura;
};

std::vector<Passo> PassosDe(const Mudanca& Qual) {
  std::map<std::string, const FiguraMudada*> figuras;
  for (const FiguraMudada& cada : Qual.Figuras) {
    figuras[Chave(cada.De)] = &cada;
    if (!cada.Provisorio.empty()) figuras[Chave(cada.Provisorio)] = &cada;
  }
  std::vector<Passo> passos;
  for (const Movimento& cada : MovimentosDe(Qual)) passos.push_back({cada, figuras.at(Chave(cada.De))});
  return passos;
}

constexpr Impressao Ilegivel = {-1, 0};  // of what is there, or may be, and cannot be read

std::optional<Impressao> ImpressaoNoDisco(const std::string& Nome) {
  if (!platform::FileSize(DirImgs + Nome)) return std::nullopt;
  return ImpressaoDe(DirImgs + Nome).value_or(Ilegivel);
}

// The disk beside what it would be after each of the steps.
class Comparacao {
 public:
  explicit Comparacao(const Mudanca& Qual) : passos_(PassosDe(Qual)) {
    for (const Passo& passo : passos_) {
      for (const std::string& nome : {passo.Qual.De, passo.Qual.Para}) {
        esperado_[Chave(nome)].reset();
        if (!achado_.contains(Chave(nome))) achado_[Chave(nome)] = ImpressaoNoDisco(nome);
      }
    }
    for (const FiguraMudada& cada : Qual.Figuras) esperado_[Chave(cada.De)] = cada.Conteudo;
    Parar();
  }

  // Seen from the last step that was done, the first one of a picture says where it is now.
  VoltaDasFiguras Voltar() const {
    VoltaDasFiguras volta;
    std::set<const FiguraMudada*> vistas, sumidas;
    for (std::size_t i = feitos_; i-- > 0;) {
      const auto& [passo, figura] = passos_[i];
      if (vistas.insert(figura).second && !ConferirOnde(passo.Para, *figura, volta)) sumidas.insert(figura);
      if (sumidas.contains(figura)) continue;
      if (!esperado_.at(Chave(passo.De)) && achado_.at(Chave(passo.De))) {
        volta.Impedem.push_back({passo.De, Texto::OutraNoLugar});
      }
      volta.Passos.push_back({passo.Para, passo.De});
    }
    volta.Figuras = vistas.size() - sumidas.size();
    return volta;
  }

 private:
  // False when there is no such file any more.
  bool ConferirOnde(const std::string& Nome, const FiguraMudada& Qual, VoltaDasFiguras& Volta) const {
    const auto achado = achado_.at(Chave(Nome));
    if (!achado) {
      Volta.Sumidas.push_back(Nome);
    } else if (*achado != Qual.Conteudo) {
      Volta.Impedem.push_back({Nome, *achado == Ilegivel ? Texto::NaoPodeSerLido : Texto::OutraFigura});
    }
    return achado.has_value();
  }

  std::size_t Difere(const std::string& Nome) const { return achado_.at(Chave(Nome)) != esperado_.at(Chave(Nome)); }

  void Dar(const Passo& Qual) {
    esperado_[Chave(Qual.Qual.De)].reset();
    esperado_[Chave(Qual.Qual.Para)] = Qual.Figura->Conteudo;
  }

  // Finds the number of steps after which the disk differs least from what it would be.
  void Parar() {
    const Lugares antes = esperado_;
    std::size_t diferem = 0;
    for (const auto& [nome, conteudo] : esperado_) diferem += Difere(nome);
    std::size_t menos = diferem;
    for (std::size_t i = 0; i < passos_.size(); ++i) {
      const Movimento& passo = passos_[i].Qual;
      diferem -= Difere(passo.De) + Difere(passo.Para);
      Dar(passos_[i]);
      diferem += Difere(passo.De) + Difere(passo.Para);
      if (diferem > menos) continue;
      menos = diferem;
      feitos_ = i + 1;
    }
    esperado_ = antes;
    for (std::size_t i = 0; i < feitos_; ++i) Dar(passos_[i]);
  }

  std::vector<Passo> passos_;
  Lugares achado_, esperado_;
  std::size_t feitos_ = 0;
};

}  // namespace

VoltaDasFiguras VoltaDe(const Mudanca& Qual) { return Comparacao(Qual).Voltar(); }
