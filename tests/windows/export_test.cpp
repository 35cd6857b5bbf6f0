// Exporting games through the system's dialog.
#include "tests/windows/installation.h"

namespace {

const std::string Tvk = "Arquivo Tolvaris (*.tvk)", Zip = "Arquivo ZIP (*.zip)", Smc = "Arquivo SMC (*.smc)";

class ExportGame : public Installation {
 protected:
  ExportGame() {
    Put("Imgs\\Élan.bmp", Gif(RGB(10, 200, 60)));
    Put("Imgs\\abelha.gif", Gif(RGB(10, 200, 60)));
    Put("Roms\\elan.ZIP", rom);
    Start();
  }

  const std::string rom = Bytes(1, (2 << 20) + 5);
  const std::string package = Package("Élan", "ELAN", "-849089814", Gif(RGB(10, 200, 60)), rom);
};

TEST_F(ExportGame, OffersWhatAGameCanBeSavedAsAndAsksBeforeItReplacesAFile) {
  const struct {
    std::string Game;
    Texts Types;
    int Chosen;                 // the place of the type that is chosen
    std::string Typed;          // empty: the name that is offered is taken
    std::string File, Content;  // with the type's extension
    int Answered = 0;           // to the question whether to replace it; 0: it is not asked
  } cases[] = {
      {"Zebra", {Smc}, 0, Outside + "cópia", "cópia.smc", "jogo"},
      {"abelha", {Zip}, 0, Outside + "b", "b.zip", "jogo"},  // not in the catalogue
      {"Élan", {Tvk, Zip}, 0, Outside + "d", "d.tvk", package},
      {"Élan", {Tvk, Zip}, 1, Outside + "c", "c.zip", rom},
      {"Zebra", {Smc}, 0, Outside + "leia.txt", "leia.txt", "texto", IDNO},  // the type of the file is not asked
      {"Zebra", {Smc}, 0, Outside + "leia.txt", "leia.txt", "texto", IDCANCEL},
      {"Zebra", {Smc}, 0, Outside + "leia.txt", "leia.txt", "jogo", IDYES},
      {"Élan", {Tvk, Zip}, 0, "", "Élan.tvk", package},  // where the dialog was last
  };
  const Files before = FilesIn(Home);
  Files expected = FilesIn(Outside);
  for (const auto& [game, types, chosen, typed, file, content, answered] : cases) {
    SCOPED_TRACE(file);
    Select(game);
    Click(Export);
    const FileDialog dialog(*program);
    EXPECT_EQ(dialog.Title(), "Salvar como...");
    EXPECT_EQ(dialog.FileName(), game);
    EXPECT_EQ(dialog.FileTypes(), types);
    for (int i = 0; i < chosen; ++i) dialog.ChooseNextType();
    if (!typed.empty()) dialog.Type(typed);
    dialog.Press(VK_RETURN);
    if (answered != 0) {
      EXPECT_EQ(Answer(answered), Of(Mensagem::ArquivoJaExiste));
    }
    if (answered == 0 || answered == IDYES) {
      EXPECT_EQ(Answer(IDOK), Of(Mensagem::ArquivoSalvo));
    }
    ExpectQuietEnd();
    expected[file] = content;
    ExpectFiles(expected, FilesIn(Outside));
  }
  Select("Zebra");
  Click(Export);
  FileDialog(*program).Press(VK_ESCAPE);
  ExpectQuietEnd();
  ExpectFiles(before, FilesIn(Home));
  EXPECT_EQ(PackageFormat(Outside, "read d.tvk figura rom"), "\xC3\x89lan\nELAN\n-849089814\n-849089814\n");
  EXPECT_EQ(ContentOf(Outside + "figura"), Gif(RGB(10, 200, 60)));
  EXPECT_TRUE(ContentOf(Outside + "rom") == rom);
}

TEST_F(ExportGame, ThatCannotBeWrittenIsToldAndLeavesWhatWasThere) {
  const FloppyDisk disk;
  if (!disk.IsSmall()) GTEST_SKIP() << "drive A: has more than 1440 KiB: no file system could be mounted for it";
  for (const std::string& path : {Outside + "falta\\e.zip", std::string("A:\\cheio.zip"), std::string("A:\\e.tvk")}) {
    Select("Élan");
    Choose(Export, path);
    EXPECT_EQ(Answer(IDOK), Of(Mensagem::ErroAoGravar)) << path;
    ExpectQuietEnd();
  }
  ExpectFiles({{"leia.txt", "texto"}}, FilesIn(Outside));
  ExpectFiles({}, FilesIn("A:\\"));
}

}  // namespace
