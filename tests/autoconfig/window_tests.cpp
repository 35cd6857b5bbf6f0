// The auto-configuration window, on a machine in memory with an emulator.
#include <memory>

#include "autoconfig/FormCfg.h"
#include "support/mod_Configuracao.h"
#include "tests/autoconfig/programs.h"
#include "tests/fresh_machine.h"

namespace {

const std::string Key = ChaveConfiguracao, DosEmulator = "C:\\Tolvaris\\ZSNES\\zsnes.exe";
const std::string Emulator = "C:\\Tolvaris\\ZSNES\\zsnesw.exe", Configuration = "C:\\Tolvaris\\ZSNES\\zsnesw.cfg";
const Texts Nothing(5, "-");
const Texts Defaults = {"\\Roms\\", "\\Saves\\", "\\Imgs\\", "\\ZSNES\\zsnesw.exe", "\\ZSNES\\zsnesw.cfg"};

struct Configurator : FreshMachine {
  Configurator() { PutFile(Emulator, WindowsProgram); }

  void Open() {
    form = std::make_unique<FormCfg>();
    form->Form_Load();
    form->Show();
  }
  void OpenAndSearch() { Open(), Tick(form->Timer1); }
  void Save() { Click(form->Command1); }
  void ChooseOther(const std::string& path) { QueueFileDialog(path), Click(form->Command3); }

  // RomDir, SaveDir, ImgDir, EmuExe and EmuCFG as they are stored; "-": not set.
  static Texts Stored() {
    Texts texts;
    for (const AjusteDeCaminho& each : AjustesDeCaminhos) texts.push_back(StoredText(Key, each.Nome).value_or("-"));
    return texts;
  }

