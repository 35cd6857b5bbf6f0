// The standard CRC-32 (polynomial 0x04C11DB7, bytes taken least significant bit first) as updates of a register with
// bytes. The register starts as Inicial; its complement is the checksum of all bytes it has been updated with.
#pragma once

#include <cstdint>
#include <string_view>

namespace CRC32 {

inline constexpr std::uint32_t Inicial = 0xFFFFFFFF;

// The polynomial as the register holds it: bit 31 stands for x^0, bit 0 for x^31, and x^32 is left out.
inline constexpr std::uint32_t Polinomio = 0xEDB88320;

// The register times x, modulo the polynomial.
constexpr std::uint32_t VezesX(std::uint32_t Registro) {
  return (Registro >> 1) ^ ((Registro & 1) != 0 ? Polinomio : 0);
}

// The register after these bytes, by the fastest way that this processor knows.
std::uint32_t Atualizar(std::uint32_t Registro, std::string_view Bytes);

// One look-up in a table for each byte. All other ways are held against this one.
std::uint32_t AtualizarPorByte(std::uint32_t Registro, std::string_view Bytes);

// Eight bytes at a time, with eight tables: for every processor.
std::uint32_t AtualizarPorFatias(std::uint32_t Registro, std::string_view Bytes);

// Sixty-four bytes at a time, by carry-less multiplication: only where TemMultiplicacao() says that it can run.
std::uint32_t AtualizarPorDobras(std::uint32_t Registro, std::string_view Bytes);
bool TemMultiplicacao();

}  // namespace CRC32
