#include "keeper/nome_dos.h"

#include <string_view>

#include "package/nomes.h"
#include "package/pacote.h"
#include "platform/hash.h"
#include "platform/letters.h"
#include "platform/text.h"

namespace {

// The letter or digit of a DOS name, or a blank.
char LetraDOS(char Letra) {
  if (Letra >= 'a' && Letra <= 'z') return static_cast<char>(Letra - 'a' + 'A');
  return (Letra >= 'A' && Letra <= 'Z') || (Letra >= '0' && Letra <= '9') ? Letra : ' ';
}

// The letter of two bytes, of which the second one is the last of its character.
char SemAcento(char Primeiro, char Segundo) {
  return platform::WithoutAccent((static_cast<unsigned char>(Primeiro) & 0x1FU) << 6 |
                                 (static_cast<unsigned char>(Segundo) & 0x3FU));
}

std::string Letras(std::string_view Utf8) {
  constexpr std::size_t quantas = 4;
  std::string letras;
  for (std::size_t i = 0; i < Utf8.size() && letras.size() < quantas; ++i) {
    const bool deDoisBytes = (Utf8[i] & 0xE0) == 0xC0 && i + 1 < Utf8.size();
    const char letra = LetraDOS(deDoisBytes ? SemAcento(Utf8[i], Utf8[i + 1]) : Utf8[i]);
    if (deDoisBytes) ++i;
    if (letra != ' ') letras += letra;
  }
  return letras;
}

std::string Digitos(const platform::Sha256Value& Soma) {
  constexpr std::string_view alfabeto = "ABCDEFGHIJKLMNOPQRSTUVWXYZ234567";
  const unsigned bits = static_cast<unsigned>(Soma[0] << 16 | Soma[1] << 8 | Soma[2]) >> 4;
  return {alfabeto[bits >> 15 & 31], alfabeto[bits >> 10 & 31], alfabeto[bits >> 5 & 31], alfabeto[bits & 31]};
}

std::string EmMaiusculas(std::string Texto) {
  for (char& letra : Texto) {
    if (letra >= 'a' && letra <= 'z') letra = static_cast<char>(letra - 'a' + 'A');
  }
  return Texto;
}

}  // namespace

std::optional<std::string> FazerNomeDOS(const std::string& NomeBase) {
  const std::string mesmo = EmMaiusculas(NomeBase);
  if (ConferirNomeDOS(mesmo).Qual == FaltaNoNome::Tipo::Nenhuma) return mesmo;
  const std::string utf8 = platform::ToUtf8(NomeBase);
  const auto soma = platform::Sha256(utf8);
  if (!soma) return std::nullopt;
  const std::string feito = Letras(utf8) + Digitos(*soma);
  return NomeSeguro(feito) ? feito : "_" + feito;  // four digits alone can spell a device
}
