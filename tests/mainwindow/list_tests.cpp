#include "support/mod_Globais.h"
#include "tests/mainwindow/menu.h"

namespace menu {
namespace {

class List : public Menu {};

TEST_F(List, ShowsRomFilesUnderTheirCatalogueNames) {
  PutCatalogue("|JOGOUM=Jogo Um||ACAO=Ação||Z.B=zebra||OUTRO=Jogo Um|"_ansi);
  PutRom("jogoum.smc");
  PutRom("acao.ZIP");
  PutRom("z.b.zip");
  PutRom("outro.smc");
  PutRom("Um nome comprido.zip");
  PutRom("leiame.txt");
  PutRom("oculto.smc");
  SetAttributes(Home + "Roms\\oculto.smc", 0x22);
  ASSERT_TRUE(Start());
  EXPECT_EQ(Names(), (Texts{"Ação"_ansi, "Jogo Um", "Jogo Um", "Um nome comprido", "zebra"}));

  ASSERT_EQ(form->Jogos.size(), 5U);
  const Jogo& first = form->Jogos[0];
  EXPECT_EQ(first.Arquivo, Home + "Roms\\acao.ZIP");
  EXPECT_EQ(first.DOSName, "ACAO");
  EXPECT_TRUE(first.Catalogado);
  const Jogo& unknown = form->Jogos[3];
  EXPECT_EQ(unknown.Nome, "Um nome comprido");
  EXPECT_EQ(unknown.DOSName, "");
  EXPECT_FALSE(unknown.Catalogado);
  for (const Jogo& each : form->Jogos) EXPECT_EQ(each.ArquivoCurto, Form1::CaminhoCurto(each.Arquivo));
  EXPECT_NE(unknown.ArquivoCurto, unknown.Arquivo);

  EXPECT_EQ(form->IndiceJogo("JOGO UM"), 1);  // of two rows of one name, the first
  EXPECT_EQ(form->IndiceJogo("aÇÃO"_ansi), 0);
  EXPECT_EQ(form->IndiceJogo("leiame"), -1);
  EXPECT_TRUE(form->InList1("ZEBRA"));
  EXPECT_FALSE(form->InList1("Jogo"));
}

TEST_F(List, AnEmptyOrUnreadableDirectoryLeavesOnlyTheCommandsThatNeedNoGame) {
  PutText(Key, "LRom", "Jogo");
  PutText(Key, "RomDir", "Q:\\Roms\\");
  ASSERT_TRUE(Start());
  EXPECT_EQ(States(), NothingSelected);
  EXPECT_TRUE(ShownMessages().empty());
  PutText(Key, "RomDir", "");
  ASSERT_TRUE(Start());
  EXPECT_TRUE(Names().empty());
  EXPECT_EQ(form->Caption(), "Tolvaris");
  EXPECT_EQ(States(), NothingSelected);
  EXPECT_EQ(form->Image1.ShownPicture(), form->Picture1);
  EXPECT_EQ(Focused(), &form->List1);
  EXPECT_FALSE(form->InList1(""));
  EXPECT_EQ(form->IndiceJogo(""), -1);
}

TEST_F(List, TheLastGamePlayedIsSelectedAgain) {
  struct Case {
    const char *Last, *Selected, *States;
  };
  const Case cases[] = {{"", "", NothingSelected}, {"Outro", "", NothingSelected}, {"jOGO b", "Jogo B", GameSelected}};
  PutRom("Jogo A.smc");
  PutRom("Jogo B.smc");
  PutFile(Home + "Imgs\\Jogo B.bmp", Bitmap('b'));
  for (const Case& each : cases) {
    PutText(Key, "LRom", each.Last);
    ASSERT_TRUE(Start());
    EXPECT_EQ(form->List1.Text(form->List1.Selected()), each.Selected) << each.Last;
    EXPECT_EQ(States(), each.States) << each.Last;
  }
  EXPECT_EQ(ContentOf(form->Image1.ShownPicture()), Bitmap('b'));
}

TEST_F(List, WhileItIsReadNothingCanBeStartedAndTheWindowLives) {
  for (int i = 0; i < 25; ++i) PutRom("jogo" + std::to_string(i) + ".smc");
  ASSERT_TRUE(Start());
  Pick("jogo7");
  const int runsBefore = PendingEventRuns();
  std::string caption, states;
  int looks = 0;
  const std::function<void()> look = [&] {
    if (form->Caption() != "Carregando...") return QueueEvent(look);
    ++looks;
    caption = form->Caption();
    states = States();
    Click(form->Command4);
    DoubleClick(form->List1);
  };
  QueueEvent(look);
  form->CarregarLista(true);
  EXPECT_EQ(looks, 1);
  EXPECT_EQ(caption, "Carregando...");
  EXPECT_EQ(states, "");
  EXPECT_GE(PendingEventRuns() - runsBefore, 3 + 3);  // at rows 0, 10 and 20, and around
  EXPECT_TRUE(ShownFileDialogs().empty());
  EXPECT_TRUE(StartedProcesses().empty());
  EXPECT_EQ(States(), NothingSelected);
  EXPECT_EQ(form->Caption(), "Tolvaris");
}

TEST_F(List, BusyStateDisablesAndAClickEnablesTheGameCommands) {
  PutRom("a.smc");
  ASSERT_TRUE(Start());
  Choose(form->List1, 0);
  EXPECT_EQ(States(), GameSelected);
  form->Desativar();
  EXPECT_EQ(States(), "li");
  form->Ativar(true);
  EXPECT_EQ(States(), NothingSelected);
  form->Ativar();
  EXPECT_EQ(States(), GameSelected);
  form->Desativar(true);
  EXPECT_EQ(States(), "");
  form->Ativar();
  form->List1.Select(-1);
  form->Desativar();
  form->Ativar();
  EXPECT_EQ(States(), NothingSelected);
}

TEST_F(List, PreviewTakesTheFirstPicturePresent) {
  PutRom("Jogo.smc");
  PutRom("Outro.smc");
  const std::string base = Home + "Imgs\\Jogo";
  ASSERT_TRUE(Start());
  struct Step {
    const char* Extension;
    std::string Content;
    std::string Shown;   // empty: the default picture
    const char* Chosen;  // extension of the file that stands for the game
  };
  const Step steps[] = {
      {".jpg", "", "", ""},  // an empty file counts as none
      {".jpg", Bitmap('j'), Bitmap('j'), ".jpg"},
      {".bmp", Bitmap('b'), Bitmap('b'), ".bmp"},
      {".gif", Bitmap('g'), Bitmap('g'), ".gif"},
      {".gif", "damaged", Bitmap('g'), ".gif"},  // leaves the picture that is shown
  };
  for (const Step& each : steps) {
    PutFile(base + each.Extension, each.Content);
    Pick("Jogo");
    EXPECT_EQ(ContentOf(form->Image1.ShownPicture()), each.Shown) << each.Extension << each.Content.size();
    EXPECT_EQ(form->CaminhoImagem(0), *each.Chosen ? base + each.Chosen : "") << each.Extension;
  }
  Pick("Outro");
  EXPECT_EQ(form->Image1.ShownPicture(), form->Picture1);
  EXPECT_EQ(form->CaminhoImagem(7), "");
}

}  // namespace
}  // namespace menu
