// Deleting games, and which one is selected afterwards.
#include "tests/windows/collection.h"

namespace {

using driver::Answer;
using driver::Message;

class DeleteGame : public Collection {
 protected:
  void Ask(const std::string& game, int answer) const {
    window->Pictures[Delete].Click();
    EXPECT_EQ(Answer(*program, answer),
              (Message{"Confirmar deleção", "Deletar o jogo ' " + game + " ' ?", {IDYES, IDNO, IDCANCEL}}));
  }
};

TEST_F(DeleteGame, SelectsTheNeighbourDownToTheEmptyList) {
  installation.Put("Imgs\\Água Viva.gif", Gif(RGB(1, 2, 3)));
  const struct {
    std::string Game, Rom, SelectedThen;
  } cases[] = {
      {"abelha", "abelha.zip", "Água Viva"},                     // the first
      {"Corrida das Nuvens", "Corrida das Nuvens.smc", "Élan"},  // in the middle
      {"Zebra", "ZEBRA.SMC", "Élan"},                            // the last
      {"Água Viva", "agua.smc", "Élan"},
      {"Élan", "elan.ZIP", ""},  // the only one
  };
  Start();
  Files expected = Kept();
  for (const auto& [game, rom, then] : cases) {
    SCOPED_TRACE(game);
    if (Selected() != game) Select(game);
    Ask(game, IDYES);
    EXPECT_SOON_EQ(then, Selected());
    EXPECT_SOON(window->Pictures[Import].Enabled());
    EXPECT_SOON_EQ(!then.empty(), window->Pictures[Delete].Enabled());
    expected.erase("Roms\\" + rom);  // and only that: picture and catalogue stay
    ExpectKept(expected);
  }
  EXPECT_EQ(Entries(window->List), Texts{});
  EXPECT_FALSE(window->Play.Enabled());
}

TEST_F(DeleteGame, LeavesEverythingWithoutYes) {
  Start();
  const Files before = Kept();
  for (const int answer : {IDNO, IDCANCEL}) {
    Select("Zebra");
    Ask("Zebra", answer);
    EXPECT_SOON(window->Pictures[Delete].Enabled());
    EXPECT_EQ(Selected(), "Zebra");
    ExpectKept(before);
  }
  installation.Remove("Roms\\ZEBRA.SMC");
  window->Pictures[Delete].Click();
  EXPECT_EQ(Answer(*program, IDOK), (Message{"Erro", "O jogo não foi encontrado.", {IDOK}}));
}

}  // namespace
