#include "support/caminhos.h"

std::string DiretorioDe(const std::string& Caminho) { return Caminho.substr(0, Caminho.rfind('\\') + 1); }

std::string UltimaParte(const std::string& Caminho) { return Caminho.substr(Caminho.rfind('\\') + 1); }
