#include "mainwindow/ajustes.h"

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
  const auto Esquerda = InteiroDe(Texto);
  if (Esquerda && CabeNaLargura(*Esquerda, LarguraJanela, {.Width = LarguraTela})) return Esquerda;
  return std::nullopt;
}

std::optional<int> TopoInicial(const std::string& Texto, int AlturaJanela, int AlturaTela) {
  if (Texto.empty()) return (AlturaTela - AlturaJanela) / 2;
  const auto Topo = InteiroDe(Texto);
  if (Topo && CabeNaAltura(*Topo, {.Height = AlturaTela})) return Topo;
  return std::nullopt;
}

Canto CantoInicial(const std::string& Esquerda, const std::string& Topo, const Bounds& Janela, const Bounds& Tela,
                   const std::vector<Bounds>& Monitores) {
  const Canto NaTela = {EsquerdaInicial(Esquerda, Janela.Width, Tela.Width),
                        TopoInicial(Topo, Janela.Height, Tela.Height)};
  const Canto Salvo = {InteiroDe(Esquerda), InteiroDe(Topo)};
  if ((NaTela.Esquerda && NaTela.Topo) || !Salvo.Esquerda || !Salvo.Topo) return NaTela;
  const bool HaOutro = std::any_of(Monitores.begin(), Monitores.end(), [&](const Bounds& Monitor) {
    return CabeNaLargura(*Salvo.Esquerda, Janela.Width, Monitor) && CabeNaAltura(*Salvo.Topo, Monitor);
  });
  return HaOutro ? Salvo : NaTela;
}
