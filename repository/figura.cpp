#include "repository/figura.h"

#include <algorithm>
#include <iterator>
#include <utility>

#include "platform/picture_file.h"

namespace {

using platform::PictureFormat;

constexpr std::pair<PictureFormat, std::string_view> Tipos[] = {
    {PictureFormat::Gif, "gif"}, {PictureFormat::Bmp, "bmp"}, {PictureFormat::Jpeg, "jpg"}};

}  // namespace

bool EhExtensaoDeFigura(std::string_view Texto) {
  return std::ranges::any_of(Tipos, [&](const auto& Cada) { return Cada.second == Texto; });
}

std::string_view ExtensaoDaFigura(std::string_view Conteudo) {
  const auto figura = platform::ReadPictureFile(Conteudo);
  if (!figura) return "";
  const auto* const tipo = std::ranges::find_if(Tipos, [&](const auto& Cada) { return Cada.first == figura->Format; });
  return tipo == std::end(Tipos) ? "" : tipo->second;
}

FaltaNaFigura ConferirFigura(std::string_view Conteudo, std::string_view Extensao) {
  if (Conteudo.size() > MaiorFigura) return FaltaNaFigura::Grande;
  const auto figura = platform::ReadPictureFile(Conteudo);
  if (!figura || Extensao.empty() || ExtensaoDaFigura(Conteudo) != Extensao) return FaltaNaFigura::OutroTipo;
  const bool pontos = std::int64_t{figura->Width} * figura->Height > MaisPontos;
  return pontos ? FaltaNaFigura::PontosDemais : FaltaNaFigura::Nenhuma;
}
