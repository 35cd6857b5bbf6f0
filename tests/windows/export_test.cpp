// Exporting games through the system's dialog.
#include "tests/windows/installation.h"

namespace {

class ExportGame : public Installation {
 protected:
  ExportGame() {
    Put("Imgs\\Élan.bmp", Gif(RGB(10, 200, 60)));
    Put("Roms\\elan.ZIP", rom);
    Start();
  }

  const std::string rom = Bytes(1, (2 << 20) + 5);
};

// The extension is that of the type, and the program itself asks before a file is replaced.
TEST_F(ExportGame, TakesNameAndTypeFromTheDialog) {
  Files expected = FilesIn(Outside);
  PutFile(Outside + "c.zip", "antigo");
  Select("Élan");
  Click(Export);
  const FileDialog dialog(*program);
  EXPECT_EQ(dialog.Title(), "Salvar como...");
  EXPECT_EQ(dialog.FileName(), "Élan");
  EXPECT_EQ(dialog.FileTypes(), (Texts{"Arquivo Tolvaris (*.tvk)", "Arquivo ZIP (*.zip)"}));
  dialog.ChooseNextType();
  dialog.Enter(Outside + "c");
  EXPECT_EQ(Answer(IDYES), Of(Mensagem::ArquivoJaExiste));
  EXPECT_EQ(Answer(IDOK), Of(Mensagem::ArquivoSalvo));
  ExpectQuietEnd();
  expected["c.zip"] = rom;

  Select("Élan");
  Click(Export);
  FileDialog(*program).Press(VK_RETURN);  // the name that is offered, where the dialog was last
  EXPECT_EQ(Answer(IDOK), Of(Mensagem::ArquivoSalvo));
  ExpectQuietEnd();
  expected["Élan.tvk"] = Package("Élan", "ELAN", "-849089814", Gif(RGB(10, 200, 60)), rom);

  Select("Zebra");
  Click(Export);
  FileDialog(*program).Press(VK_ESCAPE);
  ExpectQuietEnd();
  ExpectFiles(expected, FilesIn(Outside));
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
