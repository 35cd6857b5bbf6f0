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
  std::size_t achados = 0;
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
      if (nome || chave) ++achados;
    }
  }
  EXPECT_TRUE(achados > 20000 && achados < 100000) << achados;
}

// Texts on which a build that looks at each run more than once would take minutes.
TEST(IndiceDoCatalogo, IsBuiltInOnePassOverHostileTexts) {
  for (const std::string padrao : {"=", "|", "|A=", "=|", "a", "|A=A="}) {
    std::string dados = "|";
    while (dados.size() < 1 << 18) dados += padrao;
    dados += "=|";
    const auto inicio = std::chrono::steady_clock::now();
    EXPECT_EQ(Indice(dados).Nome("A"), BuscarNome(dados, "A")) << padrao;
    EXPECT_LT(std::chrono::steady_clock::now() - inicio, std::chrono::seconds(10)) << padrao;
  }
}

}  // namespace
