// Names and paths of game files, and writing them: what import and export share.
#pragma once

#include <optional>
#include <string>
#include <string_view>

// The last three characters of a path, in upper case: the type that decides how a file is treated.
std::string TipoDoArquivo(const std::string& Caminho);

// A file name without its last "." and what follows; nothing when it has no ".".
std::optional<std::string> NomeBase(const std::string& NomeArquivo);

// Writes a whole file, over one of that name. When that fails an old file stays as it was, and where there was none,
// none is left.
bool GravarInteiro(const std::string& Caminho, std::string_view Conteudo);

// The checksum of a file as a package records it; nothing when it has none, or cannot be read.
std::optional<std::string> CRCDoArquivo(const std::string& Caminho);
