// What start-up makes of the texts in the settings: pure functions.
#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

// The whole number of 32 bits that the text writes in decimal digits, with or without a sign before them and blanks
// around it; nothing for any other text.
std::optional<std::int32_t> NumeroInteiro(std::string_view Texto);

// State of the floppy check box: only the number 1 is checked.
int EstadoDisquete(std::string_view Texto);

// Where the window's left edge goes, in twips: centred without a saved value, at the saved one when that keeps more
// than 255 twips of the window on the screen, else nothing (it stays where it is).
std::optional<int> EsquerdaInicial(std::string_view Texto, int LarguraJanela, int LarguraTela);

// The same for the top edge, which lies below the screen's top and more than 255 twips above its bottom.
std::optional<int> TopoInicial(std::string_view Texto, int AlturaJanela, int AlturaTela);
