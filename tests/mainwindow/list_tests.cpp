#include "tests/contract/small_pictures.h"
#include "tests/mainwindow/menu.h"

namespace {

using contract::SmallBmp, contract::SmallGif, contract::SmallJpeg, contract::SmallPng;

struct List : Menu {};

TEST_F(List, ShowsRomFilesUnderTheirCatalogueNames) {
  PutFile(Home + "tolvaris.dat", "|SUPERJOG=Super Jogo||ACAO=Ação||Z.B=zebra||OUTRO=Super Jogo|"_ansi);
  for (const char* rom : {"acao.ZIP", "z.b.zip", "outro.smc", "leiame.txt"}) PutFile(Roms + rom, Rom);
  PutFile(Roms + "oculto.smc", Rom, 0x22);
  ASSERT_TRUE(Start());
  EXPECT_EQ(EntriesOf(form->List1), "Ação|Nome comprido|Super Jogo|Super Jogo|ULTIMO|zebra|"_ansi);

  ASSERT_EQ(form->Jogos.size(), 6U);
  const Jogo &first = form->Jogos[0], &unknown = form->Jogos[1];
  EXPECT_EQ(first.Arquivo + "|" + first.DOSName, Roms + "acao.ZIP|ACAO");
  EXPECT_TRUE(first.Catalogado);
  EXPECT_FALSE(unknown.Catalogado);
  EXPECT_EQ(unknown.DOSName, "");
  for (const Jogo& each : form->Jogos) EXPECT_EQ(each.ArquivoCurto, Form1::CaminhoCurto(each.Arquivo));
  EXPECT_NE(unknown.ArquivoCurto, unknown.Arquivo);

  EXPECT_EQ(form->IndiceJogo("SUPER JOGO"), 2) << "the first of two rows of one name";
  EXPECT_EQ(form->IndiceJogo("aÇÃO"_ansi), 0);
  EXPECT_EQ(form->IndiceJogo("leiame"), -1);
  for (const int noRow : {-1, 6}) EXPECT_EQ(form->CaminhoImagem(noRow), "") << noRow;
}

TEST_F(List, SelectsTheLastGamePlayedAndWithoutItLeavesOnlyTheCommandsThatNeedNoGame) {
  PutFile(Imgs + "Super Jogo.gif", SmallGif());
  const struct {
    const char *Name, *Directory, *Last;  // the settings
    const char* Selected;
    int Count;
  } cases[] = {
      {"in another letter case", "", "sUPER jogo", "Super Jogo", 3},
      {"none was played", "", "", "", 3},
      {"one that is gone", "", "Outro", "", 3},
      {"an empty directory", "\\Vazio\\", "Super Jogo", "", 0},
      {"a directory on a missing disk", "Q:\\Roms\\", "Super Jogo", "", 0},
  };
  for (const auto& [name, directory, last, selected, count] : cases) {
    SCOPED_TRACE(name);
    PutText(Key, "RomDir", directory);
    PutText(Key, "LRom", last);
    ASSERT_TRUE(Start());
    EXPECT_EQ(form->List1.Count(), count);
    EXPECT_EQ(Selected(), selected);
    EXPECT_EQ(States(), *selected ? GameSelected : NothingSelected);
    EXPECT_EQ(ContentOf(form->Image1.ShownPicture()), *selected ? SmallGif() : "");
    EXPECT_EQ(form->Caption(), "Tolvaris");
    EXPECT_EQ(Focused(), &form->List1);
    EXPECT_TRUE(ShownMessages().empty());
  }
}

TEST_F(List, WhileItIsReadNothingCanBeStartedAndTheWindowLives) {
  for (int i = 0; i < 22; ++i) PutFile(Roms + std::to_string(i) + ".smc", Rom);
  StartAndPick("7");
  const int runsBefore = PendingEventRuns();
  int looks = 0;
  const std::function<void()> look = [&] {
    if (form->Caption() != "Carregando...") return QueueEvent(look);
    ++looks;
    EXPECT_EQ(States(), "");
    Click(form->Command4);
    DoubleClick(form->List1);
  };
  QueueEvent(look);
  form->CarregarLista(true);
  EXPECT_EQ(looks, 1);
  EXPECT_GE(PendingEventRuns() - runsBefore, 3 + 3);  // at rows 0, 10 and 20, and around
  EXPECT_TRUE(ShownFileDialogs().empty());
  EXPECT_TRUE(StartedProcesses().empty());
  EXPECT_EQ(States(), NothingSelected);
}

// An event in the middle of a fill fills the list anew, with fewer games: table and list still belong together.
TEST_F(List, IsWholeWhenItIsFilledAgainWhileItIsRead) {
  for (int i = 0; i < 22; ++i) PutFile(Roms + std::to_string(i) + ".smc", Rom);
  ASSERT_TRUE(Start());
  int looks = 0;
  const std::function<void()> refill = [&] {
    if (form->Caption() != "Carregando..." || ++looks == 1) return QueueEvent(refill);  // the directory is not read yet
    for (int i = 0; i < 22; ++i) RemoveFile(Roms + std::to_string(i) + ".smc");
    form->CarregarLista(true);
    EXPECT_EQ(form->Jogos.size(), 3U);
  };
  QueueEvent(refill);
  form->CarregarLista(true);
  EXPECT_EQ(form->List1.Count(), static_cast<int>(form->Jogos.size()));
  for (int i = 0; i < form->List1.Count(); ++i) EXPECT_NE(form->IndiceJogo(form->List1.Text(i)), -1) << i;
}

TEST_F(List, PreviewTakesTheFirstPicturePresent) {
  ASSERT_TRUE(Start());
  const struct {
    const char *Name, *Extension;
    std::string Content, Shown;
  } steps[] = {
      {"an empty file counts as none: the default picture", ".jpg", "", ""},
      {"the last of the four", ".png", SmallPng(), SmallPng()},
      {"before it", ".jpg", SmallJpeg(), SmallJpeg()},
      {"before that", ".bmp", SmallBmp(), SmallBmp()},
      {"the first", ".gif", SmallGif(), SmallGif()},
      {"a damaged one leaves the picture that is shown", ".gif", "damaged", SmallGif()},
  };
  for (const auto& [name, extension, content, shown] : steps) {
    PutFile(Imgs + "Sem figura" + extension, content);
    Pick("Sem figura");
    EXPECT_EQ(ContentOf(form->Image1.ShownPicture()), shown) << name;
  }
  RemoveFile(Imgs + "Super Jogo.gif");
  Pick("Super Jogo");
  EXPECT_EQ(form->Image1.ShownPicture(), form->Picture1);
}

}  // namespace
