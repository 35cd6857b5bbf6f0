#include "catalog/cls_DAT.h"
#include "tests/fresh_machine.h"

namespace {

const std::string Arquivo = "C:\\Tolvaris\\tolvaris.dat";

struct CatalogoDeJogos : FreshMachine {
  // The name of a DOS name, or "-" when there is none.
  std::string Nome(const std::string& dosName) const {
    Booleano encontrado = 7;
    const std::string nome = Catalogo.DefineNome(dosName, encontrado);
    EXPECT_TRUE(encontrado == Verdadeiro || (encontrado == Falso && nome == dosName));
    return encontrado ? nome : "-";
  }

  cls_DAT Catalogo;
};

// The catalogue's text, a DOS name and its name, and a name and its DOS name.
TEST_F(CatalogoDeJogos, LooksUpBothWays) {
  const char* const casos[][5] = {
      {"|UM=Um A|", "um", "Um A", "Um A", "UM"},  {"|A=X||B=X|", "B", "X", "X", "A"},
      {"|UM=Um A|", "M", "-", "um a", "um a"},    {"|A=B=C|", "A", "B=C", "B=C", "A"},
      {"|A=Um||A=Dois|", "a", "Um", "Dois", "A"}, {"|=B|", "", "B", "B", ""},
      {"|UM=Um A", "UM", "Um A", "Um A", "Um A"}, {"|A=B=C|", "A=B", "C", "C", "A=B"},
      {"UM=Um A|", "UM", "-", "Um A", "UM"},      {"|a=b|", "a", "-", "b", "a"},
  };
  for (const auto& [dados, dosName, nome, nomeDado, resultado] : casos) {
    Catalogo.Fechar();
    PutFile(Arquivo, dados);
    Catalogo.Carregar();
    EXPECT_EQ(Nome(dosName), nome) << dados << " " << dosName;
    EXPECT_EQ(Catalogo.DefineDOSName(nomeDado), resultado) << dados << " " << nomeDado;
  }
}

TEST_F(CatalogoDeJogos, OpensOnceUntilItIsClosedAndReadsAtEachLoad) {
  Catalogo.Carregar2();
  EXPECT_EQ(Content(Arquivo), std::nullopt) << "created by Carregar2";
  const auto ler = &cls_DAT::Carregar, ler2 = &cls_DAT::Carregar2, reler = &cls_DAT::Atualizar,
             fechar = &cls_DAT::Fechar;
  const std::tuple<const char*, void (cls_DAT::*)(), const char*> passos[] = {
      {"|A=X|", ler, "-"},     {"|A=X|", fechar, "-"}, {"|A=X|", reler, "X"}, {"|A=Y|", nullptr, "X"},
      {"", reler, "X"},        {"", ler, "-"},         {"|A=Z|", ler, "Z"},   {"|A=Z|", fechar, "-"},
      {"|A=Z|", nullptr, "-"}, {"|A=V|", ler2, "V"}};
  for (const auto& [dados, acao, nome] : passos) {
    platform::File aberto(Arquivo, platform::Access::ReadWrite);  // by another program, beside the catalogue
    EXPECT_TRUE(aberto.SetSize(0) && aberto.Write(0, dados));
    if (acao != nullptr) (Catalogo.*acao)();
    EXPECT_EQ(Nome("a"), nome) << dados;
    EXPECT_TRUE(acao != fechar || OpenFiles() == 1);
  }
  Catalogo.RegistrarRom("Novo", "n");
  EXPECT_EQ(Content(Arquivo), "|A=V|") << "opened for reading only";
}

TEST_F(CatalogoDeJogos, RegistrarRomAppendsOneEntryInOneWriteWholeOrNotAtAll) {
  const std::string velho = "|A=Primeiro|", entrada = "|MAÇÃ=Maçã|"_ansi;
  const auto preparar = [&] {
    PutFile(Arquivo, velho);
    Catalogo.Fechar();
    Catalogo.Carregar();
  };
  const auto registrar = [&] { Catalogo.RegistrarRom("Maçã"_ansi, "maçã"_ansi); };
  const auto conferir = [&] { EXPECT_TRUE(Content(Arquivo) == velho || Content(Arquivo) == velho + entrada); };
  EXPECT_GE(WithEachFault(Fault::Once, preparar, registrar, conferir), 2);
  const auto escritas = WriteCount(Arquivo);
  registrar();
  EXPECT_EQ(WriteCount(Arquivo), escritas + 1);
  EXPECT_EQ(Nome("MAÇÃ"_ansi), "-") << "not before it is read again";
  Catalogo.Atualizar();
  EXPECT_EQ(Nome("maçã"_ansi), "Maçã"_ansi);
  registrar();
  Catalogo.RegistrarRom("Outra", "maçã"_ansi);
  CutPower();
  EXPECT_EQ(Content(Arquivo), velho + entrada + entrada + "|MAÇÃ=Outra|"_ansi);
}

}  // namespace
