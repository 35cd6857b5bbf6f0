#include "package/nomes.h"

#include <algorithm>
#include <array>
#include <cstddef>
#include <cstdint>
#include <iterator>

#include "package/pacote.h"
#include "platform/text.h"

namespace {

using Tipo = FaltaNoNome::Tipo;

constexpr std::size_t MaiorNome = 100, MaiorNomeDOS = 8;  // characters
constexpr std::string_view Proibidos = "\\/:*?\"<>|=";

// What code page 1252 has beside the characters up to U+00FF.
constexpr std::uint32_t Outros[] = {0x20AC, 0x201A, 0x0192, 0x201E, 0x2026, 0x2020, 0x2021, 0x02C6, 0x2030,
                                    0x0160, 0x2039, 0x0152, 0x017D, 0x2018, 0x2019, 0x201C, 0x201D, 0x2022,
                                    0x2013, 0x2014, 0x02DC, 0x2122, 0x0161, 0x203A, 0x0153, 0x017E, 0x0178};

struct Caractere {
  std::uint32_t Numero;
  std::string_view Bytes;
};

bool Continua(char Byte) { return (Byte & 0xC0) == 0x80; }

// Takes the next character off the front of a text that is UTF-8.
Caractere Tirar(std::string_view& Texto) {
  std::size_t tamanho = 1;
  while (tamanho < Texto.size() && Continua(Texto[tamanho])) ++tamanho;
  std::uint32_t numero = static_cast<unsigned char>(Texto[0]);
  if (tamanho > 1) numero &= 0x7FU >> tamanho;
  for (std::size_t i = 1; i < tamanho; ++i) numero = numero << 6 | (static_cast<unsigned char>(Texto[i]) & 0x3FU);
  const Caractere tirado{numero, Texto.substr(0, tamanho)};
  Texto.remove_prefix(tamanho);
  return tirado;
}

bool Invisivel(std::uint32_t Numero) {
  constexpr std::uint32_t hifenOpcional = 0xAD;
  return Numero < 0x20 || (Numero >= 0x7F && Numero < 0xA0) || Numero == hifenOpcional;
}

bool Permitido(const Caractere& Cada) {
  if (Invisivel(Cada.Numero)) return false;
  if (Cada.Numero > 0xFF) return std::ranges::find(Outros, Cada.Numero) != std::end(Outros);
  return Cada.Bytes.size() > 1 || Proibidos.find(Cada.Bytes[0]) == std::string_view::npos;
}

std::string ComoSeVe(const Caractere& Cada) {
  if (!Invisivel(Cada.Numero)) return std::string(Cada.Bytes);
  constexpr std::string_view digitos = "0123456789ABCDEF";
  return {'U', '+', '0', '0', digitos[Cada.Numero >> 4 & 0xF], digitos[Cada.Numero & 0xF]};
}

bool BrancoOuPonto(const Caractere& Cada) {
  constexpr std::uint32_t brancoFixo = 0xA0;
  return Cada.Numero == ' ' || Cada.Numero == '.' || Cada.Numero == brancoFixo;
}

}  // namespace

FaltaNoNome ConferirNome(std::string_view Utf8) {
  if (Utf8.empty()) return {Tipo::Vazio};
  std::size_t quantos = 0;
  bool ponta = false;
  for (std::string_view resto = Utf8; !resto.empty(); ++quantos) {
    const Caractere cada = Tirar(resto);
    if (!Permitido(cada)) return {Tipo::Caractere, ComoSeVe(cada)};
    if (BrancoOuPonto(cada) && (quantos == 0 || resto.empty())) ponta = true;
  }
  if (quantos > MaiorNome) return {Tipo::Longo};
  if (ponta) return {Tipo::Ponta};
  return {NomeSeguro(platform::FromUtf8(Utf8)) ? Tipo::Nenhuma : Tipo::Dispositivo};
}

FaltaNoNome ConferirNomeDOS(std::string_view Nome) {
  if (Nome.empty()) return {Tipo::Vazio};
  for (std::string_view resto = Nome; !resto.empty();) {
    const Caractere cada = Tirar(resto);
    const auto numero = cada.Numero;
    const bool letra = (numero >= 'A' && numero <= 'Z') || (numero >= '0' && numero <= '9');
    if (!letra && numero != '_' && numero != '-') return {Tipo::Caractere, ComoSeVe(cada)};
  }
  if (Nome.size() > MaiorNomeDOS) return {Tipo::Longo};
  return {NomeSeguro(Nome) ? Tipo::Nenhuma : Tipo::Dispositivo};
}
