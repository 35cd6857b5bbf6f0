#include "mainwindow/janela_inicial.h"

#include <algorithm>

#include "support/cls_REG.h"

namespace {

using platform::Bounds;

constexpr int Margem = 255;  // twips of the window that a restored position must leave on the screen

bool CabeNaLargura(int Esquerda, int LarguraJanela, const Bounds& Monitor) {
  return Esquerda > Monitor.Left + Margem - LarguraJanela && Esquerda < Monitor.Left + Monitor.Width - Margem;
}

bool CabeNaAltura(int Topo, const Bounds& Monitor) {
  return Topo > Monitor.Top && Topo < Monitor.Top + Monitor.Height - Margem;
}

}  // namespace

int EstadoDisquete(const std::string& Texto) { return InteiroDe(Texto) == 1 ? 1 : 0; }

std::optional<int> EsquerdaInicial(const std::string& Texto, int LarguraJanela, int LarguraTela) {
  if (Texto.empty()) return (LarguraTela - LarguraJanela) / 2;
  const auto esquerda = InteiroDe(Texto);
  if (esquerda && CabeNaLargura(*esquerda, LarguraJanela, {.Width = LarguraTela})) return esquerda;
  return std::nullopt;
}

std::optional<int> TopoInicial(const std::string& Texto, int AlturaJanela, int AlturaTela) {
  if (Texto.empty()) return (AlturaTela - AlturaJanela) / 2;
  const auto topo = InteiroDe(Texto);
  if (topo && CabeNaAltura(*topo, {.Height = AlturaTela})) return topo;
  return std::nullopt;
}

Canto CantoInicial(const std::string& Esquerda, const std::string& Topo, const Bounds& Janela, const Bounds& Tela,
                   const std::vector<Bounds>& Monitores) {
  const Canto naTela = {EsquerdaInicial(Esquerda, Janela.Width, Tela.Width),
                        TopoInicial(Topo, Janela.Height, Tela.Height)};
  const Canto salvo = {InteiroDe(Esquerda), InteiroDe(Topo)};
  if ((naTela.Esquerda && naTela.Topo) || !salvo.Esquerda || !salvo.Topo) return naTela;
  const bool haOutro = std::any_of(Monitores.begin(), Monitores.end(), [&](const Bounds& Monitor) {
    return CabeNaLargura(*salvo.Esquerda, Janela.Width, Monitor) && CabeNaAltura(*salvo.Topo, Monitor);
  });
  return haOutro ? salvo : naTela;
}
