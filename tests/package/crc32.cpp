// Every way through the CRC-32 against the plain one: a table look-up for each byte.
#include "package/crc32.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <random>
#include <string>
#include <vector>

namespace {

using Maneira = std::uint32_t (*)(std::uint32_t, std::string_view);

std::vector<Maneira> Maneiras() {
  std::vector<Maneira> maneiras = {CRC32::Atualizar, CRC32::AtualizarPorFatias};
  if (CRC32::TemMultiplicacao()) maneiras.push_back(CRC32::AtualizarPorDobras);
  return maneiras;
}

std::string BytesQuaisquer(std::mt19937& acaso, std::size_t quantos) {
  std::string bytes(quantos, '\0');
  std::ranges::generate(bytes, [&] { return static_cast<char>(acaso()); });
  return bytes;
}

TEST(Crc32, ByteByByteGivesTheCheckValue) {
  EXPECT_EQ(~CRC32::AtualizarPorByte(CRC32::Inicial, "123456789"), 0xCBF43926u);
  EXPECT_EQ(CRC32::AtualizarPorByte(77, ""), 77u);
}

TEST(Crc32, AllWaysAgreeOnEveryLengthAndAlignment) {
  std::mt19937 acaso(1);
  const std::string bytes = BytesQuaisquer(acaso, 600);
  for (const Maneira maneira : Maneiras()) {
    for (std::size_t inicio = 0; inicio < 16; ++inicio) {
      for (std::size_t tamanho = 0; tamanho < bytes.size() - inicio; ++tamanho) {
        const std::string_view parte = std::string_view(bytes).substr(inicio, tamanho);
        const auto registro = static_cast<std::uint32_t>(acaso());
        ASSERT_EQ(maneira(registro, parte), CRC32::AtualizarPorByte(registro, parte)) << inicio << " " << tamanho;
      }
    }
  }
}

TEST(Crc32, OneWayContinuesWhereAnotherStopped) {
  std::mt19937 acaso(2);
  const std::vector<Maneira> maneiras = Maneiras();
  for (int vez = 0; vez < 200; ++vez) {
    const std::string bytes = BytesQuaisquer(acaso, acaso() % 20'000);
    std::uint32_t registro = CRC32::Inicial;
    for (std::string_view resto = bytes; !resto.empty();) {
      const std::size_t parte = std::min<std::size_t>(resto.size(), acaso() % 3'000);
      registro = maneiras[acaso() % maneiras.size()](registro, resto.substr(0, parte));
      resto.remove_prefix(parte);
    }
    ASSERT_EQ(registro, CRC32::AtualizarPorByte(CRC32::Inicial, bytes)) << bytes.size();
  }
}

}  // namespace