 protected:
  std::unique_ptr<FormCfg> form;
};

TEST_F(Configurator, ShowsWhatItFoundAndWritesIt) {
  const std::string directories = "|Jogos:|C:\\Tolvaris\\Roms\\|Salvamentos:|C:\\Tolvaris\\Saves\\|";
  RemoveFile(Emulator);
  OpenAndSearch();
  EXPECT_EQ(TextsOf(*form),
            "Configuração do Tolvaris|Emuladores encontrados:||Nenhum emulador foi encontrado. Clique em 'Procurar "
            "outro...'.|&Procurar outro...| Configuração |&Gravar|&Cancelar|Emulador:||Arquivo de configuração:|"_ansi +
                directories + "Imagens:|C:\\Tolvaris\\Imgs\\");
  EXPECT_FALSE(form->Command1.Enabled()) << "there is nothing to save";
  PressKey(form->List1, 13);
  EXPECT_EQ(Stored(), Nothing);
  EXPECT_FALSE(form->IsClosed());
  PutFile(Emulator, WindowsProgram);
  OpenAndSearch();
  EXPECT_FALSE(form->Timer1.Enabled());
  EXPECT_EQ(EntriesOf(form->List1), Emulator + "|");
  EXPECT_EQ(form->Label2.Caption(), "Busca concluída."_ansi);
  EXPECT_EQ(form->Label4[0].Caption(), Emulator);
  EXPECT_EQ(form->Label4[1].Caption(), Configuration);
  DenyKey(Key);
  Save();
  EXPECT_EQ(TakeMessages(), Texts{Told(Mensagem::ErroAoGravarAjustes)});
  EXPECT_FALSE(form->IsClosed());
  DenyKey(Key, false);
  Save();
  EXPECT_EQ(Stored(), Defaults);
  EXPECT_TRUE(form->IsClosed());
  EXPECT_TRUE(ShownMessages().empty());
  LerCaminhos({});
  EXPECT_EQ(ArquivoEmulador, Emulator) << "as start-up reads it";
}

TEST_F(Configurator, CancelWritesNothingEvenInTheMiddleOfTheSearch) {
  for (int i = 0; i < 200; ++i) PutDirectory("C:\\Tolvaris\\" + std::to_string(i));
  Open();
  QueueEvent([this] {
    EXPECT_EQ(form->Label2.Caption(), "Procurando...");
    QueueEvent([this] { Click(form->Command2); });
  });
  Tick(form->Timer1);
  EXPECT_TRUE(form->IsClosed());
  EXPECT_LT(PendingEventRuns(), 10) << "the search has ended at once";
  EXPECT_EQ(Stored(), Nothing);
  EXPECT_EQ(WritesEver(), 0U);
}

TEST_F(Configurator, WhatIsSetStaysAndComesFirstUnlessThePersonChangesIt) {
  const std::string mine = "D:\\Meu Emulador\\zsnes.exe", cfg = "D:\\Meu Emulador\\zsnes.cfg";
  const Texts all = {"D:\\Jogos\\", "\\Salvos\\", "-", mine, "-"}, fileOnly = {"-", "-", "-", "", "D:\\meu.cfg"};
  const std::tuple<const char*, Texts, std::vector<int>, Texts> cases[] = {
      // what is set, what is chosen in the list, and what is set afterwards
      {"another one and back", all, {1, 0}, {"D:\\Jogos\\", "\\Salvos\\", "\\Imgs\\", mine, cfg}},
      {"another one", all, {1}, {"D:\\Jogos\\", "\\Salvos\\", "\\Imgs\\", Defaults[3], Defaults[4]}},
      {"directories without their last backslash",
       {"D:\\Jogos", "D:/Salvos/", "\\Figuras", mine, cfg},
       {},
       {"D:\\Jogos\\", "D:/Salvos/", "\\Figuras\\", mine, cfg}},
      {"none, a file alone was set", fileOnly, {}, {"\\Roms\\", "\\Saves\\", "\\Imgs\\", Defaults[3], "D:\\meu.cfg"}},
      {"another one, a file alone was set",
       fileOnly,
       {1},
       {"\\Roms\\", "\\Saves\\", "\\Imgs\\", "\\ZSNES\\zsnes.exe", "\\ZSNES\\zsnes.cfg"}},
  };
  for (const auto& [name, before, chosen, after] : cases) {
    SCOPED_TRACE(name);
    Reset();
    AddDisk('D', 1 << 20);
    for (const std::string& file : {mine, Emulator, DosEmulator}) PutFile(file, WindowsProgram);
    for (std::size_t i = 0; i < before.size(); ++i) {
      if (before[i] != "-") PutText(Key, AjustesDeCaminhos[i].Nome, before[i]);
    }
    OpenAndSearch();
    EXPECT_EQ(form->List1.Selected(), 0);
    for (const int index : chosen) Choose(form->List1, index);
    if (chosen.empty()) {
      PressKey(form->List1, 13);
    } else {
      DoubleClick(form->List1);
    }
    EXPECT_EQ(Stored(), after);
    EXPECT_EQ(TakeMessages(), Texts());
  }
}

TEST_F(Configurator, PathsAreWrittenRelativeToTheProgramOrWhole) {
  const struct {
    const char* Name;
    std::string Program, Chosen;    // the program's directory, and the emulator
    std::string Emulator, Setting;  // how it and its configuration file are set
  } cases[] = {
      {"below the program", "C:\\Tolvaris", "C:\\tolvaris\\zsnesw.exe", "\\zsnesw.exe", "\\zsnesw.cfg"},
      {"blanks", "C:\\Tolvaris da", "C:\\Tolvaris da\\Meu Z\\zsnes.exe", "\\Meu Z\\zsnes.exe", "\\Meu Z\\zsnes.cfg"},
      {"beside the program", "C:\\Tolvaris", "C:\\Tolvaris 2\\ZSNESW15.exe", "C:\\Tolvaris 2\\ZSNESW15.exe",
       "C:\\Tolvaris 2\\zsnesw.cfg"},
      {"the program at the root", "C:\\", "C:\\Emu\\outro.exe", "\\Emu\\outro.exe", "\\Emu\\zsnesw.cfg"},
  };
  for (const auto& [name, program, chosen, emulator, setting] : cases) {
    SCOPED_TRACE(name);
    Reset();
    SetProgramDirectory(program);
    PutFile(chosen, WindowsProgram);
    Open();
    ChooseOther(chosen);
    Save();
    EXPECT_EQ(Stored(), (Texts{"\\Roms\\", "\\Saves\\", "\\Imgs\\", emulator, setting}));
    EXPECT_EQ(TakeMessages(), Texts());
  }
}

TEST_F(Configurator, AnotherEmulatorIsChosenWithTheDialogAndWhatCannotBeUsedIsRefused) {
  const std::string upTo254 = "C:\\" + std::string(120, 'a') + "\\" + std::string(119, 'b') + "\\";
  const std::string upTo255 = "C:\\" + std::string(120, 'a') + "\\" + std::string(120, 'b') + "\\";
  for (const std::string& directory : {"C:\\Outro\\zsne"s, upTo254, upTo255})
    PutFile(directory + "s.exe", WindowsProgram);
  PutFile("C:\\Outro\\vazio.exe", "");
  PutFile("C:\\Outro\\dos.exe", DosProgram);
  PutFile(upTo255 + "dos.exe", DosProgram);
  OpenAndSearch();
  for (const char* file : {"C:\\Outro\\zsnes.exe", "", "C:\\TOLVARIS\\zsnes\\ZSNESW.EXE"}) ChooseOther(file);
  EXPECT_EQ(form->List1.Count(), 2) << "nothing when it is cancelled, and nothing twice";
  EXPECT_EQ(form->Label4[0].Caption(), Emulator) << "the last one that was chosen";
  const auto& asked = ShownFileDialogs().back();
  EXPECT_EQ(asked.InitialDirectory, "C:\\Outro\\");
  EXPECT_EQ(asked.Title + asked.Filter,
            "Procurar emuladorEmulador ZSnes (zsnes*.exe)\0zsnes*.exe\0Programas (*.exe)\0*.exe\0"s);
  const std::string dos = "C:\\Outro\\dos.exe", configuration = upTo255 + "zsnesw.cfg";
  const std::string network = "\\\\servidor\\zsnes\\zsnesw.exe";
  const std::tuple<const char*, std::string, std::string> refused[] = {
      {"an empty file", "C:\\Outro\\vazio.exe", Told(Mensagem::EmuladorNaoEncontrado)},
      {"a program for DOS", dos, Told(Mensagem::EmuladorDoDos, dos)},
      {"a path of 255 characters", upTo255 + "s.exe", Told(Mensagem::CaminhoLongo, configuration)},
      {"one for DOS at such a path", upTo255 + "dos.exe", Told(Mensagem::EmuladorDoDos, upTo255 + "dos.exe")},
  };
  for (const auto& [name, file, message] : refused) {
    ChooseOther(file);
    Save();
    EXPECT_EQ(TakeMessages(), Texts{message}) << name;
    EXPECT_EQ(Stored(), Nothing) << name;
    EXPECT_FALSE(form->IsClosed()) << name;
  }
  EXPECT_EQ(Impedimento(network), Mensagem::CaminhoEmRede) << "read as relative to the program's directory";
  ChooseOther(upTo254 + "s.exe");
  Save();
  EXPECT_EQ(Stored()[4], upTo254 + "zsnesw.cfg") << "a path of 254 characters";
}

TEST_F(Configurator, TheConfigurationBelongsToTheProgramsNameAndElseIsTheOneThatIsThere) {
  const std::string forWindows = "C:\\E\\zsnesw.cfg", forDos = "C:\\E\\zsnes.cfg";
  const std::tuple<const char*, Texts, const char*, std::string> cases[] = {
      // the files that are there, the program, and its configuration
      {"the name decides for Windows", {forDos}, "ZsnesW.exe", forWindows},
      {"the name decides for DOS", {forWindows}, "ZSNES.EXE", forDos},
      {"the only one there", {forDos}, "outro.exe", forDos},
      {"both are there", {forDos, forWindows}, "outro.exe", forWindows},
      {"none is there", {}, "outro.exe", forWindows},
  };
  for (const auto& [name, files, program, configuration] : cases) {
    Renew();
    for (const std::string& each : files) PutFile(each, "x");
    EXPECT_EQ(ConfiguracaoDoEmulador("C:\\E\\"s + program), configuration) << name;
  }
}

// The emulator's configuration file in the newer form.
const std::string Before = "x=1\r\nROMPath=\"\"\r\nSRAMPath=\"\"\r\n";
const std::string After = "x=1\r\nROMPath=\"C:\\\\Tolvaris\\\\Roms\"\r\nSRAMPath=\"C:\\\\Tolvaris\\\\Saves\"\r\n";

TEST_F(Configurator, TheDirectoriesOfTheNewerFormAreSetOnRequest) {
  const std::string older = "SaveDirectory = C:\\S\r\n";
  const std::string question = Told(Mensagem::ConfiguracaoMaisNova);
  const std::string error = Told(Mensagem::ErroAoGravarConfiguracao, Configuration);
  const struct {
    const char* Name;
    std::string Before;
    Answer ToTheQuestion;
    std::uint64_t Room;  // on the disk
    Texts Shown;
    std::string After;
    bool Saved;  // the settings
  } cases[] = {
      {"cancelled", Before, Answer::Cancel, 1 << 20, {question}, Before, false},
      {"on a full disk", Before, Answer::Yes, 0, {question, error}, Before, false},
      {"refused", Before, Answer::No, 1 << 20, {question}, Before, true},
      {"agreed", Before, Answer::Yes, 1 << 20, {question}, After, true},
      {"right already", After, Answer::Ok, 1 << 20, {}, After, true},
      {"in the older form", older, Answer::Ok, 1 << 20, {}, older, true},
  };
  for (const auto& [name, before, answer, room, shown, after, saved] : cases) {
    SCOPED_TRACE(name);
    PutFile(Configuration, before);
    OpenAndSearch();
    SetFreeSpace('C', room);
    QueueAnswer(answer);
    Save();
    EXPECT_EQ(TakeMessages(), shown);
    EXPECT_EQ(Content(Configuration), after);
    EXPECT_EQ(Stored(), saved ? Defaults : Nothing);
    EXPECT_EQ(form->IsClosed(), saved);
  }
}

TEST_F(Configurator, AnEmulatorWhoseConfigurationCannotBeWrittenIsTakenWithAWarning) {
  const struct {
    const char* Name;
    std::function<void()> Protect;
    bool Warned;
  } cases[] = {
      {"a directory that takes no files", [] { TakeNoNewFiles("C:\\Tolvaris\\ZSNES"); }, true},
      {"a directory that takes files", [] {}, false},
      {"a read-only file", [] { PutFile(Configuration, "x", 0x21); }, true},
      {"a file that the emulator holds", [] { PutFile(Configuration, "x"), LockFile(Configuration); }, true},
      {"a file that can be written in such a directory",
       [] { PutFile(Configuration, "x"), TakeNoNewFiles("C:\\Tolvaris\\ZSNES"); }, false},
      {"a read-only file of the newer form", [] { PutFile(Configuration, Before, 0x21); }, true},
      {"one of the newer form that is right already", [] { PutFile(Configuration, After, 0x21); }, false},
  };
  for (const auto& [name, protect, warned] : cases) {
    SCOPED_TRACE(name);
    Renew();
    PutFile(Emulator, WindowsProgram);
    protect();
    const Texts files = AllFiles();
    OpenAndSearch();
    Save();
    EXPECT_EQ(TakeMessages(), warned ? Texts{Told(Mensagem::ConfiguracaoProtegida, Configuration)} : Texts());
    EXPECT_EQ(Stored(), Defaults);
    EXPECT_EQ(AllFiles(), files);
    EXPECT_EQ(WriteCount(Configuration), 0U);
  }
}

// Whatever fails: the file is the old or the new one, whole, and what is not as it was asked for has been said.
TEST_F(Configurator, EveryFaultLeavesWholeFilesAndIsSaid) {
  bool closed = false;
  std::size_t open = 0;
  const auto prepare = [this] {
    PutFile(Emulator, WindowsProgram);
    PutFile(Configuration, Before);
    OpenAndSearch();
    QueueAnswer(Answer::Yes);
  };
  const auto operate = [&] {
    Save();
    closed = form->IsClosed();
    open = OpenFiles() + OpenRegistryHandles();
    CutPower();
  };
  const auto check = [&] {
    const std::string content = Content(Configuration).value_or("");
    EXPECT_TRUE(content == Before || content == After) << content;
    const Texts messages = TakeMessages();
    const bool onlyWarned = messages.empty() || messages.back() == Told(Mensagem::ConfiguracaoMaisNova) ||
                            messages.back() == Told(Mensagem::ConfiguracaoProtegida, Configuration);
    EXPECT_EQ(closed, onlyWarned);
    EXPECT_TRUE(Stored() == Defaults || (Stored()[4] == "-" && !closed)) << "configured is only what is complete";
    EXPECT_EQ(open, 0U);
  };
  EXPECT_GT(WithEachFault(prepare, operate, check), 20);
}

}  // namespace
