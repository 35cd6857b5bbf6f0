// Playing a game: what the emulator is told, and what is remembered.
#include "tests/windows/installation.h"

namespace {

class Play : public Installation {};

TEST_F(Play, ByEnterDoubleClickAndButton) {
  const std::string longName = Home + "Roms\\Corrida das Nuvens.smc";
  ASSERT_NE(ShortPath(longName), longName);
  Start();
  ClickEntry(window->List, "Corrida das Nuvens", 2);
  ExpectPlayed("Corrida das Nuvens.smc");
  ClickEntry(window->List, "Água Viva");
  PressKey(VK_RETURN);
  ExpectPlayed("agua.smc");
  Select("Zebra");
  window->Play.Click();
  ExpectPlayed("ZEBRA.SMC");
}

TEST_F(Play, TellsHowToLeaveAGameAndRemembersThatAndTheGameAndTheWindow) {
  Set("AvisoALTF4", "");
  Set("pl", "1500");
  Set("pt", "2250");
  std::map<std::string, std::string> expected = {
      {"AvisoALTF4", "1"}, {"LRom", "Élan"}, {"Disquete", "0"}, {"pl", "450"}, {"pt", "600"}};
  expected.merge(Settings());  // the others stay
  Start();
  EXPECT_EQ(window->Place().left, 100);
  EXPECT_EQ(window->Place().top, 150);
  SetWindowPos(window->Handle(), nullptr, 30, 40, 0, 0, SWP_NOSIZE | SWP_NOZORDER | SWP_NOACTIVATE);
  Select("Élan");
  window->Play.Click();
  EXPECT_EQ(Answer(IDOK), Of(Mensagem::ComoFecharOJogo));
  ExpectPlayed("elan.ZIP");
  EXPECT_EQ(Settings(), expected);
  EXPECT_EQ(Content("Emulador\\zsnesw.cfg"),
            "\r\nSaveDirectory = C:\\Ensaio\\Saves\r\nGameDirectory = C:\\Ensaio\\Roms\r\n");

  Start();
  EXPECT_EQ(Selected(), "Élan");
  EXPECT_EQ(window->Place().left, 30);
  EXPECT_EQ(window->Place().top, 40);
}

}  // namespace
