// The messages that more than one command shows. All texts here are given untranslated.
#pragma once

#include <string>

#include "platform/messages.h"

void MostrarErro(const std::string& Texto);                              // OK, critical icon, "Erro"
void MostrarAviso(const std::string& Texto, const std::string& Titulo);  // OK, information icon

void ErroJogoDesconhecido();   // the selected name is not in the game table
void ErroJogoNaoEncontrado();  // the ROM file is missing or empty
void ErroAoLer();
void ErroAoGravar();

// A question of two texts with a blank line between them: whether to replace what is there. Only Yes is true.
bool ConfirmarSubstituicao(const std::string& Texto);

// Asks for a disk in drive A:. True: try again.
bool PedirDisquete();
