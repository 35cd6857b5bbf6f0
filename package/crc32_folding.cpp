// The way by carry-less multiplication (PCLMULQDQ), for x86-64 processors that have it.
//
// The bytes of a file are the coefficients of one long polynomial over the bits, the file's first bit the highest one,
// and the register only depends on that polynomial modulo P. So a block of 128 bits that stands D bits before another
// one may be multiplied by x^D, reduced modulo P, and added to that other block: the file is folded, and gets shorter.
//
// In memory, as in the register, bits are reversed: bit k of a 64-bit half stands for x^(63-k). A block is
//     first * x^64 + second,    so    block * x^D  =  first * x^(D+64) + second * x^D.
// With halves a and b the instruction gives bit k of its 128-bit result the weight x^(126-k), while bit k of a block
// weighs x^(127-k). Read as a block the result is therefore a * b * x, and the factors below have one x less.
// A factor is below x^32; in a reversed half it lies in the upper 32 bits. The result of one half is below x^96, so
// it fits into a block.
#include <array>
#include <cstddef>
#include <cstdint>
#include <string_view>

#include "package/crc32.h"

#if defined(__x86_64__)

#include <emmintrin.h>
#include <wmmintrin.h>

namespace CRC32 {
namespace {

constexpr std::size_t Bloco = sizeof(__m128i);  // bytes
constexpr std::size_t Volta = 4 * Bloco;        // four blocks are folded side by side, so that none waits for another

// x^n modulo P as a half of a block.
constexpr std::uint64_t Potencia(int N) {
  std::uint32_t resto = 0x80000000;  // x^0
  for (; N > 0; --N) resto = VezesX(resto);
  return std::uint64_t{resto} << 32;
}

inline __m128i Ler(const char* Bytes) { return _mm_loadu_si128(reinterpret_cast<const __m128i*>(Bytes)); }

// The block `Seguinte` with `Anterior`, which stands `Distancia` bits before it, folded into it.
template <int Distancia>
[[gnu::target("pclmul"), gnu::always_inline]] inline __m128i Dobrar(__m128i Anterior, __m128i Seguinte) {
  constexpr auto paraPrimeira = static_cast<long long>(Potencia(Distancia + 64 - 1));
  constexpr auto paraSegunda = static_cast<long long>(Potencia(Distancia - 1));
  const __m128i fatores = _mm_set_epi64x(paraSegunda, paraPrimeira);
  const __m128i primeira = _mm_clmulepi64_si128(Anterior, fatores, 0x00);
  const __m128i segunda = _mm_clmulepi64_si128(Anterior, fatores, 0x11);
  return _mm_xor_si128(Seguinte, _mm_xor_si128(primeira, segunda));
}

// Folds all whole blocks into one; at least four of them. What is left in `Bytes` is shorter than a block.
[[gnu::target("pclmul")]] __m128i DobrarTudo(std::uint32_t Registro, std::string_view& Bytes) {
  __m128i a = _mm_xor_si128(Ler(Bytes.data()), _mm_cvtsi32_si128(static_cast<int>(Registro)));
  __m128i b = Ler(Bytes.data() + Bloco);
  __m128i c = Ler(Bytes.data() + 2 * Bloco);
  __m128i d = Ler(Bytes.data() + 3 * Bloco);
  for (Bytes.remove_prefix(Volta); Bytes.size() >= Volta; Bytes.remove_prefix(Volta)) {
    a = Dobrar<512>(a, Ler(Bytes.data()));
    b = Dobrar<512>(b, Ler(Bytes.data() + Bloco));
    c = Dobrar<512>(c, Ler(Bytes.data() + 2 * Bloco));
    d = Dobrar<512>(d, Ler(Bytes.data() + 3 * Bloco));
  }
  __m128i bloco = Dobrar<128>(Dobrar<128>(Dobrar<128>(a, b), c), d);
  for (; Bytes.size() >= Bloco; Bytes.remove_prefix(Bloco)) bloco = Dobrar<128>(bloco, Ler(Bytes.data()));
  return bloco;
}

}  // namespace

bool TemMultiplicacao() { return __builtin_cpu_supports("pclmul") != 0; }

// The register is folded in with the first four bytes, so the block that remains goes through a register of zero.
std::uint32_t AtualizarPorDobras(std::uint32_t Registro, std::string_view Bytes) {
  if (Bytes.size() < Volta) return AtualizarPorFatias(Registro, Bytes);
  std::array<char, Bloco> bloco{};
  _mm_storeu_si128(reinterpret_cast<__m128i*>(bloco.data()), DobrarTudo(Registro, Bytes));
  return AtualizarPorFatias(AtualizarPorFatias(0, {bloco.data(), Bloco}), Bytes);
}

}  // namespace CRC32

#else

namespace CRC32 {

bool TemMultiplicacao() { return false; }

std::uint32_t AtualizarPorDobras(std::uint32_t registro, std::string_view bytes) {
  return AtualizarPorFatias(registro, bytes);
}

}  // namespace CRC32

#endif
