// The ways through tables, and the choice of the fastest way.
#include <array>
#include <cstddef>
#include <cstdint>
#include <string_view>

#include "package/crc32.h"

namespace CRC32 {
namespace {

constexpr std::size_t Fatia = 8;  // bytes

using Tabela = std::array<std::uint32_t, 256>;

// Table k takes a byte to what is left of it in the register after it and k bytes of zero have been through.
constexpr std::array<Tabela, Fatia> MontarTabelas() {
  std::array<Tabela, Fatia> tabelas{};
  for (std::uint32_t n = 0; n < 256; ++n) {
    std::uint32_t registro = n;
    for (Tabela& tabela : tabelas) {
      for (int bit = 0; bit < 8; ++bit) registro = VezesX(registro);
      tabela[n] = registro;
    }
  }
  return tabelas;
}

constexpr std::array<Tabela, Fatia> Tabelas = MontarTabelas();
static_assert(Tabelas[0][1] == 0x77073096 && Tabelas[0][128] == 0xEDB88320 && Tabelas[0][255] == 0x2D02EF8D);

std::uint32_t ComByte(std::uint32_t registro, char byte) {
  return (registro >> 8) ^ Tabelas[0][(registro ^ static_cast<unsigned char>(byte)) & 0xFF];
}

std::uint32_t QuatroBytes(const char* bytes) {
  std::uint32_t numero = 0;
  for (int i = 3; i >= 0; --i) numero = numero << 8 | static_cast<unsigned char>(bytes[i]);
  return numero;
}

std::uint32_t QuatroTabelas(std::uint32_t numero, std::size_t ultima) {
  return Tabelas[ultima][numero & 0xFF] ^ Tabelas[ultima - 1][numero >> 8 & 0xFF] ^
         Tabelas[ultima - 2][numero >> 16 & 0xFF] ^ Tabelas[ultima - 3][numero >> 24];
}

}  // namespace

std::uint32_t AtualizarPorByte(std::uint32_t registro, std::string_view bytes) {
  for (const char byte : bytes) registro = ComByte(registro, byte);
  return registro;
}

std::uint32_t AtualizarPorFatias(std::uint32_t registro, std::string_view bytes) {
  for (; bytes.size() >= Fatia; bytes.remove_prefix(Fatia)) {
    const std::uint32_t primeiros = registro ^ QuatroBytes(bytes.data());
    const std::uint32_t ultimos = QuatroBytes(bytes.data() + 4);
    registro = QuatroTabelas(primeiros, 7) ^ QuatroTabelas(ultimos, 3);
  }
  return AtualizarPorByte(registro, bytes);
}

std::uint32_t Atualizar(std::uint32_t registro, std::string_view bytes) {
  return TemMultiplicacao() ? AtualizarPorDobras(registro, bytes) : AtualizarPorFatias(registro, bytes);
}

}  // namespace CRC32
