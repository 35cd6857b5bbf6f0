// Importing games through the system's dialog.
#include "tests/windows/collection.h"

namespace {

using driver::Answer;
using driver::Message;

const Message Added = {"Ok", "Jogo adicionado com sucesso.", {IDOK}};
const Message CannotRead = {"Erro", "Erro ao ler arquivo.", {IDOK}};
const Message Corrupted = {"Erro",
                           "Houve uma diferença na medição dos códigos CRC.\r\n"
                           "Essa mudança indica que o arquivo está corrompido.",
                           {IDOK}};
const Message IsThere = {"Confirmar", "O jogo a ser adiciona já existe.\r\n\r\nSubstituir ?", {IDYES, IDNO, IDCANCEL}};

class ImportGame : public Collection {
 protected:
  // The path of a package that pacote.py writes.
  std::string Package(const std::string& name, const std::string& dosName, const std::string& picture,
                      const std::string& rom) const {
    installation.Put("Fora\\figura", picture);
    installation.Put("Fora\\rom", rom);
    const std::string path = Outside + "jogo.TVK";
    EXPECT_EQ(Pacote("montar '" + HostPath(path) + "' '" + name + "' '" + dosName + "' '" +
                     HostPath(Outside + "figura") + "' '" + HostPath(Outside + "rom") + "'"),
              "");
    return path;
  }
};

TEST_F(ImportGame, CopiesRomFilesAsTheyAre) {
  Start();
  Files expected = Kept();
  const driver::FileDialog dialog = Press(Import);
  EXPECT_EQ(dialog.Title(), "Adicionar...");
  EXPECT_EQ(dialog.FileName(), "");
  EXPECT_EQ(dialog.FileTypes(), Texts{"Arquivos suportados"});
  dialog.Press(IDCANCEL);
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
    installation.Put("Fora\\" + file, rom);
    Choose(Import, Outside + file);
    EXPECT_EQ(Answer(*program, IDOK), Added);
    EXPECT_SOON(window->Pictures[Import].Enabled());
    EXPECT_SOON_EQ(selected, Selected());
    EXPECT_EQ(window->Play.Enabled(), !selected.empty());
    const Texts entries = Entries(window->List);
    EXPECT_EQ(std::count(entries.begin(), entries.end(), entry), 1) << entry;
    expected["Roms\\" + file] = rom;
    ExpectKept(expected);
  }
}

TEST_F(ImportGame, TakesAPackageOfAnotherWriterAndAsksBeforeItReplaces) {
  const std::string name = "Coração à Vista";
  const COLORREF red = RGB(220, 20, 40);
  const std::string rom = Bytes(1, (1 << 20) + 700);  // its checksum is a sum of two
  const std::string package = Package(name, "CORACAO", Gif(red), rom);
  Start();
  Files expected = Kept();
  Choose(Import, package);
  EXPECT_EQ(Answer(*program, IDOK), Added);
  EXPECT_SOON_EQ(name, Selected());
  EXPECT_SOON_EQ(red, window->Preview());
  expected["Roms\\CORACAO.zip"] = rom;
  expected["Imgs\\" + name + ".gif"] = Gif(red);
  expected["tolvaris.dat"] += "|CORACAO=" + name + "|";
  ExpectKept(expected);

  const COLORREF blue = RGB(30, 60, 230);
  const std::string newRom = Bytes(2, 5000);
  Package(name, "CORACAO", Gif(blue), newRom);
  for (const int refusal : {IDNO, IDCANCEL}) {
    Choose(Import, package);
    EXPECT_EQ(Answer(*program, refusal), IsThere);
    ExpectQuietEnd();
    ExpectKept(expected);
  }
  Choose(Import, package);
  EXPECT_EQ(Answer(*program, IDYES), IsThere);
  EXPECT_EQ(Answer(*program, IDOK), Added);
  EXPECT_SOON_EQ(blue, window->Preview());
  expected["Roms\\CORACAO.zip"] = newRom;
  expected["Imgs\\" + name + ".gif"] = Gif(blue);
  ExpectKept(expected);
}

TEST_F(ImportGame, LeavesNothingOfWhatItCannotTake) {
  const std::string whole = ContentOf(Package("Novo", "NOVO", "GIF89a", Bytes(3, 3000)));
  const std::string altered = whole.substr(0, whole.size() - 1) + static_cast<char>(whole.back() ^ 1);
  const std::string elsewhere = ContentOf(Package("..\\Novo", "NOVO", "GIF89a", Bytes(3, 3000)));
  const struct {
    std::string File, Content;
    const Message* Shown;
  } cases[] = {
      {"alterado.tvk", altered, &Corrupted},  // a bit of its ROM
      {"cortado.tvk", whole.substr(0, whole.size() - 100), &Corrupted},
      {"cabecalho.tvk", whole.substr(0, 60), &CannotRead},
      {"fora.tvk", elsewhere, &CannotRead},  // its name leaves the directory
      {"outro.tvk", "PK", &CannotRead},
      {"vazio.smc", "", &CannotRead},
      {"leia.txt", "texto", nullptr},
  };
  Start();
  const Files before = Kept();
  const Texts entries = Entries(window->List);
  for (const auto& [file, content, shown] : cases) {
    SCOPED_TRACE(file);
    installation.Put("Fora\\" + file, content);
    Choose(Import, Outside + file);
    if (shown != nullptr) {
      EXPECT_EQ(Answer(*program, IDOK), *shown);
    }
    ExpectQuietEnd();
    ExpectKept(before);
    EXPECT_EQ(Entries(window->List), entries);
  }
}

}  // namespace
