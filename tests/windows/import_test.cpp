// Importing games through the system's dialog.
#include <algorithm>

#include "tests/windows/installation.h"

namespace {

const Message Added = Of(Mensagem::JogoAdicionado), Replace = Of(Mensagem::JogoJaExiste);
const Message CannotRead = Of(Mensagem::ErroAoLer), Corrupted = Of(Mensagem::JogoCorrompido);

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

TEST_F(ImportGame, LeavesNothingOfWhatItCannotTake) {
  const std::string checksum = "-873187034";
  const std::string zebra = Package("Zebra", "ZEBRA", checksum, "GIF89a", "123456789");
  const size_t romStart = zebra.size() - 9;
  const std::string megabyte = Package("Zebra", "ZEBRA", checksum, "GIF89a", std::string(1 << 20, 'z'));
  const struct {
    std::string File, Content;
    const Message* Shown;
    int ToTheQuestion = 0;  // the answer, where it is asked whether to replace a game
  } cases[] = {
      {"cortado na figura.tvk", zebra.substr(0, romStart - 3), &CannotRead, IDYES},
      {"cortado antes da rom.tvk", zebra.substr(0, romStart), &CannotRead, IDYES},
      {"cortado na rom.tvk", zebra.substr(0, romStart + 4), &Corrupted, IDYES},
      {"sem soma.tvk", megabyte, &CannotRead, IDYES},
      {"rom de outro jogo.tvk", Package("Outro", "ELAN", checksum, "GIF89a", "123456789"), nullptr, IDNO},
      {"alterado.tvk", Package("Novo", "NOVO", checksum, "GIF89a", "123456788"), &Corrupted},
      {"cortado.tvk", Package("Novo", "NOVO", checksum, "GIF89a", "123456789").substr(0, 60), &CannotRead},
      {"fora.tvk", Package("..\\Novo", "NOVO", checksum, "GIF89a", "123456789"), &CannotRead},
      {"vazio.smc", "", &CannotRead},
      {"outro.txt", "texto", nullptr},
  };
  Start();
  const Files before = FilesIn(Home);
  for (const auto& [file, content, shown, toTheQuestion] : cases) {
    SCOPED_TRACE(file);
    PutFile(Outside + file, content);
    Choose(Import, Outside + file);
    if (toTheQuestion != 0) {
      EXPECT_EQ(Answer(toTheQuestion), Replace);
    }
    if (shown != nullptr) {
      EXPECT_EQ(Answer(IDOK), *shown);
    }
    ExpectQuietEnd();
    ExpectFiles(before, FilesIn(Home));
    EXPECT_EQ(Entries(window->List), Games);
  }
}

}  // namespace
