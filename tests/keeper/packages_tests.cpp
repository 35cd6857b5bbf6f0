// What tells of packages and takes them apart.
#include "tests/keeper/keeper.h"

namespace {

struct Packages : Keeper {};

TEST_F(Packages, AreListedAsATableAndAsCsv) {
  PutFile("C:\\p\\a.tvk", Package("Ação; \"dois\""_ansi, "ACAO"));
  PutFile("C:\\p\\b.tvk", Package("Mau", "MAU", "x", "figura"));
  EXPECT_EQ(RunTvk({"listar", "C:\\p"}), (Outcome{0,
                                                  "DOS                Figura        Jogo          Soma  Nome\n"
                                                  "ACAO      gif          43           9    -873187034  "
                                                  "Ação; \"dois\"\n"
                                                  "MAU       ?             6           1    -873187034  Mau\n",
                                                  ""}));
  EXPECT_EQ(RunTvk({"listar", "--csv", "C:\\p"}), (Outcome{0,
                                                           "arquivo,nome,dos,tamanho,jogo,figura,soma,tipo\n"
                                                           "C:\\p\\a.tvk,\"Ação; \"\"dois\"\"\",ACAO,156,9,43,"
                                                           "-873187034,gif\n"
                                                           "C:\\p\\b.tvk,Mau,MAU,99,1,6,-873187034,?\n",
                                                           ""}));
}

// All of them at once, so that one does not hide the next.
TEST_F(Packages, AreVerifiedAndEveryReasonIsToldWithItsFile) {
  const std::string whole = Package("Novo", "NOVO"), cut = Package("Cortado", "CORTADO"), megabyte(1 << 20, 'x');
  const struct {
    const char* Name;
    std::string Content;
    Texts Reasons;
  } cases[] = {
      {"bom", whole, {}},
      {"cortado na figura", cut.substr(0, cut.size() - 10), {"o pacote acaba antes do jogo"}},
      {"cortado no cabeçalho", cut.substr(0, 60), {"não é um pacote"}},
      {"cortado no jogo",
       Package("Novo 2", "NOVO2", "123456788"),
       {"a soma do jogo é outra: o pacote está cortado ou danificado"}},
      {"dispositivo", Package("Novo 3", "CON"), {"um nome do pacote sairia da coleção"}},
      {"figura de outro tipo",
       Package("Novo 8", "NOVO8", Rom, contract::SmallPng()),
       {"a figura não é .gif, .bmp nem .jpg"}},
      {"figura de pontos demais",
       Package("Novo 9", "NOVO9", Rom, contract::SmallJpeg({2'001, 2'000}) + std::string(8'000, 'x')),
       {"a figura tem mais de 4 megapixels"}},
      {"figura grande", Package("Novo 10", "NOVO10", Rom, Picture + megabyte), {"a figura tem mais de 1 MiB"}},
      {"longo",
       Package(std::string(101, 'x'), "NOVE_LETR"),
       {"o nome '" + std::string(101, 'x') + "' tem mais de 100 caracteres",
        "o nome DOS 'NOVE_LETR' tem mais de 8 caracteres"}},
      {"megabyte",
       Package("Novo 4", "NOVO4", megabyte),
       {"o jogo tem um número inteiro de MiB, e por isso não tem soma"}},
      {"minúsculas",
       Package("Novo 5.", "novo5"),
       {"o nome 'Novo 5.' não pode começar nem acabar com espaço ou ponto",
        "o nome DOS 'novo5' não pode ter o caractere n"}},
      {"número", Package("Novo 6", "NOVO6", Rom, ""), {"o cabeçalho do pacote tem um tamanho errado"}},
      {"outro nome DOS igual", Package("Novo 7", "NOVO"), {"o nome DOS 'NOVO' já é de C:\\p\\bom.tvk"}},
      {"outro nome igual", Package("NOVO", "NOVO_2"), {"o nome 'NOVO' já é de C:\\p\\bom.tvk"}},
      {"sem chave",
       std::string(whole).replace(whole.find("CRC="), 4, "SOMA"),
       {"falta uma linha no cabeçalho do pacote"}},
      {"sem nomes", Package("", ""), {"o nome '' falta", "o nome DOS '' falta"}},
      {"sinal", Package("X|Y=Z", "SINAL"), {"o nome 'X|Y=Z' não pode ter o caractere |"}},
      {"vazio", "", {"está vazio"}},
  };
  std::string errors, table = "arquivo,resultado,motivo\n";
  for (const auto& [name, content, reasons] : cases) {
    const std::string path = "C:\\p\\"s + name + ".tvk";
    PutFile(platform::FromUtf8(path), content);
    if (reasons.empty()) table += path + ",ok,\n";
    for (const std::string& reason : reasons) {
      errors += path + ": " + reason + "\n";
      const bool quoted = reason.find(',') != std::string::npos;
      table += path + ",recusado," + (quoted ? "\"" : "") + reason + (quoted ? "\"" : "") + "\n";
    }
  }
  const Files before = Standing();
  EXPECT_EQ(RunTvk({"verificar", "C:\\p"}), (Outcome{1, "Pacotes bons: 1; recusados: 17.\n", errors}));
  EXPECT_EQ(RunTvk({"verificar", "--csv", "C:\\p"}), (Outcome{1, table, errors}));
  EXPECT_EQ(Standing(), before);
}

TEST_F(Packages, ThatCannotBeReadAreNamedAndTheRestStillHappens) {
  PutFile("C:\\p.tvk", Package("Bom", "BOM"));
  PutFile("C:\\preso.tvk", "x");
  LockFile("C:\\preso.tvk");
  PutFile("C:\\grande.tvk", std::string((256 << 20) + 1, 'x'));
  PutDirectory("C:\\pasta.tvk\\dentro");
  const Outcome told =
      RunTvk({"verificar", "C:\\falta.tvk", "C:\\preso.tvk", "C:\\grande.tvk", "C:\\pasta.tvk", "C:\\p.tvk"});
  EXPECT_EQ(told, (Outcome{1, "Pacotes bons: 1; recusados: 3.\n",
                           "C:\\pasta.tvk: não há pacotes neste diretório\nC:\\falta.tvk: não existe\n"
                           "C:\\preso.tvk: não pode ser lido\nC:\\grande.tvk: tem mais de 256 MiB\n"}));
}

TEST_F(Packages, AreTakenApartUnderTheirNamesAndNothingOfThePersonsIsReplaced) {
  const std::string zip = "PK\x03\x04 and more";
  PutFile("C:\\a.tvk", Package("Um Jogo", "UM"));
  PutFile("C:\\b.tvk", Package("Dois", "DOIS", zip, contract::SmallJpeg(), "1787690592"));
  PutFile("C:\\c.tvk", Package("Mau", "MAU", "123456788"));
  PutFile("C:\\saida\\UM.smc", "123456780");  // as long as the game
  Files expected = Standing();
  expected["C:\\saida\\Um Jogo.gif"] = Picture;
  expected["C:\\saida\\DOIS.zip"] = zip;
  expected["C:\\saida\\Dois.jpg"] = contract::SmallJpeg();
  const std::string errors =
      "C:\\a.tvk: C:\\saida\\UM.smc já existe com outro conteúdo\n"
      "C:\\c.tvk: a soma do jogo é outra: o pacote está cortado ou danificado\n";
  const Texts arguments = {"extrair", "--saida", "C:/saida", "C:\\a.tvk", "C:\\b.tvk", "C:\\c.tvk"};
  EXPECT_EQ(RunTvk(arguments),
            (Outcome{1, "C:\\saida\\Um Jogo.gif\nC:\\saida\\DOIS.zip\nC:\\saida\\Dois.jpg\n", errors}));
  EXPECT_EQ(Standing(), expected);
  const std::uint64_t writes = WritesEver();
  EXPECT_EQ(RunTvk(arguments), (Outcome{1, "", errors}));
  EXPECT_EQ(WritesEver(), writes) << "what is there already is not written again";
}

}  // namespace
