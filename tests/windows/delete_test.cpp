// Deleting games, and which one is selected afterwards.
#include "tests/windows/installation.h"

namespace {

class DeleteGame : public Installation {};

TEST_F(DeleteGame, OnYesOnlySelectsTheNeighbourDownToTheEmptyList) {
  Put("Imgs\\Água Viva.gif", "figura");
  Start();
  Files expected = FilesIn(Home);
  const struct {
    std::string Game;
    int Answered;
    std::string DeletedRom, SelectedThen;
  } cases[] = {
      {"abelha", IDNO, "", "abelha"},
      {"abelha", IDCANCEL, "", "abelha"},
      {"abelha", IDYES, "abelha.zip", "Água Viva"},                     // the first
      {"Corrida das Nuvens", IDYES, "Corrida das Nuvens.smc", "Élan"},  // in the middle
      {"Zebra", IDYES, "ZEBRA.SMC", "Élan"},                            // the last
      {"Água Viva", IDYES, "agua.smc", "Élan"},
      {"Élan", IDYES, "elan.ZIP", ""},  // the only one
  };
  for (const auto& [game, answered, rom, then] : cases) {
    SCOPED_TRACE(game);
    if (Selected() != game) Select(game);
    Click(Delete);
    EXPECT_EQ(Answer(answered), Of(Mensagem::DeletarJogo, game));
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
