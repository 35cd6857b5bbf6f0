// Other names for games of an installation, and the old ones back.
#include "tests/keeper/keeper.h"

namespace {

const std::string Pictures = Target + "Imgs\\";
const std::string Undo = Target + "desfazer-2026-11-23.txt", List = "C:\\nomes.csv";

struct Naming : Keeper {
  static void PutGame(const std::string& dosName, const Texts& pictures = {}) {
    PutFile(Target + "Roms\\" + dosName + ".zip", Rom);
    for (const std::string& each : pictures) PutFile(Pictures + platform::FromUtf8(each), "picture " + each);
  }

  // Two games that change names with each other, a chain of three, one of two that have a name and a picture, and
  // others.
  static void PutCollection() {
    PutFile(Catalogue,
            "|DIA=Dia||NOITE=Noite||velho||UM=Um||DOIS=Dois||TRES=Três||OUTRO=Outro||PAR=Par||IMPAR=Par|"_ansi);
    PutGame("PAR", {"Par.gif"});
    PutGame("IMPAR");
    PutGame("DIA", {"dia.GIF", "Dia.jpg"});
    PutGame("NOITE", {"Noite.gif"});
    PutGame("UM", {"Um.bmp"});
    PutGame("DOIS", {"Dois.bmp", "Dois.png"});
    PutGame("TRES", {"Três.bmp"});
    PutGame("SEM", {"SEM.jpg"});
    PutGame("OUTRO", {"Outro.gif"});
    PutFile(Target + "Saves\\DIA.srm", "saved");
    PutFile(List,
            "dos;nome\r\ndia;Noite\r\nNOITE;Dia\r\nUM;Dois\r\nDOIS;Três\r\nTRES;Quatro\r\nSEM;sem\r\n"
            "OUTRO;Outro\r\nIMPAR;Impar\r\n");
  }

  static Outcome Name(const Texts& more = {}) {
    Texts arguments = {"nomear", "--instalacao", "C:\\T", List};
    arguments.insert(arguments.end(), more.begin(), more.end());
    return RunTvk(arguments);
  }

  static Outcome TakeBack() { return RunTvk({"desfazer", "--instalacao", "C:\\T", Undo}); }

