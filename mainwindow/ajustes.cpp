#include "mainwindow/ajustes.h"

#include "support/cls_REG.h"

namespace {

constexpr int Margem = 255;  // twips of the window that a restored position must leave on the screen

}  // namespace

int EstadoDisquete(const std::string& Texto) { return InteiroDe(Texto) == 1 ? 1 : 0; }

std::optional<int> EsquerdaInicial(const std::string& Texto, int LarguraJanela, int LarguraTela) {
  if (Texto.empty()) return (LarguraTela - LarguraJanela) / 2;
  const auto Esquerda = InteiroDe(Texto);
  if (Esquerda && *Esquerda > Margem - LarguraJanela && *Esquerda < LarguraTela - Margem) return Esquerda;
  return std::nullopt;
}

std::optional<int> TopoInicial(const std::string& Texto, int AlturaJanela, int AlturaTela) {
  if (Texto.empty()) return (AlturaTela - AlturaJanela) / 2;
  const auto Topo = InteiroDe(Texto);
  if (Topo && *Topo > 0 && *Topo < AlturaTela - Margem) return Topo;
  return std::nullopt;
}
