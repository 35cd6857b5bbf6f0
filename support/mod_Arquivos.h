// Files and directories. Nothing here shows a message. Byte positions start at 1; lengths are 32-bit numbers.
#pragma once

#include <cstdint>
#include <functional>
#include <optional>
#include <string>
#include <string_view>

namespace platform {
class File;
}

// `Tamanho` bytes from position `Inicio` (below 1: from the first); below 1: all to the end of the file. Of a wanted
// length, what the file does not give stays blank. Empty when all was wanted and the file is missing, does not open,
// cannot be read to its end, or does not fit in a text.
std::string LerArquivo(const std::string& Caminho, std::int32_t Inicio = 1, std::int32_t Tamanho = -1);

// Puts all bytes of a file behind those of the text. False: it cannot be read to its end, or is longer than a 32-bit
// length can say.
bool AcrescentarArquivo(std::string& Texto, const std::string& Caminho);

// All bytes of an open file; nothing when it cannot be read, or is longer than a 32-bit length can say.
std::optional<std::string> LerInteiro(platform::File& Arquivo);

// Writes the text at a position (-1: at the end; 0: as 1) of a file that is created when missing. 1 on success, else
// -1. With `ApagarAntes` the text becomes the file's whole content, and until it is on the disk the old content
// stays. Without, bytes behind the text stay as they are.
int GravarArquivo(const std::string& Caminho, std::string_view Texto, std::int32_t Posicao, bool ApagarAntes);

enum class Copia { Feita, NaoLida, NaoGravada };  // NaoLida: it is the source that cannot be read
using Andamento = std::function<void(int PorCento)>;

// Copies contents and, where it can, attributes and time of change, over a file of that name, which stays whole when
// the copy fails. A read-only file's copy can be written. A long copy is written in pieces: between two of them it
// tells how much is done.
Copia CopiarArquivo(const std::string& Origem, const std::string& Destino, const Andamento& AoAndar = nullptr);

// A file that is missing or cannot be deleted is left alone.
void ApagarArquivo(const std::string& Caminho);

// The same for what the person may want back: it goes to the recycle bin, where there is one.
void DescartarArquivo(const std::string& Caminho);

// The length in bytes; 0 for a file that is missing or cannot be seen, and the largest number for a longer file than it
// can tell.
std::int32_t TamanhoArquivo(const std::string& Caminho);

// True for a file that can be seen and is not empty.
bool ArquivoExiste(const std::string& Caminho);

// True for a directory that has no other attribute.
bool DiretorioExiste(const std::string& Caminho);

// A directory that exists already, or has no parent, is left alone.
void CriarDiretorio(const std::string& Caminho);

// Creates each missing directory of a path, up to its last backslash.
void CriarCaminho(const std::string& Caminho);
