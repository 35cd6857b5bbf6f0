// The checksum of a ROM; and below it every way through the CRC-32 against the plain one, a table look-up for each
// byte.
#include <algorithm>
#include <random>

#include "package/cls_CRC.h"
#include "package/crc32.h"
#include "tests/fresh_machine.h"

namespace {

constexpr std::size_t Pedaco = 1'048'576;
const std::string Caminho = "C:\\Roms\\JOGO.ZIP";

TEST(ClsCRC, AddsTheValuesAtTheEndOfEveryChunk) {
  const std::pair<std::string, std::string> casos[] = {
      {"123456789", "-873187034"},
      {"abc", "891568578"},
      {std::string(Pedaco + 1, '\0'), "-2451737276"},
      {std::string(2 * Pedaco + 512, '\xFF'), "-3555091706"},
      {"", "none"},
      {std::string(2 * Pedaco, 'x'), "none"},
  };
  Reset();
  cls_CRC soma;  // the same for all: nothing is left from one file to the next
  for (const auto& [conteudo, texto] : casos) {
    PutFile(Caminho, conteudo);
    platform::File arquivo(Caminho, platform::Access::Read);
    for (const auto& valor : {soma.CRC(arquivo), soma.CRC(conteudo)}) {
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
    falhou = CallFailed();
  };
  const auto preparar = [] { PutFile(Caminho, std::string(2 * Pedaco + 1, 'x')); };
  EXPECT_GT(WithEachFault(preparar, somar, [&] { EXPECT_NE(temValor, falhou); }), 3);  // each of three reads among them
}

// The register is all that is carried on, so any register stands for bytes that another way has taken before.
TEST(Crc32, AllWaysAgreeOnEveryLengthWhateverTheAlignmentAndTheRegister) {
  std::vector maneiras = {CRC32::Atualizar, CRC32::AtualizarPorFatias};
  if (CRC32::TemMultiplicacao()) maneiras.push_back(CRC32::AtualizarPorDobras);
  std::mt19937 acaso(1);
  std::string bytes(3'000, '\0');
  std::ranges::generate(bytes, [&] { return static_cast<char>(acaso()); });
  for (const auto maneira : maneiras) {
    for (std::size_t tamanho = 0; tamanho < bytes.size() - 16; ++tamanho) {
      const std::string_view parte = std::string_view(bytes).substr(acaso() % 16, tamanho);
      const auto registro = static_cast<std::uint32_t>(acaso());
      ASSERT_EQ(maneira(registro, parte), CRC32::AtualizarPorByte(registro, parte)) << tamanho;
    }
  }
}

}  // namespace
