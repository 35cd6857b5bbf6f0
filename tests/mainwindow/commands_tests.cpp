// What the commands have in common when something is missing or fails, and the simplest of them: delete.
#include <set>

#include "tests/contract/small_pictures.h"
#include "tests/mainwindow/menu.h"

namespace {

struct Commands : Menu {};

TEST_F(Commands, OnWhatIsNotThereSayWhyAndLeaveEverythingAsItWas) {
  const Texts unknown = {Told(Mensagem::JogoDesconhecido)};
  const Texts gone = {Told(Mensagem::JogoNaoEncontrado)};
  const std::tuple<const char*, std::function<void()>, Texts, Texts> cases[] = {
      // what is missing, what play says, and what export and delete say
      {"a selection", [this] { form->List1.Select(-1); }, {}, unknown},
      {"the game's row", [this] { form->Jogos.clear(); }, unknown, unknown},
      {"the ROM", [] { RemoveFile(Roms + "ULTIMO.SMC"); }, gone, gone},
      {"the emulator", [] { RemoveFile(Emulator); }, {Told(Mensagem::EmuladorNaoEncontrado)}, {}},
  };
  for (const auto& [name, spoil, playSays, othersSay] : cases) {
    SCOPED_TRACE(name);
    SetUpMachine();
    StartAndPick("Sem figura");
    spoil();
    const Files before = Standing();
    Click(form->Command1);
    EXPECT_EQ(TakeMessages(), playSays);
    EXPECT_EQ(Focused() == &form->List1, playSays.empty());
    EXPECT_EQ(States(), GameSelected);
    for (platform::Button* command : {&form->Command5, &form->Command6}) {
      Click(*command);
      EXPECT_TRUE(othersSay.empty() || TakeMessages() == othersSay);
    }
    EXPECT_TRUE(Standing() == before);
    EXPECT_TRUE(StartedProcesses().empty());
    EXPECT_EQ(StoredText(Key, "LRom"), std::nullopt);
  }
}

TEST_F(Commands, OnAGameWhoseNameTheCodePageLacksUseItsShortNameOrSayWhyNot) {
  for (const bool shortNames : {true, false}) {
    SetUpMachine();
    if (!shortNames) KeepNoShortNames();
    PutForeignFile(Roms + "Jogo ??.smc", Rom);
    ASSERT_TRUE(Start());
    const Texts before = AllFiles();
    for (platform::Button* command : {&form->Command1, &form->Command5, &form->Command6}) {
      Pick("Jogo ??");
      Click(*command);
    }
    if (shortNames) {
      ASSERT_EQ(StartedProcesses().size(), 1U);
      EXPECT_EQ(StartedProcesses()[0].CommandLine, Emulator + " " + Roms + "JOGO__~1.SMC");
      EXPECT_EQ(ShownFileDialogs().size(), 1U);
      EXPECT_EQ(TakeMessages(), Texts{Told(Mensagem::DeletarJogo, "Jogo ??")});
    } else {
      EXPECT_TRUE(StartedProcesses().empty());
      EXPECT_EQ(TakeMessages(), Texts(3, Told(Mensagem::NomeForaDoWindows)));
      EXPECT_EQ(AllFiles(), before);
    }
  }
}

TEST_F(Commands, ThatWereRefusedLeaveTheKeyboardWhereThePersonGoesOn) {
  const struct {
    const char* Name;
    platform::Button Form1::*Command;
    bool OnTheList;  // else on the command
    std::function<void()> Prepare = [] {};
  } cases[] = {
      {"an import that was cancelled", &Form1::Command4, true},
      {"an export that was cancelled", &Form1::Command5, true},
      {"a game that is to stay", &Form1::Command6, true},
      {"no disk to play from", &Form1::Command1, true, [this] { form->Check1.SetValue(1); }},
      {"no emulator", &Form1::Command1, false, [] { RemoveFile(Emulator); }},
      {"no disk with saves", &Form1::Command2, false},
      {"no downloader", &Form1::Command3, false},
  };
  for (const auto& [name, command, onTheList, prepare] : cases) {
    SetUpMachine();
    StartAndPick("Sem figura");
    prepare();
    const platform::Control &list = form->List1, &button = (*form).*command;
    Click((*form).*command);
    EXPECT_EQ(Focused(), onTheList ? &list : &button) << name;
    EXPECT_EQ(Selected(), "Sem figura") << name;
  }
}

// With any one call of the platform failing, or all later ones too, or the power gone, and when it goes afterwards:
// each file is as it was before or as it is without a failure, the person is told one thing, and the window can be
// used.
TEST_F(Commands, LeaveOldOrNewFilesWhicheverCallFails) {
  // The catalogue only grows: a disk that goes for good within that write leaves a part of the new entry.
  const std::string catalogue = Home + "tolvaris.dat";
  const std::set<std::string> questions = {Told(Mensagem::JogoJaExiste), Told(Mensagem::ArquivoJaExiste),
                                           Told(Mensagem::DeletarJogo, "Super Jogo")};
  const std::set<std::string> successes = {Told(Mensagem::JogoAdicionado), Told(Mensagem::ArquivoSalvo)};
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
      {"delete", [this] { Click(form->Command6); }},
  };
  for (const auto& [name, operate, file] : operations)
    for (const bool full : {false, true}) {
      SCOPED_TRACE(testing::Message() << name << (full ? ", on a full disk" : ""));
      const std::string& result = file;
      Files before, after;
      const auto prepare = [&] {
        SetUpMachine();
        PutFile("C:\\SUPERJOG.zip", "another ROM");
        PutFile("C:\\p.tvk", Package("Jogo Novo", "NOVO"));
        for (const std::string& old : {Roms + "NOVO.zip", "C:\\novo.smc"s, "C:\\novo.tvk"s}) PutFile(old, "old");
        PutFile(Imgs + "Jogo Novo.gif", "old");
        PutText(Key, "LRom", "Super Jogo");
        ASSERT_TRUE(Start());
        before = Standing();
        QueueAnswer(Answer::Yes);
        if (full) SetFreeSpace('C', 0);
      };
      const auto check = [&] {
        EXPECT_TRUE(form->IsClosed() || form->Command4.Enabled());
        Texts shown = TakeMessages();
        const bool asked = std::erase_if(shown, [&](const std::string& text) { return questions.contains(text); }) > 0;
        EXPECT_TRUE(asked || result == Roms + "SUPERJOG.zip" || Content(result) == before[result])
            << "replaced unasked";
        EXPECT_LE(shown.size(), 1U);
        EXPECT_EQ(StoredText(Key, "LRom"), "Super Jogo") << "the game that is played, now as before";
        EXPECT_TRUE(result.empty() || !shown.empty() || Standing() == before) << "a silent change";
        EXPECT_TRUE(shown.empty() || !successes.contains(shown[0]) || Content(result) != before[result]);
        EXPECT_EQ(Leftovers({Roms, Imgs, "C:\\Emu\\", "C:\\"}), Texts{});
        for (const bool cut : {false, true}) {
          if (cut) CutPower();
          for (const Files& files : {before, after, Standing()}) {
            for (const auto& [path, content] : files) {
              const auto now = Content(path);
              const bool broken = path == catalogue && after[path]->starts_with(*now);
              EXPECT_TRUE(now == before[path] || now == after[path] || broken) << path;
            }
          }
        }
      };
      prepare();
      operate();
      after = Standing();
      EXPECT_GT(WithEachFault(prepare, operate, check), 5);
    }
}

