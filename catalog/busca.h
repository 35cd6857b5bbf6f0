// The catalogue's text searched from its first character. Entries are |KEY=name| one behind the other; whatever else
// the text holds, the earliest occurrence wins. This is the reference for what the index must answer.
#pragma once

#include <cstddef>
#include <optional>
#include <string_view>

// The name behind the first "|" + `Chave` + "=", up to the next "|" or the end of the text.
std::optional<std::string_view> BuscarNome(std::string_view Dados, std::string_view Chave);

// The key in front of the first "=" + `Nome` + "|", from behind the nearest "|" or from the beginning of the text.
std::optional<std::string_view> BuscarChave(std::string_view Dados, std::string_view Nome);

// The name that begins at a position, and the key that ends before the "=" at a position.
std::string_view NomeEm(std::string_view Dados, std::size_t Inicio);
std::string_view ChaveAntesDe(std::string_view Dados, std::size_t Igual);
