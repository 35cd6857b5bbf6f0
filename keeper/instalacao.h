// The collection that a verb works on.
#pragma once

#include <string>

#include "keeper/argumentos.h"
#include "keeper/relato.h"

// Makes an installation's directory the one that the catalogue, the games and the pictures are looked for in. False,
// and told, when it is no directory.
bool UsarInstalacao(const std::string& Diretorio, Relato& Onde);

// The same for the person's own, from the settings. False, and told, when this program does not stand beside the menu:
// the settings count from there.
bool UsarConfigurada(Relato& Onde);

// Whether one file and the option --instalacao were given. False, and told as wrong use, when not.
bool TemUmArquivoEInstalacao(const Pedido& Feito, Relato& Onde);
