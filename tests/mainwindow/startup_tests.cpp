#include "mainwindow/ajustes.h"
#include "platform/files.h"
#include "support/mod_Globais.h"
#include "tests/mainwindow/menu.h"

namespace menu {
namespace {

class Startup : public Menu {};

TEST_F(Startup, SavedPositionKeepsPartOfTheWindowOnTheScreen) {
  struct Case {
    const char* Saved;
    std::optional<int> Left, Top;
  };
  constexpr int Centre = (15360 - 7000) / 2;
  const Case cases[] = {
      {"", Centre, (11520 - 4000) / 2},
      {"0", 0, std::nullopt},  // a top of exactly 0 is not restored
      {"1", 1, 1},
      {"-6744", -6744, std::nullopt},
      {"-6745", std::nullopt, std::nullopt},
      {"11264", 11264, 11264},
      {"11265", 11265, std::nullopt},
      {"15104", 15104, std::nullopt},
      {"15105", std::nullopt, std::nullopt},
      {" 300 ", 300, 300},
      {"abc", std::nullopt, std::nullopt},
      {"12.5", std::nullopt, std::nullopt},
      {"99999999999", std::nullopt, std::nullopt},
      {" ", std::nullopt, std::nullopt},
  };
  for (const Case& each : cases) {
    EXPECT_EQ(EsquerdaInicial(each.Saved, 7000, 15360), each.Left) << each.Saved;
    EXPECT_EQ(TopoInicial(each.Saved, 4000, 11520), each.Top) << each.Saved;
  }
  for (const char* other : {"", "0", "2", "-1", "abc", "99999999999"}) EXPECT_EQ(EstadoDisquete(other), 0) << other;
  EXPECT_EQ(EstadoDisquete("1"), 1);
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
  EXPECT_EQ(DirPrograma, Home);
  EXPECT_EQ(DirRoms, Home + "Jogos\\");
  EXPECT_EQ(DirSaves, "D:\\Saves\\");
  EXPECT_EQ(DirImgs, Home + "Imgs\\");
  EXPECT_EQ(ArquivoCfgEmulador, Home + "Emu\\zsnesw.cfg");
  EXPECT_TRUE(DirectoryStands(DirRoms));
  EXPECT_TRUE(DirectoryStands(DirImgs));

  SetProgramDirectory("C:\\");
  ASSERT_TRUE(Start());
  EXPECT_EQ(DirPrograma, "C:\\");
}

TEST_F(Startup, WithoutConfigurationItEndsOrRunsTheConfigurator) {
  const std::string configurator = Home + "tolvariscfg.exe";
  const std::string notConfigured =
      "O Tolvaris não foi configurado.\r\nClique em 'Sim' para rodar o programa de auto-configuração."_ansi;
  PutText(Key, "EmuCFG", "");
  EXPECT_FALSE(Start());
  EXPECT_TRUE(form->IsClosed());
  const std::vector<ShownMessage> missing = {
      {"Não foi possível configurar o Tolvaris, o programa de auto-configuração não foi encontrado.\r\n"
       "Reinstale o programa."_ansi,
       "Erro", Buttons::Ok, Icon::Critical}};
  EXPECT_EQ(ShownMessages(), missing);
  ForgetMessages();

  PutFile(configurator, "MZ");
  for (const Answer answer : {Answer::No, Answer::Cancel}) {
    QueueAnswer(answer);
    EXPECT_FALSE(Start());
    EXPECT_TRUE(StartedProcesses().empty());
  }
  ForgetMessages();

  // Run once it leaves the settings as they are, run again it writes them.
  int runs = 0;
  OnProcess(configurator, 2, [&runs] {
    if (++runs == 2) PutText(Key, "EmuCFG", EmulatorConfig);
  });
  QueueAnswer(Answer::Yes);
  QueueAnswer(Answer::Yes);
  EXPECT_TRUE(Start());
  EXPECT_EQ(runs, 2);
  const ShownMessage question{notConfigured, "Configuração"_ansi, Buttons::YesNoCancel, Icon::Information};
  EXPECT_EQ(ShownMessages(), std::vector<ShownMessage>(2, question));
  EXPECT_EQ(StartedProcesses().back().CommandLine, configurator);
  EXPECT_EQ(StartedProcesses().back().Directory, Home);
  EXPECT_EQ(ArquivoCfgEmulador, EmulatorConfig);
}

TEST_F(Startup, ControllerHelpComesOnceBeforeTheWindow) {
  PutText(Key, "AvisoControle", "");
  int shown = 0;
  const auto look = [&](platform::Window& help) {
    ++shown;
    EXPECT_EQ(help.Caption(), "Controle");
    EXPECT_FALSE(IsShown(*form));
    EXPECT_EQ(StoredText(Key, "AvisoControle"), "");
  };
  QueueModal(look);
  ASSERT_TRUE(Start());
  EXPECT_EQ(StoredText(Key, "AvisoControle"), "1");
  QueueModal(look);
  ASSERT_TRUE(Start());
  PutText(Key, "AvisoControle", "2");
  ASSERT_TRUE(Start());
  EXPECT_EQ(shown, 1);
  EXPECT_EQ(StoredText(Key, "AvisoControle"), "2");
}

TEST_F(Startup, TranslatesTheWindowAndItsMessages) {
  PutFile(Home + "language.ini",
          "[TOLVARIS20]\r\nJogar=Play\r\nUsar disquete para salvar o jogo=Keep saves on a floppy\r\n"
          "Deletar jogo=Delete game\r\nDeletar o jogo '=Delete '\r\n' ?=' now?\r\nErro=Error\r\n"
          "O jogo não foi encontrado.=The game is gone.\r\nConfirmar deleção=Confirm\r\n"_ansi);
  PutRom("JOGO.SMC");
  ASSERT_TRUE(Start());
  EXPECT_EQ(form->Command1.Caption(), "Play");
  EXPECT_EQ(form->Check1.ToolTip(), "Keep saves on a floppy");
  EXPECT_EQ(form->Command6.ToolTip(), "Delete game");
  EXPECT_EQ(form->Command5.ToolTip(), "Exportar jogo para...");
  EXPECT_EQ(form->Caption(), "Tolvaris");
  Pick("JOGO");
  QueueAnswer(Answer::No);
  Click(form->Command6);
  RemoveFile(Home + "Roms\\JOGO.SMC");
  Click(form->Command6);
  EXPECT_EQ(Messages(), (Texts{"Confirm: Delete ' JOGO ' now?", "Error: The game is gone."}));
}

// Whatever fails while it starts, the program stands with its window, or says why it does not.
TEST_F(Startup, SurvivesTheFailureOfAnyOneCall) {
  PutCatalogue("|JOGOUM=Jogo Um|");
  PutRom("JOGOUM.SMC");
  PutText(Key, "LRom", "Jogo Um");
  for (int n = 1;; ++n) {
    FailCall(n);
    const bool goesOn = Start();
    const bool failed = CallFailed();
    FailCall(0);
    EXPECT_TRUE(goesOn || !ShownMessages().empty()) << n;
    EXPECT_EQ(Catalogue(), "|JOGOUM=Jogo Um|") << n;
    EXPECT_EQ(Content(Home + "Roms\\JOGOUM.SMC"), "rom") << n;
    ForgetMessages();
    End();
    if (!failed) break;
  }
}

}  // namespace
}  // namespace menu
