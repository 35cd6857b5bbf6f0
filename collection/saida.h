// Taking a copy of a game out of the collection.
#pragma once

#include <functional>
#include <string>

#include "collection/entrada.h"
#include "collection/jogo.h"
#include "platform/files.h"

enum class Saida { Feita, NaoLida, NaoGravada, SemPacote };  // SemPacote: the game cannot be packed

// Where it goes. With Keep no file is replaced: one that could not be seen when it was asked for, or came since, stays.
struct Destino {
  std::string Caminho;
  platform::Existing Existente;
};

// The ROM file as it is.
Saida SalvarRom(const Jogo& Escolhido, const Destino& Alvo, const EntrePassos& Pausa);

// A package; the picture's path may be empty, for a game that has none.
Saida SalvarPacote(const Jogo& Escolhido, const std::string& ArquivoImagem, const Destino& Alvo,
                   const EntrePassos& Pausa);
