// Why packages and names are refused, in words.
#pragma once

#include <string>
#include <string_view>

#include "keeper/pacotes.h"
#include "package/pacote.h"
#include "repository/estrofes.h"

// What keeps a package's content from being put into a collection.
Motivos MotivosDoConteudo(const Pacote& Lido);

// What is wrong with a game's name, where it is to be given on.
Motivos MotivosDoNome(const std::string& Nome);
// What keeps its picture out of a repository.
Motivos MotivosDaFigura(std::string_view Figura);

// Why a file of a repository cannot be read on from.
std::string MotivoDaRecusa(const Recusa& Porque);

// What is wrong with its names, where they are to be given on.
Motivos MotivosDosNomes(const std::string& Nome, const std::string& NomeDOS);
