// How a screen reader calls the controls: by the name that it is given, else by the tool tip or the text.
#include "autoconfig/FormCfg.h"
#include "controller/Form3.h"
#include "savemanager/Form4.h"
#include "tests/mainwindow/menu.h"

namespace {

using platform::Window;

Texts NamesOf(const Window& window) {
  Texts names;
  for (const platform::Control* each : ControlsOf(window)) {
    const std::string text = each->ToolTip().empty() ? each->Caption() : each->ToolTip();
    names.push_back(platform::ToUtf8(each->AccessibleName().empty() ? text : each->AccessibleName()));
  }
  return names;
}

struct Names : Menu {};

TEST_F(Names, OfTheMainWindow) {
  ASSERT_TRUE(Start());
  EXPECT_EQ(NamesOf(*form), (Texts{"Jogos", "Jogar", "Usar disquete para salvar o jogo",
                                   "Ler/Gravar salvamento de jogos do disquete", "Baixar jogos da internet",
                                   "Importar jogo de...", "Exportar jogo para...", "Deletar jogo", "Figura do jogo"}));
}

TEST_F(Names, OfTheSaveManager) {
  DirSaves = Home + "Saves\\";
  PutFile(DirSaves + "UM.srm", "um");
  QueueModal([](Window& window) {
    Choose(static_cast<Form4&>(window).List2, 0);
    EXPECT_EQ(NamesOf(window),
              (Texts{" Disquete ", "Salvamentos no disquete", "Excluir", "Copiar do computador para o disquete",
                     " Computador ", "Salvamentos no computador", "Excluir", "&Fechar"}));
  });
  Form4::Mostrar();
}

TEST_F(Names, OfTheControllerHelpSayWhichButtonAKeyPlays) {
  QueueModal([](Window& window) {
    Choose(static_cast<Form3&>(window).Combo1, 1);
    EXPECT_EQ(NamesOf(window), (Texts{"Jogador", "&Fechar", "Para cima: Home", "Para a direita: Page Down",
                                      "Para a esquerda: Delete", "Para baixo: End", "Select: Shift d.", "Start: ENTER",
                                      "L: U", "R: J", "X: I", "Y: K", "A: O", "B: L"}));
  });
  Form3::ABRIR();
}

TEST_F(Names, OfTheConfiguratorSayEachPathInFull) {
  const std::string path = "C:\\" + std::string(100, 'x') + "\\zsnesw.exe";
  PutText(Key, "EmuExe", path);
  FormCfg window;
  window.Form_Load();
  const Texts names = NamesOf(window);
  EXPECT_EQ(names[8], "Emulador: " + path);
  EXPECT_EQ(names[12], "Jogos: C:\\Tolvaris\\Roms\\");
}

}  // namespace
