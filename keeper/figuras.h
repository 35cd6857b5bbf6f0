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

// The picture file as a package carries it: as it is, where it is a GIF, BMP or JPEG file of at most 400 x 346 pixels
// and 1 MiB, and else made a JPEG that fits. Without a file, one is drawn with the game's name.
FiguraPronta PrepararFigura(const std::string& Arquivo, const std::string& NomeDoJogo);
