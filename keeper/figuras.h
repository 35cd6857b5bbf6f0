// The pictures of packages.
#pragma once

#include <string>
#include <string_view>

// "gif", "bmp", "jpg" or "png", by what the first frame is; "?" for what no program of ours can show.
std::string_view TipoDaFigura(std::string_view Conteudo);

struct FiguraPronta {
  std::string Conteudo;
  std::string Falta;  // why there is none; empty when there is one
};

// The picture file as a package carries it.
FiguraPronta PrepararFigura(const std::string& Arquivo);
