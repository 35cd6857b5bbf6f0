#include "catalog/busca.h"
#include "catalog/cls_DAT.h"
#include "catalog/reescrita.h"
#include "tests/fresh_machine.h"

namespace {

const std::string Catalogue = "C:\\Tolvaris\\tolvaris.dat";

struct Rewriting : FreshMachine {};

TEST_F(Rewriting, GivesNamesAndLeavesAllElseAsItIsFound) {
  const std::vector<NomeNovo> news = {{"A", "Novo"}, {"B", "Velho"}};
  const std::string front = "|A=Novo||B=Velho|";
  const struct {
    const char *Name, *Before;
    std::string After;
  } cases[] = {
      {"no catalogue", "", front},
      {"entries of others", "|C=c||D=d|", front + "|C=c||D=d|"},
      {"entries of their own between them", "|C=c||A=Velho||D=d||B=x|", front + "|C=c||D=d|"},
      {"several of one DOS name", "|A=x||C=c||A=y|", front + "|C=c|"},
      {"names of entries without a game", "|Z=Novo||A=x||Y=Velho|", front + "|Z=Novo||Y=Velho|"},
      {"one bar between two entries", "|C=c|A=x|D=d|", front + "|C=c|D=d|"},
      {"no bar at the end", "|C=c||A=x", front + "|C=c|"},
      {"signs in a name", "|A=x=y||C=c=A|", front + "|C=c=A|"},
      {"no bar at the beginning", "A=x||C=c|", "A=x" + front + "||C=c|"},
      {"a DOS name that only begins so", "|AA=x||A|C=c|", front + "|AA=x||A|C=c|"},
  };
  for (const auto& [name, before, after] : cases) {
    const std::string found = ComNomes(before, news);
    EXPECT_EQ(found, after) << name;
    for (const NomeNovo& each : news) {
      EXPECT_EQ(BuscarNome(found, each.DOSName), each.Nome) << name;
      EXPECT_EQ(BuscarChave(found, each.Nome), each.DOSName) << name;
    }
    for (const char* other : {"C", "D", "Z", "AA", "x"}) {
      EXPECT_EQ(BuscarNome(found, other), BuscarNome(before, other)) << name << ": " << other;
    }
  }
}

TEST_F(Rewriting, PutsOneWholeTextInThePlaceOfAnother) {
  const TextoDoCatalogo none, old = "old", grown = "old|X=x|", other = "new";
  const struct {
    const char* Name;
    TextoDoCatalogo Standing, Before, After;
    bool Open, Done;
  } cases[] = {
      {"another text", old, old, other, false, true},
      {"the first text", none, none, other, false, true},
      {"no text any more", old, old, none, false, true},
      {"what has grown meanwhile", grown, old, other, false, false},
      {"what has come meanwhile", old, none, other, false, false},
      {"what has gone meanwhile", none, old, other, false, false},
      {"while a program has it open", old, old, other, true, false},
      {"no text, while a program has it open", old, old, none, true, false},
  };
  for (const auto& [name, standing, before, after, open, done] : cases) {
    Renew();
    PutDirectory("C:\\Tolvaris");
    if (standing) PutFile(Catalogue, *standing);
    platform::File menu;
    if (open) menu = platform::File(Catalogue, platform::Access::Read);
    EXPECT_EQ(TrocarCatalogo(before, after), done) << name;
    EXPECT_EQ(Content(Catalogue), done ? after : standing) << name;
    EXPECT_EQ(AllFiles().size(), Content(Catalogue) ? 1U : 0U) << name;
  }
}

}  // namespace
