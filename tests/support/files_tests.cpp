// Reading, writing and copying files, also when something goes wrong.
#include "platform/files.h"
#include "support/mod_Arquivos.h"
#include "tests/fresh_machine.h"

namespace {

using platform::Existing;

const std::string Target = "C:\\Jogos\\alvo.smc";
const std::string LongContent(200'000, 'l');  // more than three pieces of a copy

struct Files : FreshMachine {};

TEST_F(Files, LerArquivoGivesTheWantedBytesAndBlanksForWhatIsMissing) {
  const std::string ten = "012345678\0"s;
  PutFile("C:\\d", ten);
  PutFile("C:\\v", "");
  PutFile("C:\\preso", ten);
  LockFile("C:\\preso");
  const struct {
    const char *Name, *Path;
    std::int32_t Start, Length;
    std::string Read;
  } cases[] = {
      {"all of it", "C:\\d", 1, -1, ten},
      {"a piece", "C:\\d", 4, 3, "345"},
      {"from zero as from one", "C:\\d", 0, 3, "012"},
      {"from before the beginning, no length", "C:\\d", -7, 0, ten},
      {"the last byte", "C:\\d", 10, -1, "\0"s},
      {"right behind the end", "C:\\d", 11, -1, ""},
      {"far behind the end", "C:\\d", 2147483647, -1, ""},
      {"beyond the end", "C:\\d", 9, 4, "8\0  "s},
      {"behind the end, with a length", "C:\\d", 12, 2, "  "},
      {"of an empty file", "C:\\v", 1, -1, ""},
      {"of no file", "C:\\n", 1, -1, ""},
      {"of no file, with a length", "C:\\n", 1, 5, "     "},
      {"of a locked file", "C:\\preso", 1, -1, ""},
      {"of a locked file, with a length", "C:\\preso", 1, 2, "  "},
      {"of a directory", "C:\\Tolvaris", 1, -1, ""},
      {"of no path", "", 1, -1, ""},
  };
  for (const auto& [name, path, start, length, read] : cases) EXPECT_EQ(LerArquivo(path, start, length), read) << name;
  for (int n = 1; n <= 3; ++n) {  // opening, length, reading: never taken for blanks
    FailCall(n);
    EXPECT_EQ(LerArquivo("C:\\d"), "") << n;
    ASSERT_TRUE(CallFailed()) << n;
  }
}

TEST_F(Files, WhatExistsAndWhatCriarCaminhoMakes) {
  PutDirectory("C:\\so leitura", 0x11);
  PutFile("C:\\oculto", "abc", 0x22);
  PutFile("C:\\vazio", "");
  for (const char* path : {"C:\\a\\b\\c", "C:\\oculto\\d\\", "D:\\d\\", "barra", ""}) CriarCaminho(path);
  EXPECT_TRUE(DiretorioExiste("C:\\a\\b"));
  EXPECT_TRUE(DiretorioExiste("C:\\a\\b\\"));
  for (const char* none : {"C:\\a\\b\\c", "C:\\oculto", "C:\\so leitura", "C:\\barra", "D:\\d", ""}) {
    EXPECT_FALSE(DiretorioExiste(none)) << none;
  }
  EXPECT_EQ(TamanhoArquivo("C:\\oculto"), 3);
  EXPECT_TRUE(ArquivoExiste("C:\\oculto"));
  for (const char* none : {"C:\\a", "C:\\vazio", "C:\\nada", ""}) {
    EXPECT_EQ(TamanhoArquivo(none), 0) << none;
    EXPECT_FALSE(ArquivoExiste(none)) << none;
  }
}

// Success is said of the new contents only, failure of the old ones only, and nothing else lies there for long.
TEST_F(Files, AreOldOrNewWhateverFailsAndWhenThePowerIsCut) {
  const auto write = [](const char* text, std::int32_t position, bool erase) {
    return [=] { return GravarArquivo(Target, text, position, erase) == 1; };
  };
  const auto copy = [](const char* source) { return [=] { return CopiarArquivo(source, Target) == Copia::Feita; }; };
  const auto replace = [](Existing existing) {
    return [=] { return Substituicao(Target, "novo", existing).Concluir(); };
  };
  const struct {
    const char* Name;
    std::optional<std::string> Before;
    std::function<bool()> Operate;
    std::string After;
    bool IntoTheFile = false;  // what fails for good, or without power, leaves a mixture
  } cases[] = {
      {"a new file", std::nullopt, write("novo", 1, true), "novo"},
      {"a longer one", "velho", write("conteudo novo", 1, true), "conteudo novo"},
      {"a shorter one", "conteudo velho", write("novo", 0, true), "novo"},
      {"all of it, at the end", "velho", write("novo", -1, true), "novo"},
      {"all of it, at the second byte", "velho", write("novo", 2, true), "\0novo"s},
      {"one that must not exist", std::nullopt, replace(Existing::Keep), "novo"},
      {"written without deleting", std::nullopt, write("novo", 1, false), "novo", true},
      {"at the end", "velho", write(" e novo", -1, false), "velho e novo", true},
      {"over the beginning", "conteudo velho", write("NOVO", 0, false), "NOVOeudo velho", true},
      {"over the end", "velho", write("novo", 4, false), "velnovo", true},
      {"copied", "conteudo velho", copy("A:\\origem"), "copiado"},
      {"copied from a read-only one", "velho", copy("A:\\leitura"), "copiado"},
      {"copied in pieces", "velho", copy("A:\\longo"), LongContent},
  };
  for (const auto& each : cases) {
    for (const bool inPlace : {false, true}) {
      SCOPED_TRACE(std::string(each.Name) + (inPlace ? ", in place" : ""));
      bool written = false;
      const auto operate = [&] { written = each.Operate(); };
      const auto prepare = [&] {
        AddDisk('A', 1 << 20);
        PutFile("A:\\origem", "copiado");
        PutFile("A:\\leitura", "copiado", 0x21);
        PutFile("A:\\longo", LongContent);
        PutDirectory("C:\\Jogos");
        if (each.Before) PutFile(Target, *each.Before);
        if (inPlace && each.Before) TakeNoNewFiles("C:\\Jogos");
      };
      const auto check = [&] {
        for (const bool cut : {false, true}) {
          if (cut) CutPower();
          EXPECT_EQ(Content(Target), written ? std::optional(each.After) : each.Before) << (cut ? "power cut" : "");
          EXPECT_EQ(Leftovers({"C:\\Jogos\\"}), Texts{});
        }
      };
      EXPECT_GE(WithEachFault(Fault::Once, prepare, operate, check), 3);
      EXPECT_TRUE(written);  // by the last run, in which nothing failed
      for (const Fault fault : {Fault::FromThenOn, Fault::PowerCut}) {
        if (!inPlace && !each.IntoTheFile) WithEachFault(fault, prepare, operate, check);
      }
    }
  }
}

TEST_F(Files, ThatCannotBeWrittenStayAndWhatDeletingAndWritingCouldDoIsDone) {
  const std::string oldContent(40960, 'v'), newContent(81920, 'n');
  const auto noNewFiles = [] { TakeNoNewFiles("C:\\Jogos"); };
  const std::tuple<const char*, std::function<void()>, bool> cases[] = {
      {"no file can be made beside it", noNewFiles, true},
      {"room for the new one only where the old one is", [] { SetFreeSpace('C', 45000); }, true},
      {"no room at all", [] { SetFreeSpace('C', 0); }, false},
      {"no room in place", [&] { noNewFiles(), SetFreeSpace('C', 30000); }, false},
      {"locked", [] { LockFile(Target); }, false},
      {"read-only", [] { SetAttributes(Target, platform::AttributeReadOnly); }, false},
  };
  for (const auto& [name, prepare, writable] : cases) {
    for (const bool copy : {false, true}) {
      SCOPED_TRACE(testing::Message() << name << (copy ? ", copied" : ", written"));
      Reset();
      AddDisk('D', 1 << 20);
      PutFile("D:\\novo", newContent);
      PutFile(Target, oldContent);
      prepare();
      const auto writes = WriteCount(Target);
      const bool written =
          copy ? CopiarArquivo("D:\\novo", Target) == Copia::Feita : GravarArquivo(Target, newContent, 1, true) == 1;
      EXPECT_EQ(written, writable);
      EXPECT_TRUE(Content(Target) == (writable ? newContent : oldContent));
      EXPECT_TRUE(Content("D:\\novo") == newContent);
      EXPECT_EQ(WriteCount(Target) != writes, writable) << "not even for a moment, when it cannot be";
      EXPECT_EQ(AllFiles().size(), 2u) << "what lay beside it is gone";
    }
  }
}

TEST_F(Files, AreNotWrittenInPlaceWhereWhatLiesBesideThemDoesNotReachTheDisk) {
  PutFile(Target, "velho");
  const auto writes = WriteCount(Target);
  FailCall(3);  // behind making the file beside it and writing it
  EXPECT_EQ(GravarArquivo(Target, "novo", 1, true), -1);
  EXPECT_TRUE(CallFailed());
  EXPECT_EQ(Content(Target), "velho");
  EXPECT_EQ(WriteCount(Target), writes);
}

TEST_F(Files, HalfWrittenOnesGoWhenTheyAreOldAndNobodysAndThePersonsOwnStay) {
  const struct {
    const char *Name, *File;
    bool Goes;
  } cases[] = {
      {"what a broken write leaves", "jogo.zip.0f3a99c2.novo~", true},
      {"the ending in capitals", "jogo.zip.12345678.NOVO~", false},
      {"no digits", "jogo.zip.novo~", false},
      {"no name", ".0f3a99c2.novo~", false},
      {"digits in capitals", "jogo.0F3A99C2.novo~", false},
      {"a digit too few", "jogo.0f3a99c.novo~", false},
      {"no point before the digits", "jogo0f3a99c2.novo~", false},
      {"an extension behind", "jogo.0f3a99c2.novo~.zip", false},
      {"being written", "preso.0f3a99c2.novo~", false},
  };
  for (const auto& [name, file, goes] : cases) PutFile("C:\\Jogos\\"s + file, "half");
  LockFile("C:\\Jogos\\preso.0f3a99c2.novo~");
  ApagarRestos("C:\\Jogos\\");
  EXPECT_EQ(AllFiles().size(), std::size(cases)) << "another program may be writing";
  PassTime(3601);
  PutFile("C:\\Jogos\\novo.11111111.novo~", "half");
  ApagarRestos("C:\\Jogos\\");
  for (const auto& [name, file, goes] : cases) EXPECT_NE(Content("C:\\Jogos\\"s + file).has_value(), goes) << name;
  EXPECT_TRUE(Content("C:\\Jogos\\novo.11111111.novo~")) << "younger than an hour";
  CutPower();
  ApagarRestos("C:\\Jogos\\");
  EXPECT_FALSE(Content("C:\\Jogos\\novo.11111111.novo~")) << "from before the machine's start";
}

TEST_F(Files, ACopyTellsHowFarItIsAndWhichSideFailed) {
  PutFile("C:\\longo", LongContent, platform::AttributeReadOnly | platform::AttributeHidden);
  PutFile("C:\\curto", "x");
  std::vector<int> progress;
  const auto note = [&](int percent) { progress.push_back(percent); };
  EXPECT_EQ(CopiarArquivo("C:\\curto", Target, note), Copia::NaoGravada) << "there is no such directory";
  PutDirectory("C:\\Jogos");
  EXPECT_EQ(CopiarArquivo("C:\\curto", Target, note), Copia::Feita);
  EXPECT_TRUE(progress.empty()) << "one piece";
  EXPECT_EQ(CopiarArquivo("C:\\longo", Target, note), Copia::Feita);
  EXPECT_EQ(progress, (std::vector{32, 65, 98}));
  EXPECT_EQ(platform::GetFileAttributesA(Target), platform::AttributeHidden);
  EXPECT_EQ(CopiarArquivo("C:\\nada", Target), Copia::NaoLida);
  LockFile("C:\\curto");
  EXPECT_EQ(CopiarArquivo("C:\\curto", Target), Copia::NaoLida);
  EXPECT_EQ(CopiarArquivo("C:\\longo", Target, [](int) { LockFile("C:\\longo"), RemoveDisk('C'); }), Copia::NaoLida);
}

TEST_F(Files, AreNeitherReadNorMadeWhereNoneCanBe) {
  PutFile(Target, "velho");
  for (const char* path : {"C:\\nada\\alvo", "D:\\alvo", "C:\\Tolvaris", ""}) {
    for (const bool erase : {false, true}) EXPECT_EQ(GravarArquivo(path, "novo", 1, erase), -1) << path;
    EXPECT_EQ(CopiarArquivo(Target, path), Copia::NaoGravada) << path;
    EXPECT_EQ(CopiarArquivo(path, Target), Copia::NaoLida) << path;
    ApagarArquivo(path);
  }
  EXPECT_EQ(GravarArquivo(Target, "novo", -2, false), -1);
  EXPECT_EQ(Content(Target), "velho");
  EXPECT_EQ(AllFiles().size(), 1U);
}

}  // namespace
