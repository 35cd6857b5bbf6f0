#include "keeper/zip.h"
#include "platform/picture_file.h"
#include "tests/keeper/keeper.h"

namespace {

const std::string Home = "C:\\Tolvaris\\";

struct Packing : Keeper {
  static void PutGame(const std::string& name, const std::string& content = Rom) {
    PutFile(Home + name, content);
    PutFile(Home + name.substr(0, name.rfind('.')) + ".gif", Picture);
  }

  // The ROM in the package of this name, which has to be one.
  static std::string RomOf(const std::string& package, const std::string& name, const std::string& dosName) {
    const std::string content = Content(Home + package).value_or("");
    const auto read = LerPacote(content);
    if (!read) return "no package";
    EXPECT_EQ(read->Nome + "|" + read->DOSName, name + "|" + dosName);
    EXPECT_EQ(read->Imagem, Picture);
    return std::string(read->Rom);
  }
};

TEST_F(Packing, GivesTheSameBytesAndWritesThemOnce) {
  PutGame("Super Jogo.smc");
  PutGame("ZEBRA.sfc");
  const Texts arguments = {"criar", "--saida", "p", "*.smc", "*.sfc"};
  EXPECT_EQ(RunTvk(arguments), (Outcome{0,
                                        "SUPEP7PV  p\\Super Jogo.tvk\nZEBRA     p\\ZEBRA.tvk\n"
                                        "Pacotes gravados: 2; iguais aos que já estavam lá: 0.\n",
                                        ""}));
  EXPECT_EQ(RomOf("p\\Super Jogo.tvk", "Super Jogo", "SUPEP7PV"), FazerZip("Super Jogo.smc", Rom));
  EXPECT_EQ(RomOf("p\\ZEBRA.tvk", "ZEBRA", "ZEBRA"), FazerZip("ZEBRA.smc", Rom));
  const std::uint64_t writes = WritesEver();
  EXPECT_EQ(RunTvk(arguments), (Outcome{0, "Pacotes gravados: 0; iguais aos que já estavam lá: 2.\n", ""}));
  EXPECT_EQ(WritesEver(), writes);
  EXPECT_EQ(RunTvk({"verificar", "p"}).Status, 0);
  PutGame("Super Jogo.smc", "another");
  EXPECT_EQ(RunTvk(arguments).Output.substr(0, 27), "SUPEP7PV  p\\Super Jogo.tvk\n");
}

TEST_F(Packing, TakesAwayWhatAnEarlierRunHasLeftHalfWritten) {
  PutGame("ZEBRA.smc");
  for (const char* half : {"x.tvk.0f3a99c2.novo~", "p\\x.tvk.0f3a99c2.novo~"}) PutFile(Home + half, "half");
  PassTime(3601);
  EXPECT_EQ(RunTvk({"criar", "--saida", "p", "ZEBRA.smc"}).Status, 0);
  EXPECT_FALSE(Content(Home + "p\\x.tvk.0f3a99c2.novo~"));
  EXPECT_TRUE(Content(Home + "x.tvk.0f3a99c2.novo~")) << "in another directory";
  EXPECT_EQ(RunTvk({"criar", "ZEBRA.smc"}).Status, 0);
  EXPECT_FALSE(Content(Home + "x.tvk.0f3a99c2.novo~"));
}

TEST_F(Packing, AnArchiveStaysButForAByteWhereItHasNoChecksum) {
  const std::string zip = FazerZip("x.smc", Rom).value_or("");
  // One whose end lies at a whole MiB: what stands before the directory is longer.
  std::string megabyte = zip;
  const std::size_t more = (1 << 20) - zip.size(), directory = zip.size() - 22 - 46 - 5;
  megabyte.insert(directory, more, '\0');
  megabyte.replace(megabyte.size() - 6, 4, contract::Low(directory + more, 4));
  ASSERT_TRUE(FimDoZip(megabyte));
  PutGame("INTEIRO.zip", megabyte);
  PutGame("COMUM.zip", zip);
  PutGame("CRU.zip", std::string(32'768 + 512, 'x'));  // as an import names every game
  PutGame("CORTADO.zip", zip.substr(0, zip.size() - 1));
  PutGame("LIXO.zip", "<html>");
  const std::string broken = " não é um .zip inteiro\n";
  EXPECT_EQ(RunTvk({"criar", "*.zip"}).Errors, "CORTADO.zip:" + broken + "LIXO.zip:" + broken);
  EXPECT_EQ(RomOf("COMUM.tvk", "COMUM", "COMUM"), zip);
  EXPECT_EQ(RomOf("CRU.tvk", "CRU", "CRU"), FazerZip("CRU.smc", std::string(32'768 + 512, 'x')));
  const std::string whole = RomOf("INTEIRO.tvk", "INTEIRO", "INTEIRO");
  EXPECT_EQ(whole.size(), (1U << 20) + 1);
  EXPECT_TRUE(FimDoZip(whole));
}

TEST_F(Packing, OptionsAndListsSayWhatTheGamesAre) {
  PutFile("C:\\jogos\\a.smc", Rom);
  PutFile("C:\\jogos\\b.smc", Rom);
  PutFile("C:\\jogos\\f.gif", Picture);
  PutFile("C:\\jogos\\Ação.bmp"_ansi, contract::SmallBmp());
  PutFile("C:\\jogos\\l.csv",
          "\xEF\xBB\xBF"
          "Nome;ARQUIVO;figura;extra\r\n"
          "Ação;a.smc;;1\r\n"
          "\"Um; outro\";C:\\jogos\\b.smc;f.gif\r\n"
          ";c.smc;;\r\n"
          "日本;a.smc\r\n"
          "X;;;\r\n"
          "Ação;b.smc;;;;\r\n"
          "ação;b.smc;f.gif\r\n"
          "D?;b.smc;f.gif\r\n"
          "\"E;b.smc\r\n");
  EXPECT_EQ(
      RunTvk({"criar", "--nome", "Novo", "--dos", "novo", "--figura", "C:/jogos/f.gif", "C:\\jogos\\a.smc"}).Status, 0);
  EXPECT_EQ(RomOf("Novo.tvk", "Novo", "NOVO"), FazerZip("a.smc", Rom));
  const Outcome told = RunTvk({"criar", "--lista", "C:\\jogos\\l.csv", "--saida", "p"});
  EXPECT_EQ(told.Output,
            "A         p\\Ação.tvk\nB         p\\Um; outro.tvk\n"
            "Pacotes gravados: 2; iguais aos que já estavam lá: 0.\n");
  EXPECT_EQ(told.Errors,
            "C:\\jogos\\l.csv:5: nome: tem um caractere que a página de código do Windows não tem\n"
            "C:\\jogos\\l.csv:6: falta o campo arquivo\n"
            "C:\\jogos\\l.csv:7: tem mais campos que a primeira linha\n"
            "C:\\jogos\\l.csv:10: tem aspas sem fim, ou no meio de um campo\n"
            "C:\\jogos\\l.csv:4: C:\\jogos\\c.smc: não existe\n"
            "C:\\jogos\\l.csv:8: o nome 'ação' já é de outro destes jogos\n"
            "C:\\jogos\\l.csv:8: o nome DOS 'B' já é de outro destes jogos\n"
            "C:\\jogos\\l.csv:9: o nome 'D?' não pode ter o caractere ?\n");
  EXPECT_EQ(RomOf("p\\Um; outro.tvk", "Um; outro", "B"), FazerZip("b.smc", Rom));
}

TEST_F(Packing, APictureThatFitsStaysAndAnyOtherBecomesAJpegThatDoes) {
  const std::string fits = contract::SmallGif({400, 346}), slow = Picture + std::string(1 << 20, 'x');
  const struct {
    const char *Name, *File;
    std::string Content, Kept;  // the latter empty: it is made a JPEG
    int Width, Height;
  } cases[] = {
      {"the largest that fits", "jogo.gif", fits, fits, 400, 346},
      {"too wide", "jogo.gif", contract::SmallGif({800, 100}), "", 400, 50},
      {"too high", "jogo.gif", contract::SmallGif({401, 692}), "", 201, 346},
      {"of too many bytes", "jogo.gif", slow, "", 2, 2},
      {"of a type that no package carries", "jogo.png", contract::SmallPng(), "", 2, 2},
      {"none: it is drawn", "outro.gif", Picture, "", 400, 346},
  };
  for (const auto& [name, file, content, kept, width, height] : cases) {
    SCOPED_TRACE(name);
    Renew();
    PutFile(Home + "jogo.smc", Rom);
    PutFile(Home + file, content);
    EXPECT_EQ(RunTvk({"criar", "jogo.smc"}).Errors, "");
    const std::string package = Content(Home + "jogo.tvk").value_or("");
    const auto read = LerPacote(package);
    ASSERT_TRUE(read);
    const auto picture = platform::ReadPictureFile(read->Imagem);
    ASSERT_TRUE(picture);
    EXPECT_EQ(std::make_pair(picture->Width, picture->Height), std::make_pair(width, height));
    EXPECT_TRUE(kept.empty() ? picture->Format == platform::PictureFormat::Jpeg : read->Imagem == kept);
  }
}

TEST_F(Packing, AnInstallationGivesItsNamesAndPictures) {
  PutFile("C:\\T\\tolvaris.dat", "|ZEBRA=Zebra Veloz||OUTRA=Zebra Veloz|");
  PutFile("C:\\T\\Roms\\zebra.zip", FazerZip("z.smc", Rom).value_or(""));
  PutFile("C:\\T\\Roms\\Sem Nome.smc", Rom);
  PutFile("C:\\T\\Imgs\\Zebra Veloz.gif", Picture);
  PutFile("C:\\T\\Imgs\\Sem Nome.gif", Picture);
  const std::uint64_t writes = WritesEver();
  EXPECT_EQ(RunTvk({"criar", "--instalacao", "C:\\T"}).Errors, "");
  EXPECT_EQ(RomOf("Zebra Veloz.tvk", "Zebra Veloz", "ZEBRA"), FazerZip("z.smc", Rom));
  EXPECT_EQ(RomOf("Sem Nome.tvk", "Sem Nome", "SEMN2AUJ"), FazerZip("Sem Nome.smc", Rom));
  EXPECT_EQ(WritesEver(), writes + 4) << "two files, written and renamed";
  EXPECT_EQ(RunTvk({"criar", "--instalacao", "C:\\nada"}),
            (Outcome{1, "Pacotes gravados: 0; iguais aos que já estavam lá: 0.\n", "C:\\nada: não é um diretório\n"}));
}

TEST_F(Packing, RefusesWhatCannotBePackedAndPacksTheRest) {
  PutGame("bom.smc");
  PutGame("vazio.smc", "");
  PutGame("preso.smc");
  LockFile(Home + "preso.smc");
  PutGame("texto.txt");
  PutGame("X=Y.smc");
  PutDirectory(Home + "pasta.smc");
  PutFile(Home + "pasta.gif", Picture);
  PutGame("ruim.smc");
  PutFile(Home + "ruim.gif", "GIF");
  PutFile(Home + "bom.tvk\\dentro", "");
  const Outcome told = RunTvk(
      {"criar", "vazio.smc", "preso.smc", "texto.txt", "X=Y.smc", "pasta.smc", "falta.smc", "ruim.smc", "bom.smc"});
  EXPECT_EQ(told.Status, 1);
  EXPECT_EQ(told.Errors,
            "vazio.smc: está vazio\n"
            "preso.smc: não pode ser lido\n"
            "texto.txt: não é um arquivo .zip, .smc nem .sfc\n"
            "X=Y.smc: o nome 'X=Y' não pode ter o caractere =\n"
            "pasta.smc: é um diretório\n"
            "falta.smc: não existe\n"
            "ruim.smc: a figura ruim.gif não é uma que o Windows mostre\n"
            "bom.smc: bom.tvk não pode ser gravado\n");
}

}  // namespace
