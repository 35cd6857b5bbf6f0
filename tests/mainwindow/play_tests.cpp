#include "support/mod_Globais.h"
#include "tests/mainwindow/menu.h"

namespace menu {
namespace {

const std::string FloppyPrompt =
    "Não há disquete na unidade A:\\\r\n\r\nColoque um disquete e clique em 'Repetir'."_ansi;

class Play : public Menu {
 protected:
  Play() {
    PutRom("Jogo comprido.smc");
    PutFile(EmulatorConfig, "x\r\nSaveDirectory = C:\\Old\r\nGameDirectory = C:\\Old2\r\ny");
  }
  void StartAndPick() {
    ASSERT_TRUE(Start());
    Pick("Jogo comprido");
  }
  static std::string Configuration(const std::string& saves) {
    return "x\r\nSaveDirectory = " + saves + "\r\nGameDirectory = C:\\Tolvaris\\Roms\r\ny";
  }
};

TEST_F(Play, StartsTheEmulatorWithTheShortPathAndRemembersTheGame) {
  PutText(Key, "AvisoALTF4", "");
  StartAndPick();
  form->SetLeft(1500);
  form->SetTop(1200);
  Click(form->Command1);
  ASSERT_EQ(StartedProcesses().size(), 1U);
  const auto& started = StartedProcesses()[0];
  EXPECT_EQ(started.CommandLine, Emulator + " " + form->Jogos[0].ArquivoCurto);
  EXPECT_EQ(started.CommandLine.find("comprido"), std::string::npos);
  EXPECT_EQ(started.Directory, "C:\\Emu");
  EXPECT_EQ(started.CreationFlags, 0x20U);
  EXPECT_EQ(Content(EmulatorConfig), Configuration("C:\\Tolvaris\\Saves"));
  const std::pair<const char*, const char*> settings[] = {
      {"AvisoALTF4", "1"}, {"LRom", "Jogo comprido"}, {"Disquete", "0"}, {"pl", "1500"}, {"pt", "1200"}};
  for (const auto& [name, value] : settings) EXPECT_EQ(StoredText(Key, name), value) << name;
  const std::string notice =
      "Informação: Para fechar o jogo precione e segure a tecla 'ALT' e simultaneamente aperte e tecla 'F4'"_ansi;
  EXPECT_EQ(Messages(), Texts{notice});
  EXPECT_TRUE(form->JogoIniciado);
  EXPECT_EQ(States(), GameSelected);

  const auto writes = WriteCount(EmulatorConfig);
  DoubleClick(form->List1);
  PressKey(form->List1, 13);
  PressKey(form->List1, 32);
  EXPECT_EQ(StartedProcesses().size(), 3U);
  EXPECT_EQ(Messages(), Texts{});
  EXPECT_EQ(WriteCount(EmulatorConfig), writes);  // nothing to change, nothing written
}

TEST_F(Play, RefusalsSayWhyAndLeaveEverythingAsItWas) {
  ASSERT_TRUE(Start());
  struct Case {
    const char* Name;
    std::function<void()> Spoil;
    std::string Message;
  };
  const Case cases[] = {
      {"nothing selected", [&] { form->List1.Select(-1); }, ""},
      {"not in the table", [&] { form->Jogos.clear(); }, "Erro: Erro interno: jogo não encontrado no sistema."_ansi},
      {"ROM gone", [&] { PutRom("Jogo comprido.smc", ""); }, "Erro: O jogo não foi encontrado."_ansi},
      {"emulator gone", [&] { RemoveFile(Emulator); }, "Erro: O emulador ZSnes não foi encontrado."_ansi},
  };
  for (const Case& each : cases) {
    PutRom("Jogo comprido.smc");
    form->CarregarLista(true);
    Pick("Jogo comprido");
    each.Spoil();
    Click(form->Command1);
    EXPECT_EQ(Messages(), each.Message.empty() ? Texts{} : Texts{each.Message}) << each.Name;
    EXPECT_EQ(Focused() == &form->List1, each.Message.empty()) << each.Name;
  }
  EXPECT_TRUE(StartedProcesses().empty());
  EXPECT_EQ(StoredText(Key, "LRom"), std::nullopt);
  EXPECT_NE(Content(EmulatorConfig), Configuration("C:\\Tolvaris\\Saves"));
}

TEST_F(Play, FloppyPromptRepeatsUntilADiskIsReadyOrTheUserGivesUp) {
  StartAndPick();
  Click(form->Check1);
  const ShownMessage prompt{FloppyPrompt, "Disquete A:", Buttons::RetryCancel, Icon::Exclamation};
  QueueAnswer(Answer::Retry);
  QueueAnswer(Answer::Cancel);
  Click(form->Command1);
  EXPECT_EQ(ShownMessages(), (std::vector<ShownMessage>{prompt, prompt}));
  EXPECT_TRUE(StartedProcesses().empty());
  EXPECT_EQ(StoredText(Key, "Disquete"), std::nullopt);
  EXPECT_EQ(States(), GameSelected);
  EXPECT_EQ(Focused(), &form->List1);
  ForgetMessages();

  QueueAnswer(Answer::Retry, [] { AddDisk('A', 1457664); });
  Click(form->Command1);
  EXPECT_EQ(Messages().size(), 1U);
  EXPECT_EQ(Content(EmulatorConfig), Configuration("A:"));
  EXPECT_EQ(StoredText(Key, "Disquete"), "1");
  EXPECT_EQ(DirSaves, Home + "Saves\\");  // only this launch keeps its saves there

  Click(form->Check1);
  Click(form->Command1);
  EXPECT_EQ(Content(EmulatorConfig), Configuration("C:\\Tolvaris\\Saves"));
  EXPECT_EQ(StartedProcesses().size(), 2U);
}

TEST_F(Play, AMissingConfigurationIsCreatedAndAReadOnlyOneStays) {
  PutFile(EmulatorConfig, "");
  StartAndPick();
  Click(form->Command1);
  EXPECT_EQ(Content(EmulatorConfig),
            "\r\nSaveDirectory = C:\\Tolvaris\\Saves\r\nGameDirectory = C:\\Tolvaris\\Roms\r\n");
  PutFile(EmulatorConfig, "kept", 0x21);
  Click(form->Command1);
  EXPECT_EQ(Content(EmulatorConfig), "kept");
  PutText(Key, "EmuExe", "zsnesw.exe");  // without a directory it is not started
  PutFile(Home + "zsnesw.exe", "MZ");
  StartAndPick();
  Click(form->Command1);
  EXPECT_EQ(StartedProcesses().size(), 2U);
  EXPECT_EQ(Messages(), Texts{});
}

// The configuration file is the old or the new one, whole, whatever fails; so it is when the power goes.
TEST_F(Play, NoFailureHarmsTheConfiguration) {
  const std::string before = *Content(EmulatorConfig);
  for (int n = 1;; ++n) {
    PutFile(EmulatorConfig, before);
    StartAndPick();
    FailCall(n);
    Click(form->Command1);
    const bool failed = CallFailed();
    FailCall(0);
    CutPower();
    const std::string after = Content(EmulatorConfig).value_or("(none)");
    // A configuration that cannot be read is taken for an empty one.
    const std::string appended =
        "\r\nSaveDirectory = C:\\Tolvaris\\Saves\r\n\r\nGameDirectory = C:\\Tolvaris\\Roms\r\n";
    const std::string fresh = "\r\nSaveDirectory = C:\\Tolvaris\\Saves\r\nGameDirectory = C:\\Tolvaris\\Roms\r\n";
    EXPECT_TRUE(after == before || after == Configuration("C:\\Tolvaris\\Saves") || after == appended || after == fresh)
        << n << ": " << after;
    ForgetMessages();
    End();
    if (!failed) break;
  }
}

}  // namespace
}  // namespace menu
