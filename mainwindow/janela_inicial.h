// How the window begins: what start-up makes of the texts in the settings. Pure functions.
#pragma once

#include <optional>
#include <string>
#include <vector>

#include "platform/controls.h"

// State of the floppy check box: only the number 1 is checked.
int EstadoDisquete(const std::string& Texto);

// Where the window's left edge goes, in twips: centred without a saved value, at the saved one when that keeps more
// than 255 twips of the window on the screen, else nothing (it stays where it is).
std::optional<int> EsquerdaInicial(const std::string& Texto, int LarguraJanela, int LarguraTela);

// The same for the top edge, which lies below the screen's top and more than 255 twips above its bottom.
std::optional<int> TopoInicial(const std::string& Texto, int AlturaJanela, int AlturaTela);

// Where the window's corner goes: as the two above say of the primary monitor, whose size is that of Tela. A saved
// corner that does not lie there, and does lie in the same way on another monitor that is there, is restored whole.
struct Canto {
  std::optional<int> Esquerda, Topo;
  bool operator==(const Canto&) const = default;
};
Canto CantoInicial(const std::string& Esquerda, const std::string& Topo, const platform::Bounds& Janela,
                   const platform::Bounds& Tela, const std::vector<platform::Bounds>& Monitores);
