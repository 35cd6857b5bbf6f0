// Exporting games through the system's dialog.
#include "tests/windows/collection.h"

namespace {

using driver::Answer;
using driver::Message;

const Message Saved = {"Ok", "Arquivo salvo.", {IDOK}};
const Message CannotWrite = {"Erro", "Erro ao gravar arquivo.", {IDOK}};
const Message IsThere = {"Confirmar", "Arquivo já existente.\r\n\r\nSubstituir ?", {IDYES, IDNO, IDCANCEL}};

const std::string Package = "Arquivo Tolvaris (*.tvk)", Zip = "Arquivo ZIP (*.zip)", Smc = "Arquivo SMC (*.smc)";

class ExportGame : public Collection {
 protected:
  ExportGame() {
    for (const char* name : {"Élan.bmp", "abelha.gif"}) installation.Put(std::string("Imgs\\") + name, picture);
    installation.Put("Roms\\elan.ZIP", rom);
  }

  const std::string picture = Bmp(RGB(10, 200, 60), 3, 2), rom = Bytes(1, (2 << 20) + 5);
};

TEST_F(ExportGame, OffersWhatAGameCanBeSavedAs) {
  const struct {
    std::string Game;
    Texts Types;
    int Chosen;           // the place of the type that is chosen
    std::string Typed;    // empty: the name that is offered is taken
    std::string Written;  // with the type's extension
  } cases[] = {
      {"Zebra", {Smc}, 0, Outside + "cópia", "Fora\\cópia.smc"},
      {"abelha", {Zip}, 0, Outside + "b", "Fora\\b.zip"},  // not in the catalogue
      {"Élan", {Package, Zip}, 0, Outside + "d", "Fora\\d.tvk"},
      {"Élan", {Package, Zip}, 1, Outside + "c", "Fora\\c.zip"},
      {"Zebra", {Smc}, 0, Outside + "e.zip", "Fora\\e.zip"},  // the type of the file is not asked
      {"Élan", {Package, Zip}, 0, "", "Fora\\Élan.tvk"},      // where the dialog was last
  };
  Start();
  const Files before = Kept();
  for (const auto& [game, types, chosen, typed, written] : cases) {
    SCOPED_TRACE(written);
    Select(game);
    const driver::FileDialog dialog = Press(Export);
    EXPECT_EQ(dialog.Title(), "Salvar como...");
    EXPECT_EQ(dialog.FileName(), game);
    EXPECT_EQ(dialog.FileTypes(), types);
    for (int i = 0; i < chosen; ++i) dialog.ChooseNextType();
    if (!typed.empty()) dialog.Type(typed);
    dialog.Press(IDOK);
    EXPECT_EQ(Answer(*program, IDOK), Saved);
    ExpectQuietEnd();
    if (written.ends_with(".tvk")) {
      EXPECT_TRUE(installation.Content(written).starts_with("TOLVARIS\r\nNOME=Élan\r\nNOMEDOS=ELAN\r\n"));
    } else {
      EXPECT_TRUE(installation.Content(written) == (game == "Élan" ? rom : "jogo"));
    }
  }
  ExpectKept(before);
}

TEST_F(ExportGame, WritesAPackageThatAnotherReaderTakes) {
  Start();
  Select("Élan");
  Choose(Export, Outside + "Saída.TVK");
  EXPECT_EQ(Answer(*program, IDOK), Saved);
  ExpectQuietEnd();
  MoveFileA((Outside + "Saída.TVK").c_str(), (Outside + "saida").c_str());
  const std::string read = Pacote("ler '" + HostPath(Outside + "saida") + "' '" + HostPath(Outside + "figura") + "' '" +
                                  HostPath(Outside + "rom") + "'");
  const std::string checksum = Pacote("crc '" + HostPath(installation.Directory + "Roms\\elan.ZIP") + "'");
  EXPECT_EQ(read, "Élan\nELAN\n" + checksum + checksum);
  EXPECT_EQ(installation.Content("Fora\\figura"), picture);
  EXPECT_TRUE(installation.Content("Fora\\rom") == rom);
}

TEST_F(ExportGame, AsksBeforeItReplacesAFile) {
  installation.Put("Fora\\antigo.smc", "antigo");
  Start();
  for (const int answer : {IDNO, IDCANCEL, IDYES}) {
    Select("Zebra");
    Choose(Export, Outside + "antigo.smc");
    EXPECT_EQ(Answer(*program, answer), IsThere);
    if (answer == IDYES) {
      EXPECT_EQ(Answer(*program, IDOK), Saved);
    }
    ExpectQuietEnd();
    EXPECT_EQ(FilesIn(Outside), (Files{{"antigo.smc", answer == IDYES ? "jogo" : "antigo"}, {"leia.txt", "texto"}}));
  }
  Select("Zebra");
  Press(Export).Press(IDCANCEL);
  ExpectQuietEnd();
}

TEST_F(ExportGame, SaysWhenItCannotWriteAndLeavesWhatWasThere) {
  installation.Put("Roms\\zebra.smc", std::string(1 << 20, 'z'));  // such a length has no checksum
  const Message unexpected = {"Erro", "Erro ao salvar arquivo.", {IDOK}};
  const struct {
    std::string Game, Path;
    const Message* Shown;
  } cases[] = {{"Élan", Outside + "falta\\e.zip", &CannotWrite}, {"Zebra", Outside + "z.tvk", &unexpected}};
  Start();
  for (const auto& [game, path, shown] : cases) {
    Select(game);
    Choose(Export, path);
    EXPECT_EQ(Answer(*program, IDOK), *shown) << path;
    ExpectQuietEnd();
  }
  EXPECT_EQ(FilesIn(Outside), (Files{{"leia.txt", "texto"}}));
}

TEST_F(ExportGame, ToAFullDiskLeavesItAsItWas) {
  const FloppyDisk disk(FloppyDisk::SmallDirectory);
  if (!disk.IsSmall()) GTEST_SKIP() << "no file system of 1440 KiB at " << FloppyDisk::SmallDirectory;
  const Files before = FilesIn("A:\\");
  Start();
  for (const char* path : {"A:\\cheio.zip", "A:\\cheio.tvk"}) {
    Select("Élan");
    Choose(Export, path);
    EXPECT_EQ(Answer(*program, IDOK), CannotWrite);
    ExpectQuietEnd();
    EXPECT_TRUE(FilesIn("A:\\") == before);
  }
}

}  // namespace
