#include "catalog/cls_DAT.h"

#include "platform/text.h"
#include "tests/falhas.h"

namespace {

using namespace platform::simulated;

const std::string Arquivo = "C:\\Tolvaris\\tolvaris.dat";

class CatalogoDeJogos : public testing::Test {
 protected:
  void SetUp() override {
    Reset();
    DirPrograma = "C:\\Tolvaris\\";
  }

  // As another program would write it, beside the open catalogue.
  static void Escrever(const std::string& dados) {
    platform::File arquivo(Arquivo, platform::Access::ReadWrite);
    EXPECT_TRUE(arquivo.SetSize(0) && arquivo.Write(0, dados));
  }

  // The name of a DOS name, or "-" when there is none.
  static std::string Nome(const cls_DAT& catalogo, const std::string& dosName) {
    Booleano encontrado = 7;
    const std::string nome = catalogo.DefineNome(dosName, encontrado);
    EXPECT_TRUE(encontrado == Verdadeiro || (encontrado == Falso && nome == dosName));
    return encontrado ? nome : "-";
  }
};

TEST_F(CatalogoDeJogos, LooksUpBothWays) {
  const struct {
    const char* Dados;
    const char *DOSName, *Nome;        // DefineNome; "-": not found
    const char *NomeDado, *Resultado;  // DefineDOSName
  } casos[] = {
      {"|JOGOUM=Jogo Um|", "jogoum", "Jogo Um", "Jogo Um", "JOGOUM"},
      {"|JOGOUM=Jogo Um|", "JOGO", "-", "jogo um", "jogo um"},
      {"|JOGOUM=Jogo Um|", "Jogo", "-", "ogo Um", "ogo Um"},
      {"|A=Primeiro||A=Segundo|", "a", "Primeiro", "Segundo", "A"},
      {"|A=X||B=X|", "B", "X", "X", "A"},
      {"|JOGOUM=Jogo Um", "JOGOUM", "Jogo Um", "Jogo Um", "Jogo Um"},
      {"JOGOUM=Jogo Um|", "JOGOUM", "-", "Jogo Um", "JOGOUM"},
      {"", "A", "-", "B", "B"},
      {"|A=|", "A", "", "", "A"},
      {"|=B|", "", "B", "B", ""},
      {"|A=B=C|", "A=B", "C", "C", "A=B"},
      {"|A=B=C|", "A", "B=C", "B=C", "A"},
      {"|A=B||C=D|", "A=B||C", "D", "B||C=D", "A"},
      {"|a=b|", "a", "-", "b", "a"},
  };
  for (const auto& caso : casos) {
    PutFile(Arquivo, caso.Dados);
    cls_DAT catalogo;
    catalogo.Carregar();
    EXPECT_EQ(Nome(catalogo, caso.DOSName), caso.Nome) << caso.Dados << " " << caso.DOSName;
    EXPECT_EQ(catalogo.DefineDOSName(caso.NomeDado), caso.Resultado) << caso.Dados << " " << caso.NomeDado;
  }
}

TEST_F(CatalogoDeJogos, OpensOnceAndReadsAtEachLoad) {
  cls_DAT catalogo;
  EXPECT_EQ(Nome(catalogo, "a"), "-");
  catalogo.Carregar();
  EXPECT_EQ(Content(Arquivo), "");  // created
  Escrever("|A=X|");
  EXPECT_EQ(Nome(catalogo, "a"), "-");
  catalogo.Atualizar();
  EXPECT_EQ(Nome(catalogo, "a"), "X");
  Escrever("");
  catalogo.Atualizar();
  EXPECT_EQ(Nome(catalogo, "a"), "X");  // an empty file changes nothing
  catalogo.Carregar();
  EXPECT_EQ(Nome(catalogo, "a"), "-");
  catalogo.Fechar();
  catalogo.RegistrarRom("Perdido", "p");
  EXPECT_EQ(Content(Arquivo), "");
  Escrever("|A=Y|");
  EXPECT_EQ(Nome(catalogo, "a"), "-");
  catalogo.Atualizar();
  EXPECT_EQ(Nome(catalogo, "a"), "Y");
}

TEST_F(CatalogoDeJogos, WithoutAFileThatOpensItIsEmptyUntilClosed) {
  PutFile(Arquivo, "|A=X|");
  LockFile(Arquivo);
  cls_DAT catalogo;
  catalogo.Carregar();
  LockFile(Arquivo, false);
  catalogo.Atualizar();
  catalogo.RegistrarRom("Novo", "n");
  EXPECT_EQ(Nome(catalogo, "a"), "-");
  EXPECT_EQ(Content(Arquivo), "|A=X|");
  catalogo.Fechar();
  catalogo.Carregar();
  EXPECT_EQ(Nome(catalogo, "a"), "X");

  cls_DAT leitura;
  leitura.Carregar2();
  EXPECT_EQ(Nome(leitura, "a"), "X");
  leitura.RegistrarRom("Novo", "n");
  EXPECT_EQ(Content(Arquivo), "|A=X|");
  RemoveFile(Arquivo);
  cls_DAT ausente;
  ausente.Carregar2();
  EXPECT_EQ(Content(Arquivo), std::nullopt);  // not created
}

TEST_F(CatalogoDeJogos, RegistrarRomAppendsOneEntryInOneWrite) {
  cls_DAT catalogo;
  catalogo.Carregar();
  const auto escritas = WriteCount(Arquivo);
  catalogo.RegistrarRom("Maçã"_ansi, "maçã"_ansi);
  EXPECT_EQ(Content(Arquivo), "|MAÇÃ=Maçã|"_ansi);
  EXPECT_EQ(WriteCount(Arquivo), escritas + 1);
  EXPECT_EQ(Nome(catalogo, "MAÇÃ"_ansi), "-");
  catalogo.RegistrarRom("Maçã"_ansi, "MAÇÃ"_ansi);
  EXPECT_EQ(Content(Arquivo), "|MAÇÃ=Maçã||MAÇÃ=Maçã|"_ansi);
  catalogo.Atualizar();
  EXPECT_EQ(Nome(catalogo, "maçã"_ansi), "Maçã"_ansi);
  catalogo.RegistrarRom("Maçã"_ansi, "maçã"_ansi);
  catalogo.RegistrarRom("Outra", "maçã"_ansi);
  EXPECT_EQ(Content(Arquivo), "|MAÇÃ=Maçã||MAÇÃ=Maçã||MAÇÃ=Outra|"_ansi);
}

TEST_F(CatalogoDeJogos, AnEntryIsWrittenWholeOrNotAtAll) {
  const std::string velho = "|A=Primeiro|", novo = velho + "|B=Segundo|";
  for (const bool corte : {false, true}) {
    cls_DAT catalogo;
    std::optional<std::string> conteudo;
    const int falhas = ComCadaFalha(
        [&] {
          PutFile(Arquivo, velho);
          catalogo.Fechar();
          catalogo.Carregar();
        },
        [&] { catalogo.RegistrarRom("Segundo", "b"); },
        [&] {
          if (corte) CutPower();
          conteudo = Content(Arquivo);
          EXPECT_TRUE(conteudo == velho || conteudo == novo) << *conteudo;
        });
    EXPECT_EQ(conteudo, novo);
    EXPECT_GE(falhas, 2);
  }
  Reset();
  PutFile(Arquivo, velho);
  cls_DAT catalogo;
  catalogo.Carregar();
  SetFreeSpace('C', 3);
  catalogo.RegistrarRom("Segundo", "b");
  EXPECT_EQ(Content(Arquivo), velho);
}

}  // namespace
