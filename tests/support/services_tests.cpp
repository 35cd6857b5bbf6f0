// Translation, starting programs, and the file dialogs.
#include "support/mod_CommonDialog.h"
#include "support/mod_Traducao.h"
#include "support/mod_exe.h"
#include "tests/fresh_machine.h"

namespace {

struct Services : FreshMachine {};

TEST_F(Services, TraduzirTakesTheValueOfTheTranslationFileWithoutItsBars) {
  const std::string longest(254, 'x'), file = "C:\\Tolvaris\\language.ini";
  PutFile(file,
          "[OUTRA]\r\nErro=Wrong\r\n[TOLVARIS20]\r\nJogo=Game\r\nBranco=| word |\r\nDuas=||\r\nTres=|||\r\n"
          "Meio=a|b\r\nVazio=\r\nUma=|\r\nLongo=" +
              longest + "y\r\n");
  const std::tuple<const char*, const char*, std::string> cases[] = {
      {"a word", "Jogo", "Game"},
      {"bars around blanks", "Branco", " word "},
      {"two bars alone are none", "Duas", "Duas"},
      {"three bars", "Tres", ""},
      {"a bar in the middle", "Meio", "ab"},
      {"a bar alone is none", "Uma", "Uma"},
      {"an empty value", "Vazio", "Vazio"},
      {"in another section", "Erro", "Erro"},
      {"no text", "", ""},
      {"a value that is cut", "Longo", longest},
  };
  for (const auto& [name, text, translation] : cases) {
    ArquivoIdioma = file;
    EXPECT_EQ(Traduzir(text), translation) << name;
    ArquivoIdioma.clear();
    EXPECT_EQ(Traduzir(text), text) << name << ", without a translation";
  }
}

TEST_F(Services, AProgramStartsWithItsPriorityInItsDirectory) {
  const struct {
    const char* Name;
    std::string Command, Wanted;
    int Priority;
    std::string Used;
    std::uint32_t Class;
  } cases[] = {
      {"no directory", "C:\\Emu\\emu.exe C:\\Roms\\Jogo.smc", "", 2, "C:\\Roms\\", 0x20},
      {"a directory, idle", "C:\\Emu\\emu.exe C:\\Roms\\Jogo.smc", "C:\\Emu", 1, "C:\\Emu", 0x40},
      {"a blank in the command, high", "C:\\Emu 2\\emu.exe -x", "", 3, "C:\\Emu 2\\", 0x80},
      {"blanks and quotes", "\"C:\\Emu 2\\emu.exe\" \"C:\\Meus Jogos\\Um.smc\"", "", 2, "C:\\Meus Jogos\\", 0x20},
      {"the program alone, real time", "C:\\Emu\\emu.exe", "", 4, "C:\\Emu\\", 0x100},
      {"no such priority", "C:\\Emu\\emu.exe", "", 5, "C:\\Emu\\", 0x20},
  };
  PutFile("C:\\Emu\\emu.exe", "MZ");
  PutFile("C:\\Emu 2\\emu.exe", "MZ");
  for (const char* directory : {"C:\\Roms", "C:\\Meus Jogos"}) PutDirectory(directory);
  for (const auto& [name, command, wanted, priority, used, priorityClass] : cases) {
    SCOPED_TRACE(name);
    std::string directory = wanted;
    ASSERT_TRUE(ExecutarPrograma(command, 100, false, priority, directory));
    EXPECT_EQ(directory, used);
    const StartedProcess& process = StartedProcesses().back();
    EXPECT_EQ(process.CommandLine, command);
    EXPECT_EQ(process.Directory, used);
    EXPECT_EQ(process.CreationFlags, priorityClass);
  }
  std::string ofShare;  // where this machine finds nothing
  ExecutarPrograma("C:\\Emu\\emu.exe \\\\srv\\Roms\\Um.smc", 100, false, 2, ofShare);
  EXPECT_EQ(ofShare, "\\\\srv\\Roms\\");
  EXPECT_EQ(SleptMilliseconds(), 0U);
  EXPECT_EQ(PendingEventRuns(), 0);
}

TEST_F(Services, AProgramForAdministratorsIsStartedByTheShellAndWaitedForLikeAnyOther) {
  const std::string program = "C:\\Emu 2\\emu.exe";
  const std::tuple<const char*, std::string, std::string> cases[] = {
      {"arguments", "\"" + program + "\" -x \"C:\\Meus Jogos\\Um.smc\"", program + " -x \"C:\\Meus Jogos\\Um.smc\""},
      {"no argument", "\"" + program + "\"", program + " "},
      {"no quotes", "C:\\emu.exe C:\\Um.smc", "C:\\emu.exe C:\\Um.smc"},
  };
  int ended = 0;
  std::string directory = "C:\\Emu 2";
  for (const std::string& each : {program, "C:\\emu.exe"s}) {
    PutFile(each, "MZ");
    RequireAdministrator(each);
    OnProcess(each, 3, [&] { ++ended; });
  }
  for (const auto& [name, command, line] : cases) {
    const int before = ended;
    ASSERT_TRUE(ExecutarPrograma(command, 500, true, 2, directory)) << name;
    EXPECT_EQ(ended, before + 1) << name;
    const StartedProcess& process = StartedProcesses().back();
    EXPECT_EQ(process.Verb + ": " + process.CommandLine, "runas: " + line) << name;
    EXPECT_EQ(process.Directory, directory) << name;
  }
  RefuseToStart(program);
  EXPECT_FALSE(ExecutarPrograma("\"" + program + "\"", 500, false, 2, directory)) << "the person does not agree";
}

TEST_F(Services, WaitingLetsEventsRunInTheRhythmAndOnceWhereNothingStarted) {
  PutFile("C:\\cfg.exe", "MZ");
  bool ended = false, clicked = false;
  OnProcess("C:\\cfg.exe", 3, [&] { ended = true; });
  QueueEvent([&] { clicked = !ended; });
  std::string directory = "C:\\";
  EXPECT_TRUE(ExecutarPrograma("C:\\cfg.exe", 500, true, 2, directory));
  EXPECT_TRUE(ended);
  EXPECT_TRUE(clicked) << "before the program had ended";
  EXPECT_EQ(PendingEventRuns(), 3);
  EXPECT_LE(SleptMilliseconds(), 1500U);
  for (const bool wait : {false, true}) {
    const auto before = SleptMilliseconds();
    EXPECT_FALSE(ExecutarPrograma("C:\\nada.exe", 500, wait, 2, directory));
    EXPECT_EQ(SleptMilliseconds() - before, wait ? 500u : 0u);
  }
  EXPECT_EQ(PendingEventRuns(), 3 + 1);
}

// Saving takes every path that fits, under a name filled up with blanks; opening only a file that is listed.
TEST_F(Services, DialogsGiveTheChosenPathOrNothing) {
  const platform::Window owner({"Dono", 1500, 1500});
  std::string filter;
  const auto save = [&](const std::string& name) { return SalvarArquivo(owner, "C:\\J", "", "zip", name, filter, 4); };
  for (const auto& [length, blanks] : {std::pair(0u, 254u), {253u, 1u}, {254u, 1u}, {300u, 1u}}) {
    const std::string name(length, 'n');
    EXPECT_EQ(save(name), "");
    const platform::OpenFileName& asked = ShownFileDialogs().back();
    EXPECT_EQ(asked.File, name + std::string(blanks, ' '));
    EXPECT_EQ(asked.Owner, &owner);
    EXPECT_EQ(asked.FileSize, 255U);
    EXPECT_EQ(asked.InitialDirectory, "C:\\J");
    EXPECT_EQ(asked.Filter, "Todos os arquivos (*.*)\0*.*\0"s);
  }
  PutFile("C:\\J\\Maçã"_ansi, "x");
  PutFile("C:\\J\\oculto", "x", 0x22);
  const std::string longest = "C:\\" + std::string(251, 'x');
  const struct {
    const char* Name;
    std::string Path;
    bool Saved, Opened;
  } cases[] = {
      {"in another letter case", "C:\\j\\MAÇÃ"_ansi, true, true},
      {"hidden", "C:\\J\\oculto", true, false},
      {"a directory", "C:\\J", true, false},
      {"too long", longest + "x", false, false},
      {"the longest, and not there", longest, true, false},
      {"cancelled", "", true, false},
  };
  for (const auto& [name, path, saved, opened] : cases) {
    QueueFileDialog(path);
    EXPECT_EQ(save("Um nome de jogo comprido"), saved ? path : "") << name;
    QueueFileDialog(path);
    EXPECT_EQ(AbrirArquivo(owner, "", "", "", filter, 4), opened ? path : "") << name;
  }
  QueueFileDialog("  C:\\com brancos.tvk ");
  EXPECT_EQ(save("Jogo"), "C:\\com brancos.tvk");
}

// Some dialogs append all that they were given.
TEST_F(Services, ASavedNameEndsWithOneExtension) {
  const platform::Window owner({"Dono", 1500, 1500});
  std::string filter;
  const std::tuple<const char*, const char*, std::string, std::string> cases[] = {
      {"all of them", "tvk;zip", "C:\\Jogo.tvk;zip", "C:\\Jogo.tvk"},
      {"the first", "tvk;zip", "C:\\Jogo.tvk", "C:\\Jogo.tvk"},
      {"the only one", "zip", "C:\\Jogo.zip", "C:\\Jogo.zip"},
      {"a name of the person's own", "tvk;zip", "C:\\um;dois.zip", "C:\\um;dois.zip"},
      {"one that ends alike", "tvk;zip", "C:\\stvk;zip", "C:\\stvk;zip"},
  };
  for (const auto& [name, extension, chosen, saved] : cases) {
    QueueFileDialog(chosen);
    EXPECT_EQ(SalvarArquivo(owner, "", "", extension, "Jogo", filter, 4), saved) << name;
  }
}

}  // namespace
