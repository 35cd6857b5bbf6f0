#include <gtest/gtest.h>

#include <chrono>
#include <random>
#include <string>

#include "catalog/busca.h"
#include "catalog/indice.h"

namespace {

// A text of few characters, so that keys, names and broken entries meet often.
std::string TextoAoAcaso(std::mt19937& acaso, std::size_t maximo) {
  std::string texto(acaso() % (maximo + 1), ' ');
  for (char& c : texto) c = "|=abAB|="[acaso() % 8];
  return texto;
}

TEST(IndiceDoCatalogo, AnswersAsThePlainSearchDoes) {
  std::mt19937 acaso(20);
  int achados = 0, semResposta = 0;
  for (std::size_t i = 0; i < 3000; ++i) {
    const std::string dados = TextoAoAcaso(acaso, i % 100);
    const Indice indice(dados);
    for (int j = 0; j < 40; ++j) {
      // Half of the lookups are for a piece of the text itself.
      const bool pedaco = j % 2 == 0 && !dados.empty();
      const std::string procurado = pedaco ? dados.substr(acaso() % dados.size(), acaso() % 7) : TextoAoAcaso(acaso, 4);
      const auto nome = BuscarNome(dados, procurado), chave = BuscarChave(dados, procurado);
      ASSERT_EQ(indice.Nome(procurado), nome) << dados << " key " << procurado;
      ASSERT_EQ(indice.Chave(procurado), chave) << dados << " name " << procurado;
      for (const bool achado : {nome.has_value(), chave.has_value()}) (achado ? achados : semResposta) += 1;
    }
  }
  EXPECT_GT(achados, 20000);
  EXPECT_GT(semResposta, 20000);
}

// Texts on which a build that looks at each run more than once would take minutes.
TEST(IndiceDoCatalogo, IsBuiltInOnePassOverHostileTexts) {
  for (const auto& [padrao, fim] :
       {std::pair("=", "|"), {"|", ""}, {"|A=", ""}, {"=|", ""}, {"a", "="}, {"|A=A=", "|"}}) {
    std::string dados = "|";
    while (dados.size() < 1 << 18) dados += padrao;
    dados += fim;
    const auto inicio = std::chrono::steady_clock::now();
    const Indice indice(dados);
    EXPECT_EQ(indice.Nome("A"), BuscarNome(dados, "A")) << padrao;
    EXPECT_EQ(indice.Chave("A"), BuscarChave(dados, "A")) << padrao;
    EXPECT_LT(std::chrono::steady_clock::now() - inicio, std::chrono::seconds(10)) << padrao;
  }
}

}  // namespace
