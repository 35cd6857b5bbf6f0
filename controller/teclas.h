// The keyboard keys that play the controller in the emulator: its own factory setting, which the program does not read.
#pragma once

#include <array>

struct Tecla {
  int Left, Top;                     // of the label beside the controller's button, in twips
  std::array<const char*, 2> Nomes;  // of player 1 and player 2, before translation
};

// "e." and "d." are the left and the right key of a pair.
inline constexpr std::array<Tecla, 12> Teclas = {{
    {2040, 1560, {"Seta cima", "Home"}},          // up
    {3330, 2460, {"Seta direita", "Page Down"}},  // right
    {735, 2460, {"Seta esquerda", "Delete"}},     // left
    {1965, 3360, {"Seta baixo", "End"}},          // down
    {3675, 3240, {"Shift e.", "Shift d."}},       // Select
    {4710, 3240, {"CTRL e.", "ENTER"}},           // Start
    {2445, 720, {"A", "U"}},                      // L
    {6510, 720, {"Z", "J"}},                      // R
    {6870, 1965, {"S", "I"}},                     // X
    {6315, 2370, {"X", "K"}},                     // Y
    {7320, 2580, {"D", "O"}},                     // A
    {6780, 3000, {"C", "L"}},                     // B
}};
