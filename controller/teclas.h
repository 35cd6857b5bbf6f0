// The keyboard keys that play the controller in the emulator: its own factory setting, which the program does not read.
#pragma once

#include <array>

struct Tecla {
  int Left, Top;                     // of the label beside the controller's button, in twips
  const char* Botao;                 // of the controller, for screen readers, before translation
  std::array<const char*, 2> Nomes;  // of the key, for player 1 and player 2, before translation
};

// "e." and "d." are the left and the right key of a pair.
inline constexpr std::array<Tecla, 12> Teclas = {{
    {2040, 1560, "Para cima", {"Seta cima", "Home"}},
    {3330, 2460, "Para a direita", {"Seta direita", "Page Down"}},
    {735, 2460, "Para a esquerda", {"Seta esquerda", "Delete"}},
    {1965, 3360, "Para baixo", {"Seta baixo", "End"}},
    {3675, 3240, "Select", {"Shift e.", "Shift d."}},
    {4710, 3240, "Start", {"CTRL e.", "ENTER"}},
    {2445, 720, "L", {"A", "U"}},
    {6510, 720, "R", {"Z", "J"}},
    {6870, 1965, "X", {"S", "I"}},
    {6315, 2370, "Y", {"X", "K"}},
    {7320, 2580, "A", {"D", "O"}},
    {6780, 3000, "B", {"C", "L"}},
}};
