// Deleting a save on either side.
#include "tests/savemanager/janela.h"

namespace {

using namespace platform;

simulated::ShownMessage Pergunta(const std::string& texto) {
  return {texto, "Confirmar deleção"_ansi, Buttons::YesNoCancel, Icon::Question};
}

TEST_F(Salvamentos, AreDeletedOnTheirSideOnlyAfterYes) {
  const std::string inicio = "Deletar o salvamento do jogo 'Corrida 2 [State 0]' que está no "_ansi;
  for (const bool disquete : {true, false}) {
    for (const Answer resposta : {Answer::Yes, Answer::No, Answer::Cancel}) {
      Preparar();
      simulated::QueueAnswer(resposta);
      const bool sim = resposta == Answer::Yes;
      Abrir([&](Form4& janela) {
        ListBox &lista = disquete ? janela.List1 : janela.List2, &outra = disquete ? janela.List2 : janela.List1;
        Escolher(outra, "Corrida 2 [State 0]");
        Escolher(lista, "Corrida 2 [State 0]");
        simulated::PressKey(outra, 46);  // nothing is picked there any more
        simulated::Click(disquete ? janela.Image1 : janela.Image2);
        EXPECT_EQ(NadaEscolhido(janela), sim);
        EXPECT_EQ(lista.Count(), sim ? 1 : 2);
        EXPECT_EQ(simulated::Focused() == &lista, sim);
      });
      EXPECT_EQ(simulated::Content("A:\\DOIS.zst").has_value(), !disquete || !sim);
      EXPECT_EQ(simulated::Content("C:\\Saves\\DOIS.zst").has_value(), disquete || !sim);
      const std::string fim = disquete ? "Disquete (A:) ?" : "Computador ?";
      EXPECT_EQ(simulated::ShownMessages(), Mensagens{Pergunta(inicio + fim)});
    }
  }
}

TEST_F(Salvamentos, AreShownAndDeletedInTheLanguageOfTheTranslation) {
  ArquivoIdioma = "C:\\Tolvaris\\language.ini";
  simulated::PutFile(ArquivoIdioma,
                     "[TOLVARIS20]\r\nSalvamentos dos jogos=Saves\r\nExcluir=Delete\r\n Disquete =| Floppy |\r\n "
                     "Computador =PC\r\n&Fechar=&Close\r\n"
                     "Copiar do computador para o disquete=To the floppy\r\nSEMNOME [State 2]=X\r\n"
                     "Deletar o salvamento do jogo '=|Delete '|\r\n' que está no Computador ?=|' here?|"_ansi);
  simulated::QueueAnswer(Answer::Yes);
  Abrir([](Form4& janela) {
    EXPECT_EQ(janela.Caption() + janela.Frame1.Caption() + janela.Frame2.Caption() + janela.Command2.Caption(),
              "Saves Floppy PC&Close");
    Escolher(janela.List2, "SEMNOME [State 2]");
    EXPECT_EQ(janela.Image1.ToolTip() + janela.Image2.ToolTip() + janela.Command1.ToolTip(),
              "DeleteDeleteTo the floppy");
    simulated::PressKey(janela.List2, 13);
    EXPECT_EQ(janela.List2.Count(), 2) << "Enter does not delete";
    for (int vez = 0; vez < 2; ++vez) simulated::PressKey(janela.List2, 46);
    EXPECT_EQ(Textos(janela.List2), "Corrida 2 [State 0]|");
  });
  EXPECT_EQ(simulated::ShownMessages(), Mensagens{Pergunta("Delete 'SEMNOME [State 2]' here?")});
}

}  // namespace
