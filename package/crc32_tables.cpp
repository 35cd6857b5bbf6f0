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

std::uint32_t ComByte(std::uint32_t Registro, char Byte) {
  return (Registro >> 8) ^ Tabelas[0][(Registro ^ static_cast<unsigned char>(Byte)) & 0xFF];
}

std::uint32_t QuatroBytes(const char* Bytes) {
  std::uint32_t numero = 0;
  for (int i = 3; i >= 0; --i) numero = numero << 8 | static_cast<unsigned char>(Bytes[i]);
  return numero;
}

std::uint32_t QuatroTabelas(std::uint32_t Numero, std::size_t Ultima) {
  return Tabelas[Ultima][Numero & 0xFF] ^ Tabelas[Ultima - 1][Numero >> 8 & 0xFF] ^
         Tabelas[Ultima - 2][Numero >> 16 & 0xFF] ^ Tabelas[Ultima - 3][Numero >> 24];
}

}  // namespace

std::uint32_t AtualizarPorByte(std::uint32_t Registro, std::string_view Bytes) {
  for (const char byte : Bytes) Registro = ComByte(Registro, byte);
  return Registro;
}

std::uint32_t AtualizarPorFatias(std::uint32_t Registro, std::string_view Bytes) {
  for (; Bytes.size() >= Fatia; Bytes.remove_prefix(Fatia)) {
    const std::uint32_t primeiros = Registro ^ QuatroBytes(Bytes.data());
    const std::uint32_t ultimos = QuatroBytes(Bytes.data() + 4);
    Registro = QuatroTabelas(primeiros, 7) ^ QuatroTabelas(ultimos, 3);
  }
  return AtualizarPorByte(Registro, Bytes);
}

std::uint32_t Atualizar(std::uint32_t Registro, std::string_view Bytes) {
  return TemMultiplicacao() ? AtualizarPorDobras(Registro, Bytes) : AtualizarPorFatias(Registro, Bytes);
}

}  // namespace CRC32