TEST_F(Commands, DeleteAsksRemovesTheRomAndSelectsTheNeighbour) {
  PutFile(Imgs + "Super Jogo.gif", contract::SmallGif());
  StartAndPick("Sem figura");
  Files expected = Standing();
  const std::tuple<const char*, Answer, const char*, const char*> cases[] = {
      // the game, the answer to the question, the ROM file that goes, and the game that is selected then
      {"Sem figura", Answer::No, "", "Sem figura"},
      {"Sem figura", Answer::Yes, "ULTIMO.SMC", "Super Jogo"},
      {"Nome comprido", Answer::Yes, "Nome comprido.smc", "Super Jogo"},
      {"Super Jogo", Answer::Yes, "SUPERJOG.zip", ""},
  };
  for (const auto& [name, answer, rom, neighbour] : cases) {
    Pick(name);
    QueueAnswer(answer);
    Click(form->Command6);
    expected.erase(Roms + rom);
    EXPECT_TRUE(Standing() == expected) << name;
    EXPECT_EQ(Selected(), neighbour) << name;
    EXPECT_EQ(States(), *neighbour ? GameSelected : NothingSelected) << name;
    const std::string picture = neighbour == "Super Jogo"s ? contract::SmallGif() : "";
    EXPECT_EQ(ContentOf(form->Image1.ShownPicture()), picture) << name;
  }
  EXPECT_EQ(TakeMessages()[0], Told(Mensagem::DeletarJogo, "Sem figura"));
  EXPECT_EQ(Recycled(), (Texts{Roms + "ULTIMO.SMC", Roms + "Nome comprido.smc", Roms + "SUPERJOG.zip"}));
}

TEST_F(Commands, DeleteWorksWithoutARecycleBinAndLeavesWhatIsReadOnly) {
  KeepNoRecycleBin();
  SetAttributes(Roms + "ULTIMO.SMC", platform::AttributeReadOnly);
  ASSERT_TRUE(Start());
  for (const char* game : {"Super Jogo", "Sem figura"}) {
    Pick(game);
    QueueAnswer(Answer::Yes);
    Click(form->Command6);
  }
  EXPECT_FALSE(Content(Roms + "SUPERJOG.zip"));
  EXPECT_TRUE(Content(Roms + "ULTIMO.SMC"));
  EXPECT_EQ(Recycled(), Texts{});
}

}  // namespace
