#include "keeper/nome_dos.h"

#include <string_view>

#include "package/nomes.h"
#include "package/pacote.h"
#include "platform/hash.h"
#include "platform/text.h"

namespace {

// The letters of U+00C0 to U+00FF without their accents; a blank where there is no such letter.
constexpr std::string_view SemAcento = "AAAAAAACEEEEIIIIDNOOOOO OUUUUYTSAAAAAAACEEEEIIIIDNOOOOO OUUUUYTY";
static_assert(SemAcento.size() == 64);

char LetraDOS(unsigned char letra) {
  if (letra >= 'a' && letra <= 'z') return static_cast<char>(letra - 'a' + 'A');
  return (letra >= 'A' && letra <= 'Z') || (letra >= '0' && letra <= '9') ? static_cast<char>(letra) : ' ';
}

std::string Letras(std::string_view utf8) {
  constexpr unsigned char antesDeC0 = 0xC3;  // the first byte of U+00C0 to U+00FF
  constexpr std::size_t quantas = 4;
  std::string letras;
  for (std::size_t i = 0; i < utf8.size() && letras.size() < quantas; ++i) {
    const auto byte = static_cast<unsigned char>(utf8[i]);
    const bool acentuada = byte == antesDeC0 && i + 1 < utf8.size();
    const char letra = acentuada ? SemAcento[static_cast<unsigned char>(utf8[++i]) & 0x3F] : LetraDOS(byte);
    if (letra != ' ') letras += letra;
  }
  return letras;
}

std::string Digitos(const platform::Sha256Value& soma) {
  constexpr std::string_view alfabeto = "ABCDEFGHIJKLMNOPQRSTUVWXYZ234567";
  const unsigned bits = static_cast<unsigned>(soma[0] << 16 | soma[1] << 8 | soma[2]) >> 4;
  return {alfabeto[bits >> 15 & 31], alfabeto[bits >> 10 & 31], alfabeto[bits >> 5 & 31], alfabeto[bits & 31]};
}

std::string EmMaiusculas(std::string texto) {
  for (char& letra : texto) {
    if (letra >= 'a' && letra <= 'z') letra = static_cast<char>(letra - 'a' + 'A');
  }
  return texto;
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
