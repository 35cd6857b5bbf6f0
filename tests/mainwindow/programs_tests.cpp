// The commands that lead to other programs and windows: play, the downloader and the save manager.
#include "platform/keys.h"
#include "tests/mainwindow/menu.h"

namespace {

std::string Configuration(const std::string& saves) {
  return "x\r\nSaveDirectory = " + saves + "\r\nGameDirectory = C:\\Tolvaris\\Roms\r\ny";
}

struct Play : Menu {};

TEST_F(Play, StartsTheEmulatorWithTheShortPathAndRemembersTheGame) {
  PutText(Key, "AvisoALTF4", "");
  StartAndPick("Nome comprido");
  form->SetLeft(1500);
  form->SetTop(1200);
  Click(form->Command1);
  ASSERT_EQ(StartedProcesses().size(), 1U);
  const auto& started = StartedProcesses()[0];
  EXPECT_EQ(started.CommandLine, Emulator + " " + Form1::CaminhoCurto(Roms + "Nome comprido.smc"));
  EXPECT_EQ(started.Directory, "C:\\Emu");
  EXPECT_EQ(started.CreationFlags, 0x20U);
  EXPECT_EQ(Content(EmulatorConfig), Configuration("C:\\Tolvaris\\Saves"));
  const std::pair<const char*, const char*> settings[] = {
      {"AvisoALTF4", "1"}, {"LRom", "Nome comprido"}, {"Disquete", "0"}, {"pl", "1500"}, {"pt", "1200"}};
  for (const auto& [name, value] : settings) EXPECT_EQ(StoredText(Key, name), value) << name;
  EXPECT_EQ(TakeMessages(), Texts{Told(Mensagem::ComoFecharOJogo)});
  EXPECT_EQ(States(), GameSelected);

  const auto writes = WriteCount(EmulatorConfig);
  const std::tuple<const char*, std::function<void()>, std::size_t> ways[] = {
      // what is done with the list, and how many games have been started then
      {"a double click", [this] { DoubleClick(form->List1); }, 2},
      {"Enter", [this] { PressKey(form->List1, platform::KeyEnter); }, 3},
      {"the space bar", [this] { PressKey(form->List1, 32); }, 3},
  };
  for (const auto& [name, act, count] : ways) {
    act();
    EXPECT_EQ(StartedProcesses().size(), count) << name;
  }
  EXPECT_EQ(WriteCount(EmulatorConfig), writes) << "nothing to change, nothing written";

  const std::string fresh = "\r\nSaveDirectory = C:\\Tolvaris\\Saves\r\nGameDirectory = C:\\Tolvaris\\Roms\r\n";
  const struct {
    const char* Name;
    std::function<void()> Spoil;
    std::string After;
  } configurations[] = {
      {"empty", [] { PutFile(EmulatorConfig, ""); }, fresh},
      {"missing", [] { RemoveFile(EmulatorConfig); }, fresh},
      {"read-only", [] { PutFile(EmulatorConfig, "x", 0x21); }, "x"},
      {"there, but nobody can read it",
       [] {
         PutFile(EmulatorConfig, "x");
         LockFile(EmulatorConfig);
       },
       "x"},
  };
  for (const auto& [name, spoil, after] : configurations) {
    spoil();
    Click(form->Command1);
    EXPECT_EQ(Content(EmulatorConfig), after) << name;
  }
  EXPECT_EQ(StartedProcesses().size(), 7U);
  EXPECT_EQ(TakeMessages(), Texts{});
  EXPECT_FALSE(form->Form_Load()) << "loaded again once a game was started, the window closes";
  EXPECT_TRUE(form->IsClosed());
}

// Without quotes the line would start what stands before the first blank of the emulator's path.
TEST_F(Play, PutsInQuotesWhatHasABlankAndNothingElse) {
  const struct {
    const char* Name;
    std::string Emulator;
    bool ShortNames;
    std::string Line;
  } cases[] = {
      {"no blank", "C:\\Emu\\zsnesw.exe", true, "C:\\Emu\\zsnesw.exe C:\\Tolvaris\\Roms\\NOMECO~1.SMC"},
      {"in the emulator's path", "C:\\Emu 2\\zsnesw.exe", true,
       "\"C:\\Emu 2\\zsnesw.exe\" C:\\Tolvaris\\Roms\\NOMECO~1.SMC"},
      {"in the ROM's, which has no short form", "C:\\Emu\\zsnesw.exe", false,
       "C:\\Emu\\zsnesw.exe \"C:\\Tolvaris\\Roms\\Nome comprido.smc\""},
  };
  for (const auto& [name, emulator, shortNames, line] : cases) {
    SCOPED_TRACE(name);
    SetUpMachine();
    if (!shortNames) KeepNoShortNames();
    PutFile(Roms + "Nome comprido.smc", Rom);
    PutText(Key, "EmuExe", emulator);
    for (const std::string& program : {emulator, "C:\\Emu.exe"s}) PutFile(program, "MZ");
    bool another = false;
    OnProcess("C:\\Emu.exe", 0, [&] { another = true; });
    StartAndPick("Nome comprido");
    Click(form->Command1);
    ASSERT_EQ(StartedProcesses().size(), 1U);
    EXPECT_EQ(StartedProcesses()[0].CommandLine, line);
    EXPECT_EQ(StartedProcesses()[0].Directory + "\\zsnesw.exe", emulator);
    EXPECT_FALSE(another);
  }
}

TEST_F(Play, AndTheSaveManagerWaitForADiskUntilTheUserGivesUp) {
  StartAndPick("Super Jogo");
  Click(form->Check1);
  int opened = 0;
  QueueModal([&](platform::Window& window) { opened += window.Caption() == "Salvamentos dos jogos"; });
  Click(form->Command2);
  EXPECT_EQ(opened, 0);
  QueueAnswer(Answer::Retry);
  QueueAnswer(Answer::Cancel);
  Click(form->Command1);
  EXPECT_EQ(TakeMessages(), Texts(3, Told(Mensagem::SemDisquete)));
  EXPECT_TRUE(StartedProcesses().empty());
  EXPECT_EQ(StoredText(Key, "Disquete"), std::nullopt);
  EXPECT_EQ(States(), GameSelected);
  EXPECT_EQ(Focused(), &form->List1);

  QueueAnswer(Answer::Retry, [] { AddDisk('A', 1457664); });
  Click(form->Command1);
  EXPECT_EQ(StartedProcesses().size(), 1U);
  EXPECT_EQ(Content(EmulatorConfig), Configuration("A:"));
  EXPECT_EQ(StoredText(Key, "Disquete"), "1");
  EXPECT_EQ(DirSaves, Home + "Saves\\");  // only this launch keeps its saves there
  Click(form->Command2);
  EXPECT_EQ(opened, 1);
}

const std::string Downloader = Home + "tolvarisdownload.exe";

struct HandOver : Menu {
  HandOver() { PutText(Key, "LRom", "Super Jogo"); }
};

TEST_F(HandOver, TheWindowWaitsForTheDownloaderAndShowsWhatItBrought) {
  PutFile(Downloader, "MZ");
  ASSERT_TRUE(Start());
  Click(form->Command3);
  ASSERT_EQ(StartedProcesses().size(), 1U);
  const std::string handles = std::to_string(form->Handle()) + "@" + std::to_string(form->List1.Handle());
  EXPECT_EQ(StartedProcesses()[0].CommandLine, Downloader + " " + handles);
  EXPECT_EQ(StartedProcesses()[0].Directory, Home);
  EXPECT_FALSE(form->Enabled());
  EXPECT_EQ(Selected(), "");
  EXPECT_EQ(OpenFiles(), 0U) << "the catalogue is closed";

  Tick(form->Timer1);
  EXPECT_EQ(form->Caption(), "...");
  PutFile(Roms + "B.smc", Rom);
  PutFile(Home + "tolvaris.dat", "|SUPERJOG=Super Jogo||B=Jogo B|");
  form->Enable(true);
  Tick(form->Timer1);
  EXPECT_FALSE(form->Timer1.Enabled());
  EXPECT_GE(form->List1.FindExact("Jogo B"), 0);
  EXPECT_EQ(Selected(), "Super Jogo");
  EXPECT_EQ(form->Caption(), "Tolvaris");
  EXPECT_EQ(States(), GameSelected);
}

TEST_F(HandOver, ABlankInTheProgramsDirectoryIsPartOfThePath) {
  const std::string home = "C:\\Meu Tolvaris\\", configurator = home + "tolvariscfg.exe";
  SetProgramDirectory(home);
  for (const std::string& program : {home + "tolvarisdownload.exe", configurator}) PutFile(program, "MZ");
  PutText(Key, "EmuExe", "");
  OnProcess(configurator, 1, [] { PutText(Key, "EmuExe", Emulator); });
  QueueAnswer(Answer::Yes);
  ASSERT_TRUE(Start());
  Click(form->Command3);
  ASSERT_EQ(StartedProcesses().size(), 2U);
  EXPECT_EQ(StartedProcesses()[0].CommandLine, "\"" + configurator + "\"");
  EXPECT_TRUE(StartedProcesses()[1].CommandLine.starts_with("\"" + home + "tolvarisdownload.exe\" "));
}

TEST_F(HandOver, AMissingDownloaderIsToldAndOneThatDoesNotStartGivesTheWindowBack) {
  ASSERT_TRUE(Start());
  Click(form->Command3);
  EXPECT_EQ(TakeMessages(), Texts{Told(Mensagem::SemDownloader)});
  EXPECT_EQ(States(), GameSelected);

  PutFile(Downloader, "no program");
  RefuseToStart(Downloader);
  Pick("Sem figura");
  Click(form->Command3);
  EXPECT_TRUE(form->Enabled());
  EXPECT_FALSE(form->Timer1.Enabled());
  EXPECT_EQ(form->Caption(), "Tolvaris");
  EXPECT_EQ(Selected(), "Sem figura") << "what was selected before";
  EXPECT_EQ(States(), GameSelected);
}

}  // namespace
