// The dialogs that ask for a file. Texts are shown as they are given, without translation.
#pragma once

#include <cstdint>
#include <string>

#include "platform/controls.h"

// Both answer with the full path, or the empty text when the dialog was cancelled or failed. `Filtro` holds pairs of
// label, NUL, patterns, NUL; an empty one is set to all files.

// Asks for an existing file. A path that is missing, a directory, hidden or a system file counts as cancelled.
std::string AbrirArquivo(const platform::Window& Dono, const std::string& DiretorioInicial, const std::string& Titulo,
                         const std::string& NomeInicial, std::string& Filtro, std::uint8_t Flags);

// Asks under which name a file is to be written. Whether it exists is not asked. `ExtensaoPadrao` may hold several with
// ";" between them: the first one counts. `NomeInicial` must be one that a file can have, or nothing is asked.
std::string SalvarArquivo(const platform::Window& Dono, const std::string& DiretorioInicial, const std::string& Titulo,
                          const std::string& ExtensaoPadrao, const std::string& NomeInicial, std::string& Filtro,
                          std::uint8_t Flags);
