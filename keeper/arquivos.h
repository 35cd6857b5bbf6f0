// Files as tvk reads and writes them.
#pragma once

#include <string>
#include <string_view>

#include "platform/files.h"

// Longer files are refused unread: no game is so long, and it bounds the memory that one file takes.
inline constexpr std::int64_t MaiorArquivo = 256 << 20;  // bytes

struct Leitura {
  std::string Conteudo;
  std::string Falta;  // why it could not be read; empty when it was
};

// All bytes of a file.
Leitura LerTudo(const std::string& Caminho);

// The same into a text whose memory serves for one file after the other. Why it could not be read, or the empty text.
std::string LerPara(std::string& Conteudo, const std::string& Caminho);

enum class Escrita { Feita, Igual, Outro, Falhou };  // Outro: with Keep, the file is there with another content

// Makes the text a file's content, unless it is already, and then writes nothing. The directories on its way are
// created.
Escrita GravarSeMuda(const std::string& Caminho, std::string_view Conteudo, platform::Existing Existente);

// Whether this is all that the file holds. Compared piece by piece, so that only one of the two is in memory.
bool TemConteudo(const std::string& Caminho, std::string_view Conteudo);

// Writes a file whole or not at all, for those who may read it at any moment: its name never stands for a part of it,
// not even where the disk is full. The directories on its way are created.
bool GravarInteiro(const std::string& Caminho, std::string_view Conteudo, platform::Existing Existente);

// True for a directory, whatever other attributes it has.
bool EhDiretorio(const std::string& Caminho);
