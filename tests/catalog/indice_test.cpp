#include "catalog/indice.h"

#include <gtest/gtest.h>

#include <chrono>
#include <random>
#include <string>

#include "catalog/busca.h"

namespace {

// A text of few characters, so that keys, names and broken entries meet often.
std::string TextoAoAcaso(std::mt19937& acaso, std::size_t maximo) {
  static constexpr char caracteres[] = {'|', '=', 'a', 'b', 'A', 'B', '|', '='};
  std::string texto(std::uniform_int_distribution<std::size_t>(0, maximo)(acaso), ' ');
  for (char& c : texto) c = caracteres[std::uniform_int_distribution<std::size_t>(0, 7)(acaso)];
  return texto;
}

TEST(IndiceDoCatalogo, AnswersAsThePlainSearchDoes) {
  std::mt19937 acaso(20);
  int achados = 0, semResposta = 0;
  for (int i = 0; i < 3000; ++i) {
    const std::string dados = TextoAoAcaso(acaso, i % 100);
    const Indice indice(dados);
    for (int j = 0; j < 40; ++j) {
      // Half of the lookups are for a piece of the text itself.
      std::string procurado = TextoAoAcaso(acaso, 4);
      if (j % 2 == 0 && !dados.empty()) {
        procurado = dados.substr(std::uniform_int_distribution<std::size_t>(0, dados.size() - 1)(acaso),
                                 std::uniform_int_distribution<std::size_t>(0, 6)(acaso));
      }
      const auto nome = BuscarNome(dados, procurado);
      const auto chave = BuscarChave(dados, procurado);
      ASSERT_EQ(indice.Nome(procurado), nome) << dados << " key " << procurado;
      ASSERT_EQ(indice.Chave(procurado), chave) << dados << " name " << procurado;
      (nome ? achados : semResposta) += 1;
      (chave ? achados : semResposta) += 1;
    }
  }
  EXPECT_EQ(achados + semResposta, 240000);
  EXPECT_GT(achados, 20000);
  EXPECT_GT(semResposta, 20000);
}

// Texts on which a build that looks at each run more than once would take minutes.
TEST(IndiceDoCatalogo, IsBuiltInOnePassOverHostileTexts) {
  constexpr std::size_t tamanho = 1 << 18;
  const struct {
    std::string Padrao, Fim;
  } casos[] = {{"=", "|"}, {"|", ""}, {"|A=", ""}, {"=|", ""}, {"a", "="}, {"A=B", "|"}, {"|A=A=", "|"}};
  for (const auto& caso : casos) {
    std::string dados = "|";
    while (dados.size() < tamanho) dados += caso.Padrao;
    dados += caso.Fim;
    const auto inicio = std::chrono::steady_clock::now();
    const Indice indice(dados);
    EXPECT_EQ(indice.Nome("A"), BuscarNome(dados, "A")) << caso.Padrao;
    EXPECT_EQ(indice.Chave("A"), BuscarChave(dados, "A")) << caso.Padrao;
    EXPECT_LT(std::chrono::steady_clock::now() - inicio, std::chrono::seconds(10)) << caso.Padrao;
  }
}

}  // namespace
