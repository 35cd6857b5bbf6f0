// Importing games through the system's dialog.
#include <algorithm>

#include "tests/windows/installation.h"

namespace {

const Message Added = Of(Mensagem::JogoAdicionado), Replace = Of(Mensagem::JogoJaExiste);

class ImportGame : public Installation {};

TEST_F(ImportGame, CopiesRomFilesAsTheyAre) {
  Start();
  Files expected = FilesIn(Home);
  Click(Import);
  const FileDialog dialog(*program);
  EXPECT_EQ(dialog.Title(), "Adicionar...");
  EXPECT_EQ(dialog.FileName(), "");
  EXPECT_EQ(dialog.FileTypes(), Texts{"Arquivos suportados"});
  dialog.Press(VK_ESCAPE);
  ExpectQuietEnd();

  const struct {
    std::string File, Entry, Selected;
  } cases[] = {
      {"Ação é Já.smc", "Ação é Já", "Ação é Já"},
      {"SUMIU.ZIP", "Sumiu", "Sumiu"},  // by the catalogue's name for it
      {"agua.smc", "Água Viva", ""},    // over the old file, unasked; no entry has the file's own name
  };
  for (const auto& [file, entry, selected] : cases) {
    const std::string rom = Bytes(static_cast<unsigned>(file.size()), 70'000);
    PutFile(Outside + file, rom);
    Choose(Import, Outside + file);
    EXPECT_EQ(Answer(IDOK), Added);
    EXPECT_SOON(window->Pictures[Import].Enabled());
    EXPECT_SOON_EQ(selected, Selected());
    const Texts entries = Entries(window->List);
    EXPECT_EQ(std::count(entries.begin(), entries.end(), entry), 1) << entry;
    expected["Roms\\" + file] = rom;
    ExpectFiles(expected, FilesIn(Home));
  }
}

TEST_F(ImportGame, OfAPackageAsksBeforeItReplaces) {
  const std::string name = "Coração à Vista";
  const COLORREF red = RGB(220, 20, 40);
  const COLORREF blue = RGB(30, 60, 230);
  const std::string rom = Bytes(1, (2 << 20) + 5);
  const std::string path = Outside + "jogo.TVK";
  PutFile(Outside + "figura", Gif(red));
  PutFile(Outside + "rom", rom);
  EXPECT_EQ(PackageFormat(Outside, "build jogo.TVK '" + name + "' CORACAO figura rom"), "");
  Start();
  Files expected = FilesIn(Home);
  Choose(Import, path);
  EXPECT_EQ(Answer(IDOK), Added);
  EXPECT_SOON_EQ(name, Selected());
  EXPECT_SOON_EQ(red, window->Preview());
  expected.erase("Imgs\\");  // no longer empty
  expected["Roms\\CORACAO.zip"] = rom;
  expected["Imgs\\" + name + ".gif"] = Gif(red);
  expected["tolvaris.dat"] += "|CORACAO=" + name + "|";
  ExpectFiles(expected, FilesIn(Home));

  PutFile(path, Package(name, "CORACAO", "-873187034", Gif(blue), "123456789"));
  for (const int answer : {IDNO, IDCANCEL, IDYES}) {
    ExpectFiles(expected, FilesIn(Home));
    Choose(Import, path);
    EXPECT_EQ(Answer(answer), Replace);
    if (answer != IDYES) ExpectQuietEnd();
  }
  EXPECT_EQ(Answer(IDOK), Added);
  EXPECT_SOON_EQ(blue, window->Preview());
  expected["Roms\\CORACAO.zip"] = "123456789";
  expected["Imgs\\" + name + ".gif"] = Gif(blue);
  ExpectFiles(expected, FilesIn(Home));
}

}  // namespace
