// A language file beside the program translates what it shows.
#include "tests/windows/installation.h"
#include "tests/windows/main_window.h"

namespace {

using driver::Answer;
using driver::Message;
using driver::Program;

constexpr char English[] =
    "[TOLVARIS20]\r\n"
    "Jogar=Play\r\n"
    "Usar disquete para salvar o jogo=Keep saves on a floppy\r\n"
    "Deletar jogo=Delete game\r\n"
    "Importar jogo de...=| Import... |\r\n"
    "Configuração=Configuration\r\n"
    "O Tolvaris não foi configurado.=Tolvaris is not configured.\r\n"
    "Controle=Controller\r\n"
    "&Fechar=&Close\r\n"
    "Seta cima=Up\r\n"
    "Jogador 2=Player 2\r\n"
    "Informação=Note\r\n"
    "Erro=Error\r\n"
    "O jogo não foi encontrado.=The game is gone.\r\n";

TEST(Translation, OfMessagesControlsAndToolTips) {
  const Installation installation;
  installation.Put("language.ini", English);
  installation.Put("tolvariscfg.exe", "nunca executado");
  {
    const Program program(installation.CommandLine());
    const Message question = {"Configuration",
                              "Tolvaris is not configured.\r\n"
                              "Clique em 'Sim' para rodar o programa de auto-configuração.",
                              {IDYES, IDNO, IDCANCEL}};
    EXPECT_EQ(Answer(program, IDNO), question);
    EXPECT_SOON(program.HasEnded());
  }
  installation.Configure();
  installation.PutGames();
  installation.Set("AvisoControle", "");
  installation.Set("LRom", "Zebra");
  const Program program(installation.CommandLine());
  EXPECT_EQ(Answer(program, IDOK).Title, "Note");
  const driver::Window help = driver::FindVisible(program, "Controller");
  EXPECT_EQ(help.ChildAt(2040, 1560).Text(), "Up");
  EXPECT_EQ(help.ChildAt(3330, 2460).Text(), "Seta direita");
  help.Child("&Close").Click();

  const MainWindow window(program);
  EXPECT_EQ(window.Play.Text(), "Play");
  EXPECT_EQ(window.Floppy.Text(), "Keep saves on a floppy");
  std::vector<std::string> toolTips;
  for (const driver::Window& picture : window.Pictures) toolTips.push_back(picture.Text());
  const std::vector<std::string> expected = {"Ler/Gravar salvamento de jogos do disquete", "Baixar jogos da internet",
                                             " Import... ", "Exportar jogo para...", "Delete game"};
  EXPECT_EQ(toolTips, expected);

  installation.Remove("Roms\\ZEBRA.SMC");
  window.Play.Click();
  EXPECT_EQ(Answer(program, IDOK), (Message{"Error", "The game is gone.", {IDOK}}));
}

}  // namespace
