// Deleting games, and which one is selected afterwards.
#include "tests/windows/installation.h"

namespace {

class DeleteGame : public Installation {
 protected:
  void Press(const std::string& game, int answer) const {
    Click(Delete);
    EXPECT_EQ(Answer(answer), Question("Confirmar deleção", "Deletar o jogo ' " + game + " ' ?"));
  }
};

TEST_F(DeleteGame, OnYesOnlySelectsTheNeighbourDownToTheEmptyList) {
  Put("Imgs\\Água Viva.gif", "figura");
  Start();
  Files expected = FilesIn(Home);
  for (const int answer : {IDNO, IDCANCEL}) {
    Select("abelha");
    Press("abelha", answer);
    EXPECT_SOON(window->Pictures[Delete].Enabled());
    EXPECT_EQ(Selected(), "abelha");
  }
  const struct {
    std::string Game, Rom, SelectedThen;
  } cases[] = {
      {"abelha", "abelha.zip", "Água Viva"},                     // the first
      {"Corrida das Nuvens", "Corrida das Nuvens.smc", "Élan"},  // in the middle
      {"Zebra", "ZEBRA.SMC", "Élan"},                            // the last
      {"Água Viva", "agua.smc", "Élan"},
      {"Élan", "elan.ZIP", ""},  // the only one
  };
  for (const auto& [game, rom, then] : cases) {
    SCOPED_TRACE(game);
    if (Selected() != game) Select(game);
    ExpectFiles(expected, FilesIn(Home));
    Press(game, IDYES);
    EXPECT_SOON_EQ(then, Selected());
    EXPECT_SOON(window->Pictures[Import].Enabled());
    EXPECT_SOON_EQ(!then.empty(), window->Pictures[Delete].Enabled());
    expected.erase("Roms\\" + rom);  // and only that: picture and catalogue stay
    ExpectFiles(expected, FilesIn(Home));
  }
  EXPECT_EQ(Entries(window->List), Texts{});
  EXPECT_FALSE(window->Play.Enabled());
}

}  // namespace
