// The parts of a path's text. Nothing here looks at a disk.
#pragma once

#include <optional>
#include <string>

// Up to its last backslash, that included; empty when there is none.
std::string DiretorioDe(const std::string& Caminho);

// The directory's path, with a backslash added where it ends with no separator.
std::string ComBarra(const std::string& Diretorio);

// Behind its last backslash: all of it when there is none.
std::string UltimaParte(const std::string& Caminho);

// A file name without its last "." and what follows; nothing when it has no ".".
std::optional<std::string> NomeBase(const std::string& NomeDoArquivo);

// The text without the characters that no file name can have.
std::string SoDeNomeDeArquivo(const std::string& Texto);

// The last three characters, in upper case: the type that decides how a file is treated.
std::string TipoDoArquivo(const std::string& Caminho);
