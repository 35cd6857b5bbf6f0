#include "catalog/cls_DAT.h"
#include "savemanager/nomes.h"
#include "tests/fresh_machine.h"

namespace {

struct SaveNames : FreshMachine {
  SaveNames() {
    PutFile("C:\\Tolvaris\\tolvaris.dat", "|UM=Jogo Um||A=Igual||B=Igual||ACAO=Ação|"_ansi);
    Catalogue.Carregar();
  }
  cls_DAT Catalogue;
};

TEST_F(SaveNames, AreInverseOnAllElevenExtensions) {
  const std::string games[][2] = {{"UM", "Jogo Um"}, {"ACAO", "Ação"_ansi}, {"NADA", "NADA"}, {"A.B", "A.B"}, {"", ""}};
  std::string pattern;
  for (const std::string extension : {"srm", "zst", "zs1", "zs2", "zs3", "zs4", "zs5", "zs6", "zs7", "zs8", "zs9"}) {
    const char state = extension == "zst" ? '0' : extension.back();
    const std::string suffix = extension == "srm" ? "" : std::string(" [State ") + state + "]";
    for (const auto& [game, name] : games) {
      EXPECT_EQ(NomeExibido(game + "." + extension, Catalogue), name + suffix);
      EXPECT_EQ(NomeArquivo(name + suffix, Catalogue), game + "." + extension);
    }
    pattern += (pattern.empty() ? "*." : ";*.") + extension;
  }
  EXPECT_EQ(pattern, PadraoSalvamentos);
}

TEST_F(SaveNames, OfOddFilesAndTexts) {
  const struct {
    const char *Name, *File, *Text, *StandsFor;  // a file, the text shown for it, and the file that the text stands for
  } cases[] = {
      {"an extension in another letter case", "um.Zs9", "Jogo Um [State 9]", "UM.zs9"},
      {"an extension without a number", "GAME.zs", "GAME", "GAME.srm"},
      {"a mark in another letter case", "A [state 3]", "A [state 3]", "A [state 3].srm"},
      {"two marks", "X [State 3].zs5", "X [State 3] [State 5]", "X.zs3"},
      {"a mark that is cut off", "Jogo Um [State ", "Jogo Um [State ", "UM.zs"},
  };
  for (const auto& [name, file, text, standsFor] : cases) {
    EXPECT_EQ(NomeExibido(file, Catalogue), text) << name;
    EXPECT_EQ(NomeArquivo(text, Catalogue), standsFor) << name;
  }
}

}  // namespace
