// The pictures of games that get other names.
#pragma once

#include <string>
#include <vector>

#include "keeper/mudanca.h"
#include "keeper/relato.h"
#include "keeper/trocas.h"

// The files that follow the names, all types that there are of each picture. One that a game with the old name still
// shows stays. What is in the way, or cannot be read, is told. Provisional names begin with that text.
std::vector<FiguraMudada> FigurasQueMudam(const Trocas& Pedidas, const std::string& Provisorio, Relato& Onde);
