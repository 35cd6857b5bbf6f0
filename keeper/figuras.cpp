#include "keeper/figuras.h"

#include <cstddef>

#include "keeper/arquivos.h"
#include "platform/picture_file.h"
#include "support/textos.h"

namespace {

constexpr int MaiorLargura = 400, MaiorAltura = 346;       // pixels: twice the place where the menu shows it
constexpr std::size_t MaiorFigura = std::size_t{1} << 20;  // bytes

// Whether a package may carry the file as it is.
bool Serve(std::string_view conteudo) {
  const auto figura = platform::ReadPictureFile(conteudo);
  return figura && figura->Format != platform::PictureFormat::Png && figura->Width <= MaiorLargura &&
         figura->Height <= MaiorAltura && conteudo.size() <= MaiorFigura;
}

}  // namespace

std::string_view TipoDaFigura(std::string_view Conteudo) {
  const auto figura = platform::ReadPictureFile(Conteudo);
  if (!figura) return "?";
  switch (figura->Format) {
    case platform::PictureFormat::Gif:
      return "gif";
    case platform::PictureFormat::Bmp:
      return "bmp";
    case platform::PictureFormat::Jpeg:
      return "jpg";
    default:
      return "png";
  }
}

FiguraPronta PrepararFigura(const std::string& Arquivo) {
  if (Arquivo.empty()) return {"", Traduzir(Texto::SemFigura)};
  Leitura lida = LerTudo(Arquivo);
  if (!lida.Falta.empty()) return {"", Traduzir(Texto::ErroNaFigura, {Arquivo, lida.Falta})};
  if (!Serve(lida.Conteudo)) return {"", Traduzir(Texto::FiguraNaoServe, {Arquivo})};
  return {std::move(lida.Conteudo), ""};
}
