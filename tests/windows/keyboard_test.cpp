// The three windows without a mouse: every command can be reached and used, and where the keyboard is can be seen.
#include "tests/windows/installation.h"

namespace {

class Keyboard : public Installation {
 protected:
  Keyboard() {
    SetCursorPos(0, 0);  // a control under the pointer would look different
    Set("LRom", "Zebra");
  }

  Message Press(WORD key) const { return AnswerWithKey(*program, key); }
};

// Tab leads to the control, and the key is pressed there.
void Use(const Window& control, WORD key) {
  EXPECT_TRUE(TabTo(control)) << control.Text();
  PressKey(key);
}

// From one control to the next with Tab, beginning behind the last of them. Each shows that it has the keyboard; each
// button has a name.
void ExpectTabOrder(const std::vector<Window>& order) {
  ASSERT_TRUE(TabTo(order.back()));
  for (size_t i = 0; i < order.size(); ++i) {
    const Window& control = order[i];
    control.FinishPainting();
    const std::string before = control.Picture();
    PressKey(VK_TAB);
    EXPECT_SOON(control.Focused()) << "\ncontrol " << i << " does not come after the one before it";
    EXPECT_SOON(control.Picture() != before) << "\ncontrol " << i << " does not show the keyboard";
    EXPECT_FALSE(control.Class() == "Button" && control.Text().empty()) << "control " << i << " has no name";
  }
}

TEST_F(Keyboard, PlaysAndKeepsTheCollectionInTheMainWindow) {
  PutFile(Outside + "novo.smc", "jogo novo");
  Start();
  const std::vector<Window>& pictures = window->Pictures;
  EXPECT_SOON(window->List.Focused());
  PressKey('A');
  EXPECT_SOON_EQ(std::string("abelha"), Selected());
  TypeText("É");
  EXPECT_SOON_EQ(std::string("Élan"), Selected());
  PressKey(VK_DOWN);
  EXPECT_SOON_EQ(std::string("Zebra"), Selected());
  PressKey(VK_RETURN);
  ExpectPlayed("ZEBRA.SMC");
  ExpectTabOrder(
      {window->Play, window->Floppy, pictures[0], pictures[1], pictures[2], pictures[3], pictures[4], window->List});

  for (const WORD key : {WORD{VK_SPACE}, WORD{VK_RETURN}}) {
    Use(window->Play, key);
    ExpectPlayed("ZEBRA.SMC");
  }
  Use(window->Floppy, VK_SPACE);
  EXPECT_SOON(window->FloppyChecked());
  PressKey(VK_RETURN);
  EXPECT_SOON(!window->FloppyChecked());
  Use(pictures[ManageSaves], VK_SPACE);
  EXPECT_EQ(Press(VK_ESCAPE), Of(Mensagem::SemDisquete));
  EXPECT_SOON(pictures[ManageSaves].Focused());
  Use(pictures[Download], VK_RETURN);
  EXPECT_EQ(Press(VK_RETURN), Of(Mensagem::SemDownloader));
  EXPECT_SOON(pictures[Download].Focused());
  Use(pictures[Import], VK_SPACE);
  FileDialog(*program).Enter(Outside + "novo.smc");
  EXPECT_EQ(Press(VK_SPACE), Of(Mensagem::JogoAdicionado));
  EXPECT_SOON_EQ(std::string("novo"), Selected());
  EXPECT_SOON(window->List.Focused());
  EXPECT_SOON(pictures[Export].Enabled());
  Use(pictures[Export], VK_RETURN);
  FileDialog(*program).Enter(Outside + "copia.smc");
  EXPECT_EQ(Press(VK_RETURN), Of(Mensagem::ArquivoSalvo));
  EXPECT_EQ(ContentOf(Outside + "copia.smc"), "jogo novo");
  EXPECT_SOON(window->List.Focused());
  PressKey('N');
  EXPECT_SOON(pictures[Delete].Enabled());
  Use(pictures[Delete], VK_SPACE);
  EXPECT_EQ(Press(VK_RETURN), Of(Mensagem::DeletarJogo, "novo"));
  EXPECT_SOON_EQ(Games, Entries(window->List));
  EXPECT_EQ(Content("Roms\\novo.smc"), "");

  EXPECT_SOON(window->List.Focused());
  PressWith(VK_MENU, VK_F4);
  EXPECT_SOON(program->HasEnded());
}

// Each key selects another game, and selecting lets pending events run.
TEST_F(Keyboard, KeysThatWaitForEachOtherAreAllHandled) {
  constexpr int many = 100;
  for (int i = 0; i <= many; ++i) Put("Roms\\jogo " + std::to_string(1000 + i) + ".smc", "jogo");
  Set("LRom", "jogo 1000");
  Start();
  EXPECT_SOON(window->List.Focused());
  EXPECT_SOON(window->Play.Enabled());
  const auto waiting = [&](WORD key) {
    for (int i = 0; i < many; ++i) PostMessageW(window->List.Handle(), WM_KEYDOWN, key, 1);
  };
  const auto held = [&](WORD key) { HoldKey(key, many - 1); };
  waiting(VK_DOWN);
  EXPECT_SOON_EQ(std::string("jogo 1100"), Selected());
  held(VK_UP);
  EXPECT_SOON_EQ(std::string("jogo 1000"), Selected());
  PressKey(VK_RETURN);
  ExpectPlayed("jogo 1000.smc");
}

TEST_F(Keyboard, CopiesAndDeletesInTheSaveManager) {
  Put("Saves\\ELAN.srm", "bateria E");
  Start();
  EXPECT_SOON(window->List.Focused());
  Use(window->Pictures[ManageSaves], VK_RETURN);
  EXPECT_EQ(Press(VK_RETURN), Of(Mensagem::SemDisquete));
  ASSERT_SOON(FindMessage(*program));
  const FloppyDisk disk;
  PutFile("A:\\AGUA.srm", "bateria A");
  PutFile("A:\\ZEBRA.srm", "bateria Z");
  EXPECT_EQ(Press(VK_RETURN), Of(Mensagem::SemDisquete));
  const SaveManager manager(*program);
  const Window &floppyList = manager.Floppy.List, &floppyDelete = manager.Floppy.Delete;
  const Window &computerList = manager.Computer.List, &computerDelete = manager.Computer.Delete;
  EXPECT_SOON(floppyList.Focused());
  ExpectTabOrder({computerList, manager.Close, floppyList});
  PressKey('Z');
  EXPECT_SOON_EQ(FloppyOffered, manager.Offered());
  ExpectTabOrder({floppyDelete, manager.Copy, computerList, manager.Close, floppyList});

  // A button that loses the keyboard to the mouse looks as before.
  const std::string atRest = manager.Copy.Picture();
  EXPECT_TRUE(TabTo(manager.Copy));
  floppyDelete.Click();
  EXPECT_EQ(Press(VK_ESCAPE), Of(Mensagem::DeletarDoDisquete, "Zebra"));
  EXPECT_SOON(manager.Copy.Picture() == atRest);

  Use(manager.Copy, VK_SPACE);
  EXPECT_SOON_EQ((Texts{"Élan", "Zebra"}), Entries(computerList));
  EXPECT_EQ(Content("Saves\\ZEBRA.srm"), "bateria Z");
  EXPECT_SOON(floppyList.Focused());
  Use(computerList, 'Z');
  EXPECT_SOON_EQ(ComputerOffered, manager.Offered());
  ExpectTabOrder({computerDelete, manager.Close, floppyList, manager.Copy, computerList});
  Use(computerDelete, VK_RETURN);
  EXPECT_EQ(Press(VK_RETURN), Of(Mensagem::DeletarDoComputador, "Zebra"));
  EXPECT_SOON(computerList.Focused());
  EXPECT_EQ(Content("Saves\\ZEBRA.srm"), "");
  EXPECT_TRUE(TabTo(floppyList));
  TypeText("Á");
  EXPECT_SOON_EQ(FloppyOffered, manager.Offered());
  PressKey(VK_DELETE);
  EXPECT_EQ(Press(VK_RETURN), Of(Mensagem::DeletarDoDisquete, "Água Viva"));
  EXPECT_SOON_EQ(Texts{"Zebra"}, Entries(floppyList));
  EXPECT_EQ(ContentOf("A:\\AGUA.srm"), "");

  PressWith(VK_MENU, 'F');
  EXPECT_SOON(!manager);
  EXPECT_SOON(window->Pictures[ManageSaves].Focused());
  DeleteFileA("A:\\ZEBRA.srm");
  PressKey(VK_SPACE);
  const SaveManager again(*program);
  EXPECT_SOON(again.Floppy.List.Focused());
  EXPECT_EQ(Entries(again.Floppy.List), Texts{}) << "of an empty disk";
  PressKey(VK_ESCAPE);
  EXPECT_SOON(!again);
}

TEST_F(Keyboard, ReadsAndClosesTheControllerHelp) {
  for (const bool byEscape : {true, false}) {
    Set("AvisoControle", "");
    Run();
    EXPECT_EQ(Press(VK_RETURN), Of(Mensagem::GuardeOsComandos));
    const Window help = FindVisible(*program, "Controle");
    const Window players = help.ChildAt(120, 120);
    const Window upKey = help.ChildAt(2040, 1560);
    EXPECT_SOON(players.Focused());
    EXPECT_EQ(Entries(players), (Texts{"Jogador 1", "Jogador 2"}));
    PressKey(VK_DOWN);
    EXPECT_SOON_EQ(std::string("Home"), upKey.Text());
    PressKey(VK_UP);
    EXPECT_SOON_EQ(std::string("Seta cima"), upKey.Text());
    ExpectTabOrder({help.ChildAt(6480, 4320), players});
    byEscape ? PressKey(VK_ESCAPE) : PressWith(VK_MENU, 'F');
    EXPECT_SOON(MainWindow(*program).List.Focused());
  }
  PressKey(VK_F1);
  EXPECT_EQ(Press(VK_RETURN), Of(Mensagem::GuardeOsComandos));
  EXPECT_TRUE(FindVisible(*program, "Controle").ChildAt(120, 120).Focused());
  PressKey(VK_ESCAPE);
  EXPECT_SOON(MainWindow(*program).List.Focused());
}

}  // namespace
