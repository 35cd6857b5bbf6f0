// The list of games and the preview of the chosen one.
#include "tests/windows/installation.h"

namespace {

class List : public Installation {};

// What cannot be used is there, but pale: here the folder of the picture that exports.
bool IsPale(const Window& window) { return GetBValue(window.Colour(7260, 3045)) > 150; }

TEST_F(List, ShowsTheCataloguesNamesSortedAndSelectsTheLastGameInAnyLetterCase) {
  ASSERT_EQ(GetACP(), 1252u);
  Start();
  EXPECT_EQ(Entries(window->List), Games);
  EXPECT_EQ(Selected(), "");
  EXPECT_FALSE(window->Play.Enabled());
  EXPECT_SOON(window->List.Focused());
  EXPECT_SOON(IsPale(*window));
  ClickEntry(window->List, "Élan");
  EXPECT_SOON(window->Play.Enabled());
  EXPECT_SOON(!IsPale(*window));

  Set("LRom", "áGUA vIVA");
  Start();
  EXPECT_EQ(Selected(), "Água Viva");
  EXPECT_TRUE(window->Play.Enabled());
}

TEST_F(List, HoldsNamesOfAnyLength) {
  const std::string names[] = {std::string(700, 'x'), std::string(5000, 'y')};
  Put("tolvaris.dat", "|AGUA=" + names[0] + "||ZEBRA=" + names[1] + "|");
  Start();
  EXPECT_EQ(Entries(window->List), (Texts{"abelha", "Corrida das Nuvens", "elan", names[0], names[1]}));
  EXPECT_SOON(window->List.Focused());
  PressKey('X');
  EXPECT_SOON_EQ(names[0], Selected());
  PressKey(VK_RETURN);
  ExpectPlayed("agua.smc");
  PressKey(VK_DOWN);
  EXPECT_SOON_EQ(names[1], Selected());
  PressKey(VK_RETURN);
  ExpectPlayed("ZEBRA.SMC");
  window->Pictures[Delete].Click();
  EXPECT_EQ(Answer(IDNO), Of(Mensagem::DeletarJogo, names[1]));
  window->CloseByUser();
  EXPECT_SOON(program->HasEnded());
  EXPECT_EQ(program->ExitCode(), 0U);
}

TEST_F(List, PreviewFollowsTheSelection) {
  const COLORREF red = RGB(220, 20, 40);
  const COLORREF green = RGB(10, 200, 60);
  const COLORREF blue = RGB(30, 60, 230);
  Put("Imgs\\Água Viva.gif", Gif(green));
  Put("Imgs\\Água Viva.bmp", Gif(red));
  Put("Imgs\\Zebra.gif", "");
  Put("Imgs\\Zebra.bmp", Gif(blue));
  Put("Imgs\\Élan.gif", "GIF89a, mas nada mais");
  Put("Imgs\\Élan.bmp", Gif(red));
  Set("LRom", "Zebra");
  Start();
  EXPECT_SOON_EQ(blue, window->Preview());

  ClickEntry(window->List, "Água Viva");
  EXPECT_SOON_EQ(green, window->Preview());
  for (const auto& [left, top] : {std::pair{3840, 240}, {6825, 240}, {3840, 2820}, {6825, 2820}}) {
    EXPECT_EQ(window->Colour(left, top), green) << "at " << left << ", " << top;
  }

  // What the user does is handled in its order: once the box is checked, the list has acted on the click before.
  ClickEntry(window->List, "Élan");
  window->Floppy.Click();
  ASSERT_SOON(window->FloppyChecked());
  EXPECT_EQ(Selected(), "Élan");
  window->FinishPainting();
  EXPECT_EQ(window->Preview(), green) << "a damaged picture leaves the one before";

  ClickEntry(window->List, "abelha");
  EXPECT_SOON(GetRValue(window->Preview()) == GetBValue(window->Preview())) << "grey";
}

}  // namespace
