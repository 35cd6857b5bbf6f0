#include "catalog/cls_DAT.h"
#include "savemanager/nomes.h"
#include "tests/fresh_machine.h"

namespace {

struct Nomes : FreshMachine {
  Nomes() {
    PutFile("C:\\Tolvaris\\tolvaris.dat", "|UM=Jogo Um||A=Igual||B=Igual||ACAO=Ação|"_ansi);
    Catalogo.Carregar();
  }
  cls_DAT Catalogo;
};

TEST_F(Nomes, AreInverseOnAllElevenExtensions) {
  const std::string jogos[][2] = {{"UM", "Jogo Um"}, {"ACAO", "Ação"_ansi}, {"NADA", "NADA"}, {"A.B", "A.B"}, {"", ""}};
  std::string padrao;
  for (const std::string extensao : {"srm", "zst", "zs1", "zs2", "zs3", "zs4", "zs5", "zs6", "zs7", "zs8", "zs9"}) {
    const char estado = extensao == "zst" ? '0' : extensao.back();
    const std::string fim = extensao == "srm" ? "" : std::string(" [State ") + estado + "]";
    for (const auto& [jogo, nome] : jogos) {
      EXPECT_EQ(NomeExibido(jogo + "." + extensao, Catalogo), nome + fim);
      EXPECT_EQ(NomeArquivo(nome + fim, Catalogo), jogo + "." + extensao);
    }
    padrao += (padrao.empty() ? "*." : ";*.") + extensao;
  }
  EXPECT_EQ(padrao, PadraoSalvamentos);
}

// A file, the text shown for it, and the file that the text stands for.
TEST_F(Nomes, OfOddFilesAndTexts) {
  const char* const casos[][3] = {
      {"um.Zs9", "Jogo Um [State 9]", "UM.zs9"},         {"GAME.zs", "GAME", "GAME.srm"},
      {"A [state 3]", "A [state 3]", "A [state 3].srm"}, {"X [State 3].zs5", "X [State 3] [State 5]", "X.zs3"},
      {"Jogo Um [State ", "Jogo Um [State ", "UM.zs"},
  };
  for (const auto& [arquivo, texto, volta] : casos) {
    EXPECT_EQ(NomeExibido(arquivo, Catalogo), texto);
    EXPECT_EQ(NomeArquivo(texto, Catalogo), volta) << texto;
  }
}

}  // namespace