  static Files WithoutUndo(Files files) {
    files.erase(Undo);
    return files;
  }
};

// Rename the picture files of the collection as its list says.
Files Renamed(Files files) {
  const std::pair<const char*, const char*> moves[] = {
      {"dia.GIF", "Noite.GIF"}, {"Dia.jpg", "Noite.jpg"}, {"Noite.gif", "Dia.gif"},   {"Um.bmp", "Dois.bmp"},
      {"Dois.bmp", "Três.bmp"}, {"Dois.png", "Três.png"}, {"Três.bmp", "Quatro.bmp"}, {"SEM.jpg", "sem.jpg"},
  };
  Files renamed = files;
  for (const auto& [from, to] : moves) renamed.erase(Pictures + platform::FromUtf8(from));
  for (const auto& [from, to] : moves) {
    renamed[Pictures + platform::FromUtf8(to)] = files.at(Pictures + platform::FromUtf8(from));
  }
  renamed[Catalogue] =
      "|DIA=Noite||NOITE=Dia||UM=Dois||DOIS=Três||TRES=Quatro||SEM=sem||IMPAR=Impar||velho||OUTRO=Outro||PAR=Par|"_ansi;
  return renamed;
}

TEST_F(Naming, PicturesFollowSavesStayAndAllOfItComesBack) {
  PutCollection();
  const Files before = Standing(), after = Renamed(before);
  const Outcome simulated = Name({"--simular"});
  EXPECT_EQ(Standing(), before);
  const Outcome told = Name();
  EXPECT_EQ(WithoutUndo(Standing()), after);
  EXPECT_EQ(told.Status, 0) << told.Errors;
  EXPECT_EQ(told.Output,
            "DIA       Dia -> Noite\nNOITE     Noite -> Dia\nUM        Um -> Dois\nDOIS      Dois -> Três\n"
            "TRES      Três -> Quatro\nSEM       SEM -> sem\nIMPAR     Par -> Impar\n"
            "          C:\\T\\Imgs\\dia.GIF -> Noite.GIF\n          C:\\T\\Imgs\\Dia.jpg -> Noite.jpg\n"
            "          C:\\T\\Imgs\\Noite.gif -> Dia.gif\n          C:\\T\\Imgs\\Um.bmp -> Dois.bmp\n"
            "          C:\\T\\Imgs\\Dois.bmp -> Três.bmp\n          C:\\T\\Imgs\\Dois.png -> Três.png\n"
            "          C:\\T\\Imgs\\Três.bmp -> Quatro.bmp\n          C:\\T\\Imgs\\SEM.jpg -> sem.jpg\n"
            "Nomes mudados: 7; figuras: 8. Nomes que já eram esses: 1.\n"
            "Guarde este arquivo para desfazer: C:\\T\\desfazer-2026-11-23.txt\n");
  const std::size_t summary = told.Output.find("Nomes mudados");
  EXPECT_EQ(
      simulated,
      (Outcome{0, told.Output.substr(0, summary) + "Nomes que mudariam: 7; figuras: 8. Nomes que já são esses: 1.\n",
               ""}));
  EXPECT_EQ(Name().Output, "Nomes mudados: 0; figuras: 0. Nomes que já eram esses: 8.\n");
  EXPECT_EQ(TakeBack(), (Outcome{0, "Desfeito. Figuras que voltaram: 8.\n", ""}));
  EXPECT_EQ(WithoutUndo(Standing()), before);
  EXPECT_EQ(Name().Output.substr(told.Output.size() - 24), "desfazer-2026-11-23-2.txt\n") << "no undo file is replaced";
}

TEST_F(Naming, OneLineThatCannotBeKeepsAllFromBeingDone) {
  const struct {
    const char *Name, *Lines, *Refused;
  } cases[] = {
      {"no such game", "NADA;X\n", ":3: a coleção não tem um jogo com o nome DOS 'NADA'\n"},
      {"a character that no name has", "DIA;X|Y\n", ":3: o nome 'X|Y' não pode ter o caractere |\n"},
      {"a line break in a name", "DIA;\"X\nY\"\n", ":3: o nome 'X?Y' não pode ter o caractere U+000A\n"},
      {"a device", "DIA;con\n", ":3: o nome 'con' é o de um dispositivo do Windows\n"},
      {"the name of a game that keeps it", "DIA;outro\n", ":3: o nome 'outro' já é de OUTRO\n"},
      {"one name for two", "DIA;X\nUM;x\n", ":3: o nome 'X' já é de UM\nC:\\nomes.csv:4: o nome 'x' já é de DIA\n"},
      {"a game twice", "DIA;X\ndia;Y\n", ":4: o nome DOS 'DIA' já é de outro destes jogos\n"},
      {"a DOS name with a sign", "A=B;X\n", ":3: o nome DOS 'A=B' não pode ter o caractere =\n"},
      {"no name", "DIA;\n", ":3: falta o campo nome\n"},
      {"a picture of the new name", "DIA;Livre\n", ":3: já há uma figura com o nome novo: C:\\T\\Imgs\\Livre.png\n"},
  };
  PutCollection();
  PutGame("A=B");
  PutFile(Pictures + "Livre.png", "ready");
  for (const auto& [name, lines, refused] : cases) {
    SCOPED_TRACE(name);
    PutFile(List, "dos;nome\nNOITE;Tarde\n"s + lines);
    const Files before = Standing();
    for (const Texts& more : {Texts{}, Texts{"--simular"}}) {
      EXPECT_EQ(Name(more), (Outcome{1, "Nada mudou.\n", "C:\\nomes.csv"s + refused}));
      EXPECT_EQ(Standing(), before);
    }
  }
}

TEST_F(Naming, WhatAnotherProgramHasOpenStaysAsItIs) {
  const std::string open =
      "C:\\T\\tolvaris.dat: está aberto em outro programa, ou não pode ser gravado; feche o Tolvaris\n";
  const struct {
    const char* Name;
    std::string Path, Refused;
  } cases[] = {
      {"the catalogue", Catalogue, open},
      {"a picture", Pictures + "Noite.gif", "C:\\T\\Imgs\\Noite.gif: não pode ser lido\n"},
      {"the list", List, "C:\\nomes.csv: não pode ser lido\n"},
  };
  for (const auto& [name, path, refused] : cases) {
    SCOPED_TRACE(name);
    Renew();
    PutCollection();
    const Files before = Standing();
    LockFile(path);
    EXPECT_EQ(Name(), (Outcome{1, "Nada mudou.\n", refused}));
    EXPECT_EQ(Standing(), before);
  }
  Renew();
  PutCollection();
  {
    const platform::File shown(Pictures + "Dia.jpg", platform::Access::Read);
    const Files before = Standing();
    EXPECT_EQ(Name(), (Outcome{1, "", "C:\\T\\Imgs\\Dia.jpg: não pode mudar; tudo está como antes\n"}));
    EXPECT_EQ(Standing(), before);
  }
  Name();
  const Files renamed = Standing();
  const platform::File menu(Catalogue, platform::Access::ReadWrite);
  EXPECT_EQ(TakeBack(), (Outcome{1, "", open}));
  EXPECT_EQ(Standing(), renamed);
}

TEST_F(Naming, TakesBackNothingThatHasChangedSince) {
  const struct {
    const char *Name, *Path, *Content;  // what there is then
    std::string Refused;
  } cases[] = {
      {"another picture", "Imgs\\Quatro.bmp", "mine", "Imgs\\Quatro.bmp: é outra figura agora\n"},
      {"a picture of the old name", "Imgs\\Um.bmp", "mine",
       "Imgs\\Um.bmp: há agora outra figura com o nome de antes\n"},
      {"another name", "tolvaris.dat", "|DIA=Tarde|",
       "tolvaris.dat: os nomes mudaram de novo depois disso; desfaça primeiro o que veio depois\n"},
      {"the file to undo it", "desfazer-2026-11-23.txt", "tvk nomear 1\r\n",
       "desfazer-2026-11-23.txt: não é um arquivo para desfazer do tvk, ou está danificado\n"},
  };
  for (const auto& [name, path, content, refused] : cases) {
    SCOPED_TRACE(name);
    Renew();
    PutCollection();
    Name();
    PutFile(Target + path, content);
    const Files standing = Standing();
    EXPECT_EQ(TakeBack(), (Outcome{1, "", Target + refused}));
    EXPECT_EQ(Standing(), standing);
  }
}

TEST_F(Naming, WhatIsNewSinceStaysAndWhatIsGoneIsTold) {
  PutCollection();
  Files expected = Standing();
  Name();
  PutFile(Catalogue, *Content(Catalogue) + "|NOVO=Novo|");
  PutFile(Pictures + "Novo.gif", "new");
  RemoveFile(Pictures + platform::FromUtf8("Três.png"));
  expected[Catalogue] += "|NOVO=Novo|";
  expected[Pictures + "Novo.gif"] = "new";
  expected.erase(Pictures + "Dois.png");
  EXPECT_EQ(TakeBack(),
            (Outcome{1, "Desfeito. Figuras que voltaram: 7.\n", "C:\\T\\Imgs\\Três.png: a figura não está mais lá\n"}));
  EXPECT_EQ(WithoutUndo(Standing()), expected);
}

// Every game gets the name of the one behind it; without a catalogue before.
TEST_F(Naming, OfThousandGamesComesBackByteForByte) {
  std::string lines = "dos,nome\n";
  for (int game = 0; game < 1000; ++game) {
    const auto name = [](int number) { return "G" + std::to_string(number % 1000); };
    PutGame(name(game), {name(game) + (game % 3 == 0 ? ".jpg" : ".gif")});
    lines += name(game) + "," + name(game + 1) + "\n";
  }
  PutFile(List, lines);
  const Files before = Standing();
  EXPECT_EQ(Name().Status, 0);
  EXPECT_EQ(Content(Pictures + "G0.gif"), std::nullopt);
  EXPECT_EQ(Content(Pictures + "G0.jpg"), "picture G999.jpg");
  EXPECT_EQ(Content(Pictures + "G1.jpg"), "picture G0.jpg");
  EXPECT_EQ(TakeBack().Status, 0);
  EXPECT_EQ(WithoutUndo(Standing()), before);
  EXPECT_EQ(TakeBack(), (Outcome{0, "Tudo já estava como antes.\n", ""}));
}

// Whatever fails, and whenever the power goes: what is left is old or new, or becomes old with the file to undo it.
TEST_F(Naming, AfterEachFaultAllOfItIsDoneOrCanBeTakenBack) {
  Files before;
  Outcome told{};
  const auto takeBack = [&] {
    CutPower();
    EXPECT_EQ(Leftovers({Target, Pictures}), Texts{});
    EXPECT_EQ(Content(Undo) ? TakeBack().Errors : "", "");
    EXPECT_EQ(WithoutUndo(Standing()), before);
  };
  const auto prepare = [&] {
    PutCollection();
    before = Standing();
  };
  const auto prepareToUndo = [&] {
    prepare();
    Name();
  };
  const int faults = WithEachFault(
      prepare, [&] { told = Name(); },
      [&] {
        EXPECT_TRUE(told.Status == 1 || WithoutUndo(Standing()) == Renamed(before));
        takeBack();
      });
  EXPECT_GT(faults, 50);
  const int faultsOfUndo = WithEachFault(
      prepareToUndo, [&] { told = TakeBack(); },
      [&] {
        EXPECT_TRUE(told.Status == 1 || WithoutUndo(Standing()) == before);
        takeBack();
      });
  EXPECT_GT(faultsOfUndo, 50);
}

}  // namespace
