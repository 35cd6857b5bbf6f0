#include "catalog/cls_DAT.h"
#include "platform/text.h"
#include "tests/falhas.h"

namespace {

using namespace platform::simulated;

const std::string Arquivo = "C:\\Tolvaris\\tolvaris.dat";

struct CatalogoDeJogos : testing::Test {
  void SetUp() override { Reset(), DirPrograma = "C:\\Tolvaris\\"; }

  // The name of a DOS name, or "-" when there is none.
  static std::string Nome(const cls_DAT& catalogo, const std::string& dosName) {
    Booleano encontrado = 7;
    const std::string nome = catalogo.DefineNome(dosName, encontrado);
    EXPECT_TRUE(encontrado == Verdadeiro || (encontrado == Falso && nome == dosName));
    return encontrado ? nome : "-";
  }
};

// The catalogue's text, a DOS name and its name, and a name and its DOS name.
TEST_F(CatalogoDeJogos, LooksUpBothWays) {
  const char* const casos[][5] = {
      {"|UM=Um A|", "um", "Um A", "Um A", "UM"},    {"|A=X||B=X|", "B", "X", "X", "A"},
      {"|UM=Um A|", "U", "-", "um a", "um a"},      {"", "AA", "-", "BB", "BB"},
      {"|UM=Um A|", "M", "-", "m A", "m A"},        {"|A=|", "A", "", "", "A"},
      {"|A=Um||A=Dois|", "a", "Um", "Dois", "A"},   {"|=B|", "", "B", "B", ""},
      {"|UM=Um A", "UM", "Um A", "Um A", "Um A"},   {"|A=B=C|", "A=B", "C", "C", "A=B"},
      {"UM=Um A|", "UM", "-", "Um A", "UM"},        {"|A=B=C|", "A", "B=C", "B=C", "A"},
      {"|A=B||C=D|", "A=B||C", "D", "B||C=D", "A"}, {"|a=b|", "a", "-", "b", "a"},
  };
  for (const auto& [dados, dosName, nome, nomeDado, resultado] : casos) {
    PutFile(Arquivo, dados);
    cls_DAT catalogo;
    catalogo.Carregar();
    EXPECT_EQ(Nome(catalogo, dosName), nome) << dados << " " << dosName;
    EXPECT_EQ(catalogo.DefineDOSName(nomeDado), resultado) << dados << " " << nomeDado;
  }
}

TEST_F(CatalogoDeJogos, OpensOnceAndReadsAtEachLoad) {
  cls_DAT catalogo;
  catalogo.Carregar();
  EXPECT_EQ(Content(Arquivo), "");  // created
  using Acao = void (cls_DAT::*)();
  const Acao ler = &cls_DAT::Carregar, reler = &cls_DAT::Atualizar, fechar = &cls_DAT::Fechar;
  const std::tuple<const char*, Acao, const char*> passos[] = {
      {"|A=X|", nullptr, "-"}, {"|A=X|", reler, "X"},  {"", reler, "X"},        {"", ler, "-"},
      {"|A=Y|", ler, "Y"},     {"|A=Y|", fechar, "-"}, {"|A=Y|", nullptr, "-"}, {"|A=Z|", reler, "Z"}};
  for (const auto& [dados, acao, nome] : passos) {
    platform::File aberto(Arquivo, platform::Access::ReadWrite);  // by another program, beside the catalogue
    EXPECT_TRUE(aberto.SetSize(0) && aberto.Write(0, dados));
    if (acao != nullptr) (catalogo.*acao)();
    EXPECT_EQ(Nome(catalogo, "a"), nome) << dados;
  }
}

TEST_F(CatalogoDeJogos, WithoutAFileThatOpensItIsEmptyUntilClosed) {
  cls_DAT catalogo, leitura, fechado;
  leitura.Carregar2();
  EXPECT_EQ(Content(Arquivo), std::nullopt);  // not created
  leitura.Fechar();
  PutFile(Arquivo, "|A=X|");
  LockFile(Arquivo);
  catalogo.Carregar();
  LockFile(Arquivo, false);
  catalogo.Atualizar();
  leitura.Carregar2();
  fechado.Carregar();
  fechado.Fechar();
  EXPECT_EQ(Nome(catalogo, "a") + Nome(leitura, "a"), "-X");
  for (cls_DAT* cada : {&catalogo, &leitura, &fechado}) cada->RegistrarRom("Novo", "n");
  EXPECT_EQ(Content(Arquivo), "|A=X|");
  catalogo.Fechar();
  catalogo.Carregar();
  EXPECT_EQ(Nome(catalogo, "a"), "X");
}

TEST_F(CatalogoDeJogos, RegistrarRomAppendsOneEntryInOneWrite) {
  cls_DAT catalogo;
  catalogo.Carregar();
  const auto escritas = WriteCount(Arquivo);
  for (const auto& dosName : {"maçã"_ansi, "MAÇÃ"_ansi}) catalogo.RegistrarRom("Maçã"_ansi, dosName);
  EXPECT_EQ(WriteCount(Arquivo), escritas + 2);
  EXPECT_EQ(Nome(catalogo, "MAÇÃ"_ansi), "-");
  EXPECT_EQ(Content(Arquivo), "|MAÇÃ=Maçã||MAÇÃ=Maçã|"_ansi);
  catalogo.Atualizar();
  EXPECT_EQ(Nome(catalogo, "maçã"_ansi), "Maçã"_ansi);
  catalogo.RegistrarRom("Maçã"_ansi, "maçã"_ansi);
  catalogo.RegistrarRom("Outra", "maçã"_ansi);
  SetFreeSpace('C', 3);
  catalogo.RegistrarRom("Sem lugar", "s");
  EXPECT_EQ(Content(Arquivo), "|MAÇÃ=Maçã||MAÇÃ=Maçã||MAÇÃ=Outra|"_ansi);
}

TEST_F(CatalogoDeJogos, AnEntryIsWrittenWholeOrNotAtAll) {
  const std::string velho = "|A=Primeiro|", novo = velho + "|B=Segundo|";
  cls_DAT catalogo;
  std::optional<std::string> conteudo;
  const auto preparar = [&] {
    PutFile(Arquivo, velho);
    catalogo.Fechar();
    catalogo.Carregar();
  };
  const auto conferir = [&] {
    for (const bool corte : {false, true}) {
      if (corte) CutPower();
      conteudo = Content(Arquivo);
      EXPECT_TRUE(conteudo == velho || conteudo == novo) << *conteudo;
    }
  };
  EXPECT_GE(ComCadaFalha(
                preparar, [&] { catalogo.RegistrarRom("Segundo", "b"); }, conferir),
            2);
  EXPECT_EQ(conteudo, novo);
}

}  // namespace
