// The parts of a path's text. Nothing here looks at a disk.
#pragma once

#include <string>

// Up to its last backslash, that included; empty when there is none.
std::string DiretorioDe(const std::string& Caminho);

// Behind its last backslash: all of it when there is none.
std::string UltimaParte(const std::string& Caminho);
