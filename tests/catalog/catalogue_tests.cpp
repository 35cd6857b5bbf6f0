#include "catalog/cls_DAT.h"
#include "tests/fresh_machine.h"

namespace {

const std::string File = "C:\\Tolvaris\\tolvaris.dat";

struct Catalogue : FreshMachine {
  // The name of a DOS name, or "-" when there is none.
  std::string NameOf(const std::string& dosName) const {
    Booleano found = 7;
    const std::string name = Names.DefineNome(dosName, found);
    EXPECT_TRUE(found == Verdadeiro || found == Falso);
    if (found == Falso) {
      EXPECT_EQ(name, dosName);
    }
    return found ? name : "-";
  }

  cls_DAT Names;
};

TEST_F(Catalogue, LooksUpBothWays) {
  // The catalogue's text; a DOS name and its name, "-" for none; a name and its DOS name.
  const struct {
    const char *Case, *Data, *DosName, *Name, *GivenName, *ItsDosName;
  } cases[] = {
      {"a small letter in the DOS name", "|UM=Um A|", "um", "Um A", "Um A", "UM"},
      {"one name twice", "|A=X||B=X|", "B", "X", "X", "A"},
      {"the end of a DOS name, small letters in the name", "|UM=Um A|", "M", "-", "um a", "um a"},
      {"a sign in the name", "|A=B=C|", "A", "B=C", "B=C", "A"},
      {"one DOS name twice", "|A=Um||A=Dois|", "a", "Um", "Dois", "A"},
      {"an empty DOS name", "|=B|", "", "B", "B", ""},
      {"no bar at the end", "|UM=Um A", "UM", "Um A", "Um A", "Um A"},
      {"a sign in the DOS name", "|A=B=C|", "A=B", "C", "C", "A=B"},
      {"no bar at the beginning", "UM=Um A|", "UM", "-", "Um A", "UM"},
      {"small letters in the catalogue", "|a=b|", "a", "-", "b", "a"},
  };
  for (const auto& each : cases) {
    Names.Fechar();
    PutFile(File, each.Data);
    Names.Carregar();
    EXPECT_EQ(NameOf(each.DosName), each.Name) << each.Case;
    EXPECT_EQ(Names.DefineDOSName(each.GivenName), each.ItsDosName) << each.Case;
  }
}

TEST_F(Catalogue, OpensOnceUntilItIsClosedAndReadsAtEachLoad) {
  Names.Carregar2();
  EXPECT_EQ(Content(File), std::nullopt) << "created by Carregar2";
  const auto load = &cls_DAT::Carregar, load2 = &cls_DAT::Carregar2, reload = &cls_DAT::Atualizar,
             close = &cls_DAT::Fechar;
  const struct {
    const char *Name, *Data;  // what another program writes into the file
    void (cls_DAT::*Act)();
    const char* Found;
  } steps[] = {
      {"load, once Carregar2 has found no file", "|A=X|", load, "-"},
      {"close", "|A=X|", close, "-"},
      {"reload a closed one", "|A=X|", reload, "X"},
      {"nothing", "|A=Y|", nullptr, "X"},
      {"reload an empty file", "", reload, "X"},
      {"load an empty file", "", load, "-"},
      {"load", "|A=Z|", load, "Z"},
      {"close again", "|A=Z|", close, "-"},
      {"nothing with a closed one", "|A=Z|", nullptr, "-"},
      {"load by Carregar2", "|A=V|", load2, "V"},
  };
  for (const auto& [name, data, act, found] : steps) {
    SCOPED_TRACE(name);
    platform::File other(File, platform::Access::ReadWrite);  // beside the catalogue
    EXPECT_TRUE(other.SetSize(0));
    EXPECT_TRUE(other.Write(0, data));
    if (act != nullptr) (Names.*act)();
    EXPECT_EQ(NameOf("a"), found);
    if (act == close) {
      EXPECT_EQ(OpenFiles(), 1U) << "the other program's";
    }
  }
  Names.RegistrarRom("Novo", "n");
  EXPECT_EQ(Content(File), "|A=V|") << "opened for reading only";
}

TEST_F(Catalogue, RegistrarRomAppendsOneEntryInOneWriteWholeOrNotAtAll) {
  const std::string old = "|A=Primeiro|", entry = "|MAÇÃ=Maçã|"_ansi;
  const auto prepare = [&] {
    PutFile(File, old);
    Names.Fechar();
    Names.Carregar();
  };
  bool told = false;
  const auto add = [&] { told = Names.RegistrarRom("Maçã"_ansi, "maçã"_ansi); };
  const auto check = [&] { EXPECT_TRUE(Content(File) == old + entry || (Content(File) == old && !told)); };
  EXPECT_GE(WithEachFault(Fault::Once, prepare, add, check), 2);
  const auto writes = WriteCount(File);
  add();
  EXPECT_EQ(WriteCount(File), writes + 1);
  EXPECT_EQ(NameOf("MAÇÃ"_ansi), "-") << "not before it is read again";
  Names.Atualizar();
  EXPECT_EQ(NameOf("maçã"_ansi), "Maçã"_ansi);
  add();
  Names.RegistrarRom("Outra", "maçã"_ansi);
  CutPower();
  EXPECT_EQ(Content(File), old + entry + entry + "|MAÇÃ=Outra|"_ansi);
}

}  // namespace
