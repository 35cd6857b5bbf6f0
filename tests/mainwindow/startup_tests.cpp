#include "mainwindow/janela_inicial.h"
#include "support/mod_Configuracao.h"
#include "tests/mainwindow/menu.h"

namespace {

struct Startup : Menu {};

TEST_F(Startup, SavedPositionKeepsPartOfTheWindowOnTheScreen) {
  constexpr std::optional<int> none;
  constexpr int centreLeft = (15360 - 7000) / 2, centreTop = (11520 - 4000) / 2;
  const struct {
    const char *Name, *Saved;
    std::optional<int> Left, Top;  // what becomes of it as a left and as a top edge
  } cases[] = {
      {"nothing", "", centreLeft, centreTop},
      {"at the very edge", "0", 0, none},
      {"right below the edge", "1", 1, 1},
      {"256 twips of the width are seen", "-6744", -6744, none},
      {"255 twips of the width", "-6745", none, none},
      {"256 twips of the height are seen", "11264", 11264, 11264},
      {"255 twips of the height", "11265", 11265, none},
      {"256 twips before the right edge", "15104", 15104, none},
      {"255 twips before the right edge", "15105", none, none},
      {"no whole number", "12.5", none, none},
      {"a blank", " ", none, none},
  };
  for (const auto& [name, saved, left, top] : cases) {
    EXPECT_EQ(EsquerdaInicial(saved, 7000, 15360), left) << name;
    EXPECT_EQ(TopoInicial(saved, 4000, 11520), top) << name;
  }
  for (const char* unchecked : {"", "0", "2", "-1", "abc"}) EXPECT_EQ(EstadoDisquete(unchecked), 0) << unchecked;
}

TEST_F(Startup, SavedPositionIsRestoredOnAnyMonitorThatIsThere) {
  constexpr std::optional<int> none;
  constexpr int centreLeft = (15360 - 7000) / 2;
  const std::vector<platform::Bounds> monitors = {
      {0, 0, 15360, 11520}, {15360, -2000, 9000, 8000}, {-9000, 0, 9000, 6000}};
  const struct {
    const char *Name, *Left, *Top;
    Canto Corner;
  } cases[] = {
      {"on the right one, higher than the primary one", "16000", "-1999", {16000, -1999}},
      {"at the very top of the right one", "16000", "-2000", {none, none}},
      {"256 twips before its right edge", "24104", "100", {24104, 100}},
      {"255 twips before its right edge", "24105", "100", {none, 100}},
      {"the last corner of the left one", "-15744", "5744", {-15744, 5744}},
      {"a twip left of the left one's", "-15745", "5744", {none, 5744}},
      {"below the left one", "-8000", "5745", {none, 5745}},
      {"above the primary one", "1000", "-500", {1000, none}},
      {"only the left edge is saved", "16000", "", {none, (11520 - 4000) / 2}},
      {"only the top edge is saved", "", "-500", {centreLeft, none}},
      {"the top edge is no number", "16000", "x", {none, none}},
      {"the farthest numbers", "2147483647", "-2147483648", {none, none}},
  };
  for (const auto& [name, left, top, corner] : cases) {
    EXPECT_EQ(CantoInicial(left, top, {.Width = 7000, .Height = 4000}, monitors[0], monitors), corner) << name;
  }
  PutText(Key, "pl", "16000");
  PutText(Key, "pt", "-1000");
  AddMonitor(monitors[1]);
  ASSERT_TRUE(Start());
  EXPECT_EQ(form->Left(), 16000);
  EXPECT_EQ(form->Top(), -1000);
}

TEST_F(Startup, TheWindowsOwnWidthAndHeightDecideWhereItStands) {
  ASSERT_TRUE(Start());
  EXPECT_EQ(form->Left(), (15360 - form->Width()) / 2) << "in the middle";
  EXPECT_EQ(form->Top(), (11520 - form->Height()) / 2) << "in the middle";
  const int last = 256 - form->Width();  // so much of it is still seen
  PutText(Key, "pl", std::to_string(last));
  PutText(Key, "pt", "11264");
  ASSERT_TRUE(Start());
  EXPECT_EQ(form->Left(), last);
  EXPECT_EQ(form->Top(), 11264);
}

TEST_F(Startup, TakesWindowAndPathsFromTheSettings) {
  PutText(Key, "pl", "1500");
  PutText(Key, "pt", "3000");
  PutValue(Key, "Disquete", 4, std::string("\1\0\0\0", 4));  // a number, as another program may have stored it
  PutText(Key, "RomDir", "\\Jogos\\");
  PutText(Key, "SaveDir", "D:\\Saves\\");
  PutText(Key, "EmuCFG", "\\Emu\\zsnesw.cfg");
  ASSERT_TRUE(Start());
  EXPECT_EQ(form->Left(), 1500);
  EXPECT_EQ(form->Top(), 3000);
  EXPECT_EQ(form->Check1.Value(), 1);
  EXPECT_EQ((Texts{DirPrograma, DirRoms, DirSaves, DirImgs, ArquivoCfgEmulador}),
            (Texts{Home, Home + "Jogos\\", "D:\\Saves\\", Imgs, Home + "Emu\\zsnesw.cfg"}));
  EXPECT_TRUE(DirectoryStands(DirRoms));
  EXPECT_TRUE(DirectoryStands(DirImgs));
}

TEST_F(Startup, DefaultsInANetworkDirectoryAreWhereTheProgramIs) {
  DirPrograma = "\\\\casa\\jogos\\";
  LerCaminhos({});
  EXPECT_EQ(DirRoms, "\\\\casa\\jogos\\Roms\\");
  EXPECT_EQ(CaminhoConfigurado("\\Roms\\"), "\\\\casa\\jogos\\Roms\\");
}

TEST_F(Startup, TakesAwayWhatAnEarlierRunHasLeftHalfWritten) {
  PutText(Key, "SaveDir", "D:\\Saves\\");
  AddDisk('D', 1 << 20);
  const std::string mark = ".0f3a99c2.novo~";
  for (const std::string& path : {Roms + "X.zip", Imgs + "X.gif", "D:\\Saves\\X.srm"s, EmulatorConfig}) {
    PutFile(path + mark, "half");
  }
  PassTime(3601);
  ASSERT_TRUE(Start());
  EXPECT_EQ(EntriesOf(form->List1), "Nome comprido|Sem figura|Super Jogo|");
  for (const std::string& path : AllFiles()) EXPECT_FALSE(path.ends_with(mark)) << path;
}

TEST_F(Startup, WithoutConfigurationItEndsOrRunsTheConfigurator) {
  const std::string configurator = Home + "tolvariscfg.exe";
  const std::string missing = Told(Mensagem::SemConfigurador), question = Told(Mensagem::SemConfiguracao);
  PutText(Key, "EmuCFG", "");
  EXPECT_FALSE(Start());
  EXPECT_TRUE(form->IsClosed());
  PutFile(configurator, "MZ");
  EXPECT_FALSE(Start());  // cancelled
  EXPECT_TRUE(form->IsClosed());
  EXPECT_TRUE(StartedProcesses().empty());

  // Run once it leaves the settings as they are, run again it writes them.
  int runs = 0;
  OnProcess(configurator, 2, [&runs] {
    if (++runs == 2) PutText(Key, "EmuCFG", EmulatorConfig);
  });
  QueueAnswer(Answer::Yes);
  QueueAnswer(Answer::Yes);
  EXPECT_TRUE(Start());
  EXPECT_EQ(runs, 2);
  EXPECT_EQ(TakeMessages(), (Texts{missing, question, question, question}));
  EXPECT_EQ(StartedProcesses().back().CommandLine + "|" + StartedProcesses().back().Directory,
            configurator + "|" + Home);
}

TEST_F(Startup, ControllerHelpComesOnceBeforeTheWindow) {
  int shown = 0;
  PutText(Key, "AvisoControle", "");
  QueueModal([&](platform::Window& help) {
    shown += help.Caption() == "Controle" && !IsShown(*form) && StoredText(Key, "AvisoControle") == "";
  });
  for (const char* after : {"1", "1", "2"}) {
    if (*after == '2') PutText(Key, "AvisoControle", after);
    ASSERT_TRUE(Start());
    EXPECT_EQ(StoredText(Key, "AvisoControle"), after);
  }
  EXPECT_EQ(shown, 1);
}

TEST_F(Startup, ControllerHelpComesAgainWithF1UnlessACommandIsUnderWay) {
  ASSERT_TRUE(Start());
  Texts shown;
  const auto note = [&](platform::Window& help) { shown.push_back(help.Caption()); };
  QueueModal(note);
  PressHelp(*form);
  EXPECT_EQ(shown, Texts{"Controle"});
  EXPECT_EQ(StoredText(Key, "AvisoControle"), "1");
  QueueModal(note);
  QueueEvent([this] { PressHelp(*form); });
  ChooseFile(form->Command4, "");
  EXPECT_EQ(shown, Texts{"Controle"});
}

}  // namespace
