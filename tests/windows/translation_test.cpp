// A language file beside the program translates what it shows.
#include "tests/windows/installation.h"

namespace {

class Translation : public Installation {};

TEST_F(Translation, OfMessagesControlsAndToolTips) {
  Put("language.ini",
      "[TOLVARIS20]\r\n"
      "Jogar=Play\r\n"
      "Usar disquete para salvar o jogo=Keep saves on a floppy\r\n"
      "Deletar jogo=Delete game\r\n"
      "Importar jogo de...=| Import... |\r\n"
      "Erro=Error\r\n"
      "O jogo não foi encontrado.=The game is gone.\r\n");
  Set("LRom", "Zebra");
  Start();
  EXPECT_EQ(window->Play.Text(), "Play");
  EXPECT_EQ(window->Floppy.Text(), "Keep saves on a floppy");
  Texts toolTips;
  for (const Window& picture : window->Pictures) toolTips.push_back(picture.Text());
  EXPECT_EQ(toolTips, (Texts{"Ler/Gravar salvamento de jogos do disquete", "Baixar jogos da internet", " Import... ",
                             "Exportar jogo para...", "Delete game"}));
  Remove("Roms\\ZEBRA.SMC");
  window->Play.Click();
  EXPECT_EQ(Answer(IDOK), (Message{"Error", "The game is gone.", {IDOK}}));
}

}  // namespace
