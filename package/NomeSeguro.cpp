#include <algorithm>
#include <array>

#include "package/pacote.h"
#include "platform/text.h"

namespace {

// Names that the platform takes for devices in every directory, whatever extension follows; port 1 stands for all
// ports.
constexpr std::array<std::string_view, 8> Dispositivos = {"CON",    "PRN",     "AUX",  "NUL",
                                                          "CONIN$", "CONOUT$", "COM1", "LPT1"};

// A superscript 1, 2 or 3 of the code page (B9, B2, B3) numbers a port as well.
constexpr std::string_view NumerosDePorta = "0123456789\xB9\xB2\xB3";

constexpr std::string_view SaidaDoDiretorio = "\\/:";

char Maiuscula(char Letra) { return Letra >= 'a' && Letra <= 'z' ? static_cast<char>(Letra - 'a' + 'A') : Letra; }

// The part before the first dot decides, without the blanks at its end.
bool NomeiaDispositivo(std::string_view Nome) {
  Nome = Nome.substr(0, Nome.find('.'));
  Nome = Nome.substr(0, Nome.find_last_not_of(' ') + 1);
  std::string base(Nome);
  std::ranges::transform(base, base.begin(), Maiuscula);
  if (base.size() == 4 && NumerosDePorta.find(base[3]) != std::string_view::npos) base[3] = '1';
  return std::ranges::find(Dispositivos, base) != Dispositivos.end();
}

}  // namespace

bool NomeSeguro(std::string_view Nome) {
  for (std::size_t i = 0; i < Nome.size(); ++i) {
    if (static_cast<unsigned char>(Nome[i]) < ' ') return false;
    if (SaidaDoDiretorio.find(Nome[i]) != std::string_view::npos && platform::CharacterBeginsAt(Nome, i)) return false;
  }
  return !NomeiaDispositivo(Nome);
}
