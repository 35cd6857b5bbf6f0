// What the commands have in common when something is missing or fails, and the simplest of them: delete.
#include <set>

#include "tests/mainwindow/menu.h"

namespace {

struct Commands : Menu {};

TEST_F(Commands, OnWhatIsNotThereSayWhyAndLeaveEverythingAsItWas) {
  const Textos unknown = {Erro + "Erro interno: jogo não encontrado no sistema."_ansi};
  const Textos gone = {Erro + "O jogo não foi encontrado."_ansi};
  const std::tuple<const char*, std::function<void()>, Textos, Textos> cases[] = {
      // what is missing, what play says, and what export and delete say
      {"a selection", [this] { form->List1.Select(-1); }, {}, unknown},
      {"the game's row", [this] { form->Jogos.clear(); }, unknown, unknown},
      {"the ROM", [] { RemoveFile(Roms + "SEMFIG.SMC"); }, gone, gone},
      {"the emulator", [] { RemoveFile(Emulator); }, {Erro + "O emulador ZSnes não foi encontrado."_ansi}, {}},
  };
  for (const auto& [name, spoil, playSays, othersSay] : cases) {
    SCOPED_TRACE(name);
    SetUpMachine();
    StartAndPick("Sem figura");
    spoil();
    const Files before = Standing();
    Click(form->Command1);
    EXPECT_EQ(Mensagens(), playSays);
    EXPECT_EQ(Focused() == &form->List1, playSays.empty());
    EXPECT_EQ(States(), GameSelected);
    for (platform::Button* command : {&form->Command5, &form->Command6}) {
      Click(*command);
      EXPECT_TRUE(othersSay.empty() || Mensagens() == othersSay);
    }
    EXPECT_TRUE(Standing() == before && StartedProcesses().empty());
    EXPECT_EQ(StoredText(Key, "LRom"), std::nullopt);
  }
}

// With any one call of the platform failing, and when the power goes afterwards: each file is as it was before or as it
// is without a failure, the person is told one thing, and the window can be used.
TEST_F(Commands, LeaveOldOrNewFilesWhicheverCallFails) {
  const std::string lines = "SaveDirectory = C:\\Tolvaris\\Saves\r\n", game = "GameDirectory = C:\\Tolvaris\\Roms\r\n";
  // What cannot be seen or read is taken for a file that is not there, or an empty one.
  const std::set<std::optional<std::string>> unseen = {"\r\n" + lines + game, "\r\n" + lines + "\r\n" + game,
                                                       Package("Super Jogo", "SUPERJOG", "")};
  const struct {
    const char* Name;
    std::function<void()> Operate;
    std::string Result = {};  // the file that success is told of
  } operations[] = {
      {"start", [this] { EXPECT_TRUE(Start() || !ShownMessages().empty()); }},
      {"play", [this] { Click(form->Command1); }},
      {"import a ROM", [this] { ChooseFile(form->Command4, "C:\\SUPERJOG.zip"); }, Roms + "SUPERJOG.zip"},
      {"import a package", [this] { ChooseFile(form->Command4, "C:\\p.tvk"); }, Roms + "NOVO.zip"},
      {"export a ROM", [this] { ChooseFile(form->Command5, "C:\\novo.smc"); }, "C:\\novo.smc"},
      {"export a package", [this] { ChooseFile(form->Command5, "C:\\novo.tvk"); }, "C:\\novo.tvk"},
      {"delete",
       [this] {
         QueueAnswer(Answer::Yes);
         Click(form->Command6);
       }},
  };
  for (const auto& [name, operate, result] : operations) {
    SCOPED_TRACE(name);
    Files before, after;
    const auto prepare = [&] {
      SetUpMachine();
      PutFile("C:\\SUPERJOG.zip", "another ROM");
      PutFile("C:\\p.tvk", Package("Jogo Novo", "NOVO"));
      PutFile(Roms + "NOVO.zip", "old");
      PutFile(Imgs + "Jogo Novo.gif", "old");
      PutText(Key, "LRom", "Super Jogo");
      ASSERT_TRUE(Start());
      before = Standing();
    };
    const auto check = [&] {
      EXPECT_TRUE(form->IsClosed() || form->Command4.Enabled());
      const Textos shown = Mensagens();
      EXPECT_LE(shown.size(), 1U);
      EXPECT_EQ(StoredText(Key, "LRom"), "Super Jogo") << "the game that is played, now as before";
      EXPECT_TRUE(result.empty() || !shown.empty() || Standing() == before) << "a silent change";
      EXPECT_TRUE(shown.empty() || !shown[0].starts_with("Ok, ") || Content(result) != before[result]);
      for (const bool cut : {false, true}) {
        if (cut) CutPower();
        for (const Files& files : {before, after, Standing()}) {
          for (const auto& [path, content] : files) {
            const auto now = Content(path);
            EXPECT_TRUE(now == before[path] || now == after[path] || unseen.contains(now)) << path;
          }
        }
      }
    };
    prepare();
    operate();
    after = Standing();
    EXPECT_GT(ComCadaFalha(prepare, operate, check), 5);
  }
}

TEST_F(Commands, DeleteAsksRemovesTheRomAndSelectsTheNeighbour) {
  StartAndPick("Sem figura");
  Files expected = Standing();
  const std::tuple<const char*, Answer, const char*, const char*> cases[] = {
      // the game, the answer to the question, the ROM file that goes, and the game that is selected then
      {"Sem figura", Answer::No, "", "Sem figura"},
      {"Super Jogo", Answer::Yes, "SUPERJOG.zip", "Sem figura"},
      {"Nome comprido", Answer::Yes, "Nome comprido.smc", "Sem figura"},
      {"Sem figura", Answer::Yes, "SEMFIG.SMC", ""},
  };
  for (const auto& [name, answer, rom, neighbour] : cases) {
    Pick(name);
    QueueAnswer(answer);
    Click(form->Command6);
    expected.erase(Roms + rom);
    EXPECT_TRUE(Standing() == expected) << name;
    EXPECT_EQ(Selected(), neighbour) << name;
    EXPECT_EQ(States(), *neighbour ? GameSelected : NothingSelected) << name;
  }
  EXPECT_EQ(Mensagens()[0], "Confirmar deleção, Yes/No/Cancel, exclamation: Deletar o jogo ' Sem figura ' ?"_ansi);
}

}  // namespace
