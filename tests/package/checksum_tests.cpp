// The checksum of a ROM; and below it every way through the CRC-32 against the plain one, a table look-up for each
// byte.
#include <algorithm>
#include <random>

#include "package/cls_CRC.h"
#include "package/crc32.h"
#include "tests/falhas.h"

namespace {

using platform::simulated::PutFile;

constexpr std::size_t Pedaco = 1'048'576;
const std::string Caminho = "C:\\Roms\\JOGO.ZIP";

TEST(ClsCRC, AddsTheValuesAtTheEndOfEveryChunk) {
  const std::pair<std::string, std::string> casos[] = {
      {"123456789", "-873187034"},
      {"abc", "891568578"},
      {std::string(Pedaco + 1, '\0'), "-2451737276"},
      {std::string(2 * Pedaco + 512, '\xFF'), "-3555091706"},
      {"", "none"},
      {std::string(Pedaco, 'x'), "none"},
      {std::string(2 * Pedaco, 'x'), "none"},
  };
  platform::simulated::Reset();
  cls_CRC mesma;
  for (const auto& [conteudo, texto] : casos) {
    PutFile(Caminho, conteudo);
    platform::File arquivo(Caminho, platform::Access::Read);
    cls_CRC nova;
    for (const auto& valor : {nova.CRC(arquivo), nova.CRC(conteudo), mesma.CRC(arquivo), mesma.CRC(conteudo)}) {
      EXPECT_EQ(valor ? TextoCRC(*valor) : "none", texto) << conteudo.size();
    }
    EXPECT_TRUE(arquivo.IsOpen());
  }
}

TEST(ClsCRC, AnyReadThatFailsLeavesNoValue) {
  bool temValor = false, falhou = false;
  const auto somar = [&] {
    platform::File arquivo(Caminho, platform::Access::Read);
    temValor = cls_CRC().CRC(arquivo).has_value();
    falhou = platform::simulated::CallFailed();
  };
  const auto preparar = [] { PutFile(Caminho, std::string(2 * Pedaco + 1, 'x')); };
  EXPECT_GT(ComCadaFalha(preparar, somar, [&] { EXPECT_NE(temValor, falhou); }), 3);  // each of three reads among them
}

std::string BytesQuaisquer(std::mt19937& acaso, std::size_t quantos) {
  std::string bytes(quantos, '\0');
  std::ranges::generate(bytes, [&] { return static_cast<char>(acaso()); });
  return bytes;
}

TEST(Crc32, AllWaysAgreeOnEveryLengthAndAlignmentAndWhereAnotherStopped) {
  EXPECT_EQ(~CRC32::AtualizarPorByte(CRC32::Inicial, "123456789"), 0xCBF43926u);
  EXPECT_EQ(CRC32::AtualizarPorByte(77, ""), 77u);
  std::vector maneiras = {CRC32::Atualizar, CRC32::AtualizarPorFatias};
  if (CRC32::TemMultiplicacao()) maneiras.push_back(CRC32::AtualizarPorDobras);
  std::mt19937 acaso(1);
  const std::string alguns = BytesQuaisquer(acaso, 600);
  for (const auto maneira : maneiras) {
    for (std::size_t inicio = 0; inicio < 16; ++inicio) {
      for (std::size_t tamanho = 0; tamanho < alguns.size() - inicio; ++tamanho) {
        const std::string_view parte = std::string_view(alguns).substr(inicio, tamanho);
        const auto registro = static_cast<std::uint32_t>(acaso());
        ASSERT_EQ(maneira(registro, parte), CRC32::AtualizarPorByte(registro, parte)) << inicio << " " << tamanho;
      }
    }
  }
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
