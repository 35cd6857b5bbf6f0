// The list of games and the preview of the chosen one.
#include "tests/windows/installation.h"
#include "tests/windows/main_window.h"
#include "tests/windows/pictures.h"

namespace {

using driver::Program;

class List : public testing::Test {
 protected:
  List() { installation.Configure(); }

  Installation installation;
};

// Which of the window's commands can be used: play, the floppy option, the picture buttons from top to bottom.
std::vector<bool> Usable(const MainWindow& window) {
  std::vector<bool> usable = {window.Play.Enabled(), window.Floppy.Enabled()};
  for (const driver::Window& picture : window.Pictures) usable.push_back(picture.Enabled());
  return usable;
}

const std::vector<bool> WithoutGame = {false, true, true, true, true, false, false};
const std::vector<bool> WithGame = {true, true, true, true, true, true, true};

TEST_F(List, ShowsTheCataloguesNamesSorted) {
  ASSERT_EQ(GetACP(), 1252u);
  installation.PutGames();
  const Program program(installation.CommandLine());
  const MainWindow window(program);
  const std::vector<std::string> sorted = {"abelha", "Água Viva", "Corrida das Nuvens", "Élan", "Zebra"};
  EXPECT_EQ(Entries(window.List), sorted);
  EXPECT_EQ(SelectedEntry(window.List), -1);
  EXPECT_EQ(Usable(window), WithoutGame);
  EXPECT_SOON(window.List.Focused());

  ClickEntry(window.List, "Élan");
  EXPECT_SOON_EQ(WithGame, Usable(window));
}

TEST_F(List, SelectsTheLastGameAgainInAnyLetterCase) {
  installation.PutGames();
  installation.Set("LRom", "áGUA vIVA");
  const Program program(installation.CommandLine());
  const MainWindow window(program);
  EXPECT_EQ(SelectedEntry(window.List), 1);
  EXPECT_EQ(Usable(window), WithGame);
}

TEST_F(List, WithoutGamesMakesTheDirectories) {
  installation.Set("RomDir", "\\Meus\\Jogos\\");
  const Program program(installation.CommandLine());
  const MainWindow window(program);
  EXPECT_TRUE(Entries(window.List).empty());
  EXPECT_EQ(Usable(window), WithoutGame);
  for (const char* directory : {"Meus\\Jogos", "Saves", "Imgs"}) {
    EXPECT_EQ(GetFileAttributesA((installation.Directory + directory).c_str()), DWORD{FILE_ATTRIBUTE_DIRECTORY})
        << directory;
  }
}

bool IsGrey(COLORREF colour) {
  return GetRValue(colour) == GetGValue(colour) && GetGValue(colour) == GetBValue(colour);
}

TEST_F(List, PreviewFollowsTheSelection) {
  const COLORREF red = RGB(220, 20, 40);
  const COLORREF green = RGB(10, 200, 60);
  const COLORREF blue = RGB(30, 60, 230);
  installation.PutGames();
  installation.Put("Imgs\\Água Viva.gif", Gif(green));
  installation.Put("Imgs\\Água Viva.bmp", Bmp(red, 3, 2));
  installation.Put("Imgs\\Zebra.gif", "");
  installation.Put("Imgs\\Zebra.bmp", Bmp(blue, 640, 3));
  installation.Put("Imgs\\Élan.gif", "GIF89a, mas nada mais");
  installation.Put("Imgs\\Élan.bmp", Bmp(red, 3, 2));
  installation.Set("LRom", "Zebra");
  const Program program(installation.CommandLine());
  const MainWindow window(program);
  EXPECT_SOON_EQ(blue, window.Preview());

  ClickEntry(window.List, "Água Viva");
  EXPECT_SOON_EQ(green, window.Preview());
  for (const auto& [left, top] : {std::pair{3840, 240}, {6825, 240}, {3840, 2820}, {6825, 2820}}) {
    EXPECT_EQ(window.Window.Colour(left, top), green) << "at " << left << ", " << top;
  }

  // What the user does is handled in its order: once the box is checked, the list has acted on the click before.
  ClickEntry(window.List, "Élan");
  window.Floppy.Click();
  ASSERT_SOON(window.FloppyChecked());
  EXPECT_EQ(SelectedEntry(window.List), 3);
  window.Window.FinishPainting();
  EXPECT_EQ(window.Preview(), green) << "a damaged picture leaves the one before";

  ClickEntry(window.List, "abelha");
  EXPECT_SOON(IsGrey(window.Preview()));
}

}  // namespace
