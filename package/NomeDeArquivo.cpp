#include <algorithm>
#include <array>

#include "package/pacote.h"

namespace {

// Names that the platform takes for devices in every directory, whatever extension follows. The superscript digits
// 1, 2 and 3 of the code page (B9, B2, B3) count as digits there.
constexpr std::array<std::string_view, 6> Dispositivos = {"CON", "PRN", "AUX", "NUL", "CONIN$", "CONOUT$"};
constexpr std::array<std::string_view, 2> Portas = {"COM", "LPT"};
constexpr std::string_view NumerosDePorta = "0123456789\xB9\xB2\xB3";

char Maiuscula(char letra) { return letra >= 'a' && letra <= 'z' ? static_cast<char>(letra - 'a' + 'A') : letra; }

bool Contem(const auto& nomes, std::string_view nome) { return std::ranges::find(nomes, nome) != nomes.end(); }

// The part before the first dot decides, without the blanks at its end.
bool NomeiaDispositivo(std::string_view nome) {
  nome = nome.substr(0, nome.find('.'));
  nome = nome.substr(0, nome.find_last_not_of(' ') + 1);
  std::string base(nome);
  std::ranges::transform(base, base.begin(), Maiuscula);
  if (Contem(Dispositivos, base)) return true;
  return base.size() == 4 && Contem(Portas, std::string_view(base).substr(0, 3)) &&
         NumerosDePorta.find(base[3]) != NumerosDePorta.npos;
}

}  // namespace

bool NomeDeArquivo(std::string_view Nome) {
  const auto levaFora = [](char letra) {
    return static_cast<unsigned char>(letra) < ' ' || letra == '\\' || letra == '/' || letra == ':';
  };
  return std::ranges::none_of(Nome, levaFora) && !NomeiaDispositivo(Nome);
}
