// Opening the save-file manager, its two panes, and picking in them.
#include "resources/ids.h"
#include "tests/savemanager/janela.h"

namespace {

using namespace platform;

TEST_F(Salvamentos, AreListedUnderTheNamesOfTheirGames) {
  for (const char* const arquivo : {"A:\\UM.ZS3", "A:\\um.zst", "A:\\UM.txt"}) simulated::PutFile(arquivo, "x");
  Abrir([](Form4& janela) {
    EXPECT_EQ(Textos(janela.List1), "Corrida 2 [State 0]|Jogo Um|Jogo Um [State 0]|Jogo Um [State 3]|");
    EXPECT_EQ(Textos(janela.List2), "Corrida 2 [State 0]|SEMNOME [State 2]|");
    EXPECT_TRUE(simulated::RedrawIsOn(janela.List1) && simulated::RedrawIsOn(janela.List2));
    simulated::Click(janela.Command2);
    EXPECT_TRUE(janela.IsClosed());
  });
}

TEST_F(Salvamentos, OfADirectoryThatIsEmptyOrCannotBeReadLeaveThePaneEmptyAndEnabled) {
  simulated::PutDirectory("C:\\Vazio");
  simulated::RemoveDisk('A');
  for (const char* const diretorio : {"C:\\Vazio\\", "C:\\Nenhum\\", "Z:\\", ""}) {
    DirSaves = diretorio;
    Abrir([](Form4& janela) {
      EXPECT_EQ(Textos(janela.List1) + Textos(janela.List2), "") << DirSaves;
      EXPECT_TRUE(janela.List1.Enabled() && janela.List2.Enabled()) << DirSaves;
      janela.List2_Click();
      janela.Command1_Click();
      EXPECT_TRUE(NadaEscolhido(janela)) << "nothing can be picked";
    });
  }
}

// The direction, the selections of both lists, which delete pictures are seen, the copy button, and the file.
std::string Escolha(const Form4& janela) {
  std::string texto = std::to_string(static_cast<int>(janela.Direcao));
  for (const ListBox* lista : {&janela.List1, &janela.List2}) texto += " " + std::to_string(lista->Selected());
  texto += std::string(janela.Image1.Visible() ? " left" : "") + (janela.Image2.Visible() ? " right" : "");
  if (janela.Command1.Visible()) {
    texto += simulated::IconOf(janela.Command1) == ICONE_SETA_DIREITA ? " -> " : " <- ";
    texto += janela.Command1.ToolTip();
  }
  return texto + ": " + janela.ArquivoAtual;
}

TEST_F(Salvamentos, PickedDecideTheDirectionAndTheFile) {
  const struct {
    ListBox Form4::*lista;
    int indice;
    const char* depois;
  } passos[] = {
      {&Form4::List1, 1, "1 1 -1 left -> Copiar do disquete para o computador: UM.srm"},
      {&Form4::List1, 0, "1 0 -1 left -> Copiar do disquete para o computador: DOIS.zst"},
      {&Form4::List2, 1, "2 -1 1 right <- Copiar do computador para o disquete: SEMNOME.zs2"},
      {&Form4::List1, 1, "1 1 -1 left -> Copiar do disquete para o computador: UM.srm"},
  };
  Abrir([&](Form4& janela) {
    for (const auto& passo : passos) {
      simulated::Choose(janela.*passo.lista, passo.indice);
      EXPECT_EQ(Escolha(janela), passo.depois);
    }
  });
  Abrir([](Form4& janela) { EXPECT_EQ(Escolha(janela), "0 -1 -1: ") << "each opening starts afresh"; });
}

}  // namespace
