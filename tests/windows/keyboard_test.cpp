// The three windows without a mouse: every command can be reached and used, and where the keyboard is can be seen.
#include "tests/windows/driver/keyboard.h"

#include "tests/windows/installation.h"
#include "tests/windows/main_window.h"
#include "tests/windows/save_manager.h"

namespace {

using driver::AnswerWithKey;
using driver::Message;
using driver::PressKey;
using driver::Program;
using driver::TabTo;
using driver::Window;

class Keyboard : public testing::Test {
 protected:
  Keyboard() {
    SetCursorPos(0, 0);  // a control under the pointer would look different
    installation.Configure();
    installation.PutGames();
    installation.Set("LRom", "Zebra");
  }

  std::string NextRom() {
    const std::string line = NextCall(installation.Emulator).CommandLine;
    return line.substr(line.rfind('\\') + 1);
  }

  bool Exists(const std::string& name) const {
    return GetFileAttributesA((installation.Directory + name).c_str()) != INVALID_FILE_ATTRIBUTES;
  }

  Installation installation;
};

// From one control to the next with Tab, beginning behind the last of them. Each shows that it has the keyboard; each
// button has a name.
void ExpectTabOrder(const std::vector<Window>& order) {
  ASSERT_TRUE(TabTo(order.back()));
  for (size_t i = 0; i < order.size(); ++i) {
    const Window& control = order[i];
    control.FinishPainting();
    const auto before = driver::Appearance(control);
    PressKey(VK_TAB);
    EXPECT_SOON(control.Focused()) << "\ncontrol " << i << " does not come after the one before it";
    EXPECT_SOON(driver::Appearance(control) != before) << "\ncontrol " << i << " does not show the keyboard";
    EXPECT_FALSE(control.Class() == "Button" && control.Text().empty()) << "control " << i << " has no name";
  }
}

TEST_F(Keyboard, PlaysAndKeepsTheCollectionInTheMainWindow) {
  installation.Put("Novos\\novo.smc", "jogo novo");
  const Program program(installation.CommandLine());
  const MainWindow main(program);
  EXPECT_SOON(main.List.Focused());
  PressKey('A');
  EXPECT_SOON_EQ(0, SelectedEntry(main.List));
  driver::TypeText("É");
  EXPECT_SOON_EQ(3, SelectedEntry(main.List));
  PressKey(VK_DOWN);
  EXPECT_SOON_EQ(4, SelectedEntry(main.List));
  PressKey(VK_RETURN);
  EXPECT_EQ(NextRom(), "ZEBRA.SMC");
  ExpectTabOrder({main.Play, main.Floppy, main.Pictures[0], main.Pictures[1], main.Pictures[2], main.Pictures[3],
                  main.Pictures[4], main.List});

  EXPECT_TRUE(TabTo(main.Play));
  for (const WORD key : {WORD{VK_SPACE}, WORD{VK_RETURN}}) {
    PressKey(key);
    EXPECT_EQ(NextRom(), "ZEBRA.SMC");
  }
  EXPECT_TRUE(TabTo(main.Floppy));
  PressKey(VK_SPACE);
  EXPECT_SOON(main.FloppyChecked());
  PressKey(VK_RETURN);
  EXPECT_SOON(!main.FloppyChecked());
  EXPECT_TRUE(TabTo(main.Pictures[0]));
  PressKey(VK_SPACE);
  EXPECT_EQ(AnswerWithKey(program, VK_ESCAPE).Title, "Disquete A:");
  EXPECT_SOON(main.Pictures[0].Focused());
  EXPECT_TRUE(TabTo(main.Pictures[1]));
  PressKey(VK_RETURN);
  EXPECT_EQ(AnswerWithKey(program, VK_RETURN).Text, "O programa de download não foi encontrado.");

  EXPECT_SOON(main.Pictures[1].Focused());
  EXPECT_TRUE(TabTo(main.Pictures[2]));
  PressKey(VK_SPACE);
  driver::EnterPath(program, "C:\\Ensaio\\Novos\\novo.smc");
  EXPECT_EQ(AnswerWithKey(program, VK_SPACE).Text, "Jogo adicionado com sucesso.");
  EXPECT_SOON_EQ(4, SelectedEntry(main.List));
  EXPECT_SOON(main.List.Focused() && main.Pictures[3].Enabled());
  EXPECT_TRUE(TabTo(main.Pictures[3]));
  PressKey(VK_RETURN);
  driver::EnterPath(program, "C:\\Ensaio\\Novos\\copia.smc");
  EXPECT_EQ(AnswerWithKey(program, VK_RETURN).Text, "Arquivo salvo.");
  EXPECT_EQ(installation.Content("Novos\\copia.smc"), "jogo novo");
  EXPECT_SOON(main.List.Focused());
  PressKey('N');
  EXPECT_SOON(main.Pictures[4].Enabled());
  EXPECT_TRUE(TabTo(main.Pictures[4]));
  PressKey(VK_SPACE);
  EXPECT_EQ(AnswerWithKey(program, VK_RETURN).Title, "Confirmar deleção");
  EXPECT_SOON_EQ(size_t{5}, Entries(main.List).size());
  EXPECT_FALSE(Exists("Roms\\novo.smc"));

  EXPECT_SOON(main.List.Focused());
  driver::PressWith(VK_MENU, VK_F4);
  EXPECT_SOON(program.HasEnded());
}

TEST_F(Keyboard, CopiesAndDeletesInTheSaveManager) {
  for (const char* file : {"Disquete\\AGUA.srm", "Disquete\\ZEBRA.srm", "Saves\\ELAN.srm"}) {
    installation.Put(file, std::string("bateria ") + file[9]);
  }
  const FloppyDisk disk(installation.Directory + "Disquete");
  const Program program(installation.CommandLine());
  const MainWindow main(program);
  EXPECT_SOON(main.List.Focused());
  EXPECT_TRUE(TabTo(main.Pictures[0]));
  PressKey(VK_RETURN);
  const SaveManager manager(program);
  EXPECT_SOON(manager.Floppy.List.Focused());
  ExpectTabOrder({manager.Computer.List, manager.Close, manager.Floppy.List});
  PressKey('Z');
  EXPECT_SOON_EQ(FloppyOffered, manager.Offered());
  ExpectTabOrder({manager.Floppy.Delete, manager.Copy, manager.Computer.List, manager.Close, manager.Floppy.List});

  // A button that loses the keyboard to the mouse looks as before.
  const auto atRest = driver::Appearance(manager.Copy);
  EXPECT_TRUE(TabTo(manager.Copy));
  manager.Floppy.Delete.Click();
  EXPECT_EQ(AnswerWithKey(program, VK_ESCAPE).Title, "Confirmar deleção");
  EXPECT_SOON(driver::Appearance(manager.Copy) == atRest);

  EXPECT_TRUE(TabTo(manager.Copy));
  PressKey(VK_SPACE);
  EXPECT_SOON_EQ(size_t{2}, Entries(manager.Computer.List).size());
  EXPECT_EQ(installation.Content("Saves\\ZEBRA.srm"), "bateria Z");
  EXPECT_SOON(manager.Floppy.List.Focused());

  EXPECT_TRUE(TabTo(manager.Computer.List));
  PressKey('Z');
  EXPECT_SOON_EQ(ComputerOffered, manager.Offered());
  ExpectTabOrder({manager.Computer.Delete, manager.Close, manager.Floppy.List, manager.Copy, manager.Computer.List});
  EXPECT_TRUE(TabTo(manager.Computer.Delete));
  PressKey(VK_RETURN);
  EXPECT_EQ(AnswerWithKey(program, VK_ESCAPE).Title, "Confirmar deleção");
  EXPECT_SOON(manager.Computer.Delete.Focused());
  PressKey(VK_SPACE);
  EXPECT_EQ(AnswerWithKey(program, VK_RETURN).Title, "Confirmar deleção");
  EXPECT_SOON(manager.Computer.List.Focused());
  EXPECT_FALSE(Exists("Saves\\ZEBRA.srm"));

  EXPECT_TRUE(TabTo(manager.Floppy.List));
  driver::TypeText("Á");
  EXPECT_SOON_EQ(FloppyOffered, manager.Offered());
  PressKey(VK_DELETE);
  EXPECT_EQ(AnswerWithKey(program, VK_RETURN).Title, "Confirmar deleção");
  EXPECT_SOON_EQ(std::vector<std::string>{"Zebra"}, Entries(manager.Floppy.List));
  EXPECT_FALSE(Exists("Disquete\\AGUA.srm"));

  driver::PressWith(VK_MENU, 'F');
  EXPECT_SOON(!manager.Window);
  EXPECT_SOON(main.Pictures[0].Focused());
  PressKey(VK_SPACE);
  const SaveManager again(program);
  EXPECT_SOON(again.Floppy.List.Focused());
  PressKey(VK_ESCAPE);
  EXPECT_SOON(!again.Window);
}

TEST_F(Keyboard, ReadsAndClosesTheControllerHelp) {
  const auto close = [](const Window& button, WORD key) {
    if (key == 'F') return driver::PressWith(VK_MENU, 'F');
    EXPECT_TRUE(key == VK_ESCAPE || TabTo(button));
    PressKey(key);
  };
  for (const WORD key : {WORD{VK_RETURN}, WORD{VK_SPACE}, WORD{VK_ESCAPE}, WORD{'F'}}) {
    installation.Set("AvisoControle", "");
    const Program program(installation.CommandLine());
    EXPECT_EQ(AnswerWithKey(program, VK_RETURN).Title, "Informação");
    const Window help = driver::FindVisible(program, "Controle");
    const Window players = help.ChildAt(120, 120);
    const Window upKey = help.ChildAt(2040, 1560);
    EXPECT_SOON(players.Focused());
    EXPECT_EQ(driver::Choices(players), (std::vector<std::string>{"Jogador 1", "Jogador 2"}));
    PressKey(VK_DOWN);
    EXPECT_SOON_EQ(std::string("Home"), upKey.Text());
    PressKey(VK_UP);
    EXPECT_SOON_EQ(std::string("Seta cima"), upKey.Text());
    const Window button = help.ChildAt(6480, 4320);
    if (key == VK_RETURN) ExpectTabOrder({button, players});
    close(button, key);
    const MainWindow main(program);
    EXPECT_SOON(main.List.Focused());
  }
}

}  // namespace
