// The pictures of a repository.
#pragma once

#include <cstdint>
#include <string_view>

inline constexpr std::int64_t MaiorFigura = 1 << 20, MaisPontos = 4'000'000;  // bytes; pixels

enum class FaltaNaFigura { Nenhuma, Grande, PontosDemais, OutroTipo };

// Whether the text is one of "gif", "bmp" and "jpg".
bool EhExtensaoDeFigura(std::string_view Texto);

// The extension that the picture's first bytes ask for; empty when a repository takes none like it.
std::string_view ExtensaoDaFigura(std::string_view Conteudo);

// What is wrong with a picture that has this extension.
FaltaNaFigura ConferirFigura(std::string_view Conteudo, std::string_view Extensao);
