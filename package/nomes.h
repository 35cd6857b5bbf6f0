// The names that a game may have where it is given on to others: stricter than what a package can carry, so that each
// name is a file's name and a catalogue's entry on every disk, and means one game only.
#pragma once

#include <string>
#include <string_view>

struct FaltaNoNome {
  enum class Tipo { Nenhuma, Vazio, Longo, Caractere, Ponta, Dispositivo };
  Tipo Qual = Tipo::Nenhuma;
  std::string Caractere = {};  // the first wrong one, UTF-8; one that cannot be seen as "U+0009"
};

// A game's name, in UTF-8: 1 to 100 characters of code page 1252, none of \ / : * ? " < > | = and no control or
// formatting character; no blank and no dot at its ends; no device.
FaltaNoNome ConferirNome(std::string_view Utf8);

// A DOS name: 1 to 8 of A-Z, 0-9, "_" and "-"; no device.
FaltaNoNome ConferirNomeDOS(std::string_view Nome);
