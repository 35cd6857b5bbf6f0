// Archives of one file, as every program for .zip reads them.
#pragma once

#include <optional>
#include <string>
#include <string_view>

// A new archive that holds the content under this name (UTF-8), deflated as far as it goes; the same content gives the
// same bytes. Nothing without the memory for it.
std::optional<std::string> FazerZip(std::string_view NomeUtf8, std::string_view Conteudo);

// Whether the content begins as an archive does, whole or not.
bool PareceZip(std::string_view Conteudo);

// Where the record at the end of an archive begins; nothing when it is none, or none that is whole.
std::optional<std::size_t> FimDoZip(std::string_view Conteudo);

// Makes the archive's comment one byte longer. False when it cannot be.
bool AlongarComentario(std::string& Zip);
