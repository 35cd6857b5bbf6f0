#include "keeper/figuras.h"

#include <cstddef>
#include <optional>
#include <utility>

#include "keeper/arquivos.h"
#include "platform/picture_file.h"
#include "platform/picture_maker.h"
#include "support/textos.h"

namespace {

constexpr platform::PixelSize MaiorTamanho = {400, 346};   // twice the place where the menu shows it
constexpr std::size_t MaiorFigura = std::size_t{1} << 20;  // bytes

// Whether a package may carry the file as it is.
bool Serve(std::string_view Conteudo) {
  const auto figura = platform::ReadPictureFile(Conteudo);
  return figura && figura->Format != platform::PictureFormat::Png && figura->Width <= MaiorTamanho.Width &&
         figura->Height <= MaiorTamanho.Height && Conteudo.size() <= MaiorFigura;
}

FiguraPronta Feita(std::optional<std::string> Figura, const std::string& Senao) {
  return Figura ? FiguraPronta{std::move(*Figura), ""} : FiguraPronta{"", Senao};
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

FiguraPronta PrepararFigura(const std::string& Arquivo, const std::string& NomeDoJogo) {
  if (Arquivo.empty()) return Feita(platform::DrawJpeg(NomeDoJogo, MaiorTamanho), Traduzir(Texto::FiguraNaoDesenhada));
  Leitura lida = LerTudo(Arquivo);
  if (!lida.Falta.empty()) return {"", Traduzir(Texto::ErroNaFigura, {Arquivo, lida.Falta})};
  if (Serve(lida.Conteudo)) return {std::move(lida.Conteudo), ""};
  return Feita(platform::MakeJpeg(lida.Conteudo, MaiorTamanho), Traduzir(Texto::FiguraNaoServe, {Arquivo}));
}
