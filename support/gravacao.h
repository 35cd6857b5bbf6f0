// How files are written, so that a failure leaves the old contents. Positions are counted from 0.
#pragma once

#include <cstdint>
#include <string>
#include <string_view>

// The name that a file's new contents have until they are complete; none of the program's lists shows it.
std::string NomeTemporario(const std::string& Caminho);

enum class Troca { Feita, SemLugar, Recusada };

// Writes the contents under the temporary name, has them put on the disk itself, and renames over the file. SemLugar:
// there is no room beside the file, or it cannot be exchanged; it may yet be written in place. Recusada: the disk
// does not keep what it is given. In both cases the file is as it was.
Troca TrocarConteudo(const std::string& Caminho, std::string_view Conteudo);

struct Gravacao {
  std::string_view Texto;
  std::int64_t Posicao;  // -1: at the end
  bool Cortar;           // the file is to end behind the text
};

// Writes into the file itself, which is created when missing. When that fails the old contents are put back; only a
// power cut meanwhile can leave a mixture.
bool GravarNoLugar(const std::string& Caminho, const Gravacao& Pedido);
