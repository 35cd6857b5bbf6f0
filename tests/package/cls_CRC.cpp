#include "package/cls_CRC.h"

#include <gtest/gtest.h>

#include <optional>
#include <string>

#include "platform/simulated/simulated.h"

namespace {

namespace simulated = platform::simulated;

constexpr std::size_t Pedaco = 1'048'576;
const std::string Caminho = "C:\\Roms\\JOGO.ZIP";

std::optional<std::string> TextoDe(cls_CRC& soma, const std::string& conteudo) {
  simulated::PutFile(Caminho, conteudo);
  platform::File arquivo(Caminho, platform::Access::Read);
  const std::optional<std::int64_t> valor = soma.CRC(arquivo);
  EXPECT_TRUE(arquivo.IsOpen());
  EXPECT_EQ(cls_CRC().CRC(conteudo), valor);  // the content's own checksum is its file's
  return valor ? std::optional(TextoCRC(*valor)) : std::nullopt;
}

TEST(ClsCRC, AddsTheValuesAtTheEndOfEveryChunk) {
  const struct {
    const char* Descricao;
    std::string Conteudo;
    std::optional<std::string> Texto;
  } casos[] = {
      {"less than a chunk", "123456789", "-873187034"},
      {"a value above zero", "abc", "891568578"},
      {"a chunk and one byte", std::string(Pedaco + 1, '\0'), "-2451737276"},
      {"two chunks and a rest", std::string(2 * Pedaco + 512, '\xFF'), "-3555091706"},
      {"nothing", "", std::nullopt},
      {"exactly a chunk", std::string(Pedaco, 'x'), std::nullopt},
      {"exactly two chunks", std::string(2 * Pedaco, 'x'), std::nullopt},
  };
  simulated::Reset();
  cls_CRC mesma;
  for (const auto& caso : casos) {
    cls_CRC nova;
    EXPECT_EQ(TextoDe(nova, caso.Conteudo), caso.Texto) << caso.Descricao;
    EXPECT_EQ(TextoDe(mesma, caso.Conteudo), caso.Texto) << caso.Descricao << ", by an object in use";
  }
}

TEST(ClsCRC, AnyReadThatFailsLeavesNoValue) {
  simulated::Reset();
  simulated::PutFile(Caminho, std::string(2 * Pedaco + 1, 'x'));
  int falhas = 0;
  for (bool falhou = true; falhou; ++falhas) {
    simulated::FailCall(falhas + 1);
    platform::File arquivo(Caminho, platform::Access::Read);
    const bool temValor = cls_CRC().CRC(arquivo).has_value();
    falhou = simulated::CallFailed();
    EXPECT_NE(temValor, falhou) << "call " << falhas + 1;
  }
  EXPECT_GT(falhas, 3);  // each of the three reads was among them
  platform::File ausente("C:\\Roms\\AUSENTE.ZIP", platform::Access::Read);
  EXPECT_FALSE(cls_CRC().CRC(ausente));
}

}  // namespace
