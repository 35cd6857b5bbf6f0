#include "platform/keys.h"
#include "tests/mainwindow/menu.h"

namespace {

const std::string Added = Told(Mensagem::JogoAdicionado), Saved = Told(Mensagem::ArquivoSalvo);
const std::string ReadError = Told(Mensagem::ErroAoLer), WriteError = Told(Mensagem::ErroAoGravar);
const std::string ExportError = Told(Mensagem::ErroAoSalvar), Corrupt = Told(Mensagem::JogoCorrompido);
const std::string ReplaceGame = Told(Mensagem::JogoJaExiste), ReplaceFile = Told(Mensagem::ArquivoJaExiste);
const std::string WithoutChecksum(1048576, 'x');  // a length that has none

// What happens before the command is given.
using Before = std::function<void()>;
const Before Nothing = [] {}, Yes = [] { QueueAnswer(Answer::Yes); }, No = [] { QueueAnswer(Answer::No); };

Before Locked(const std::string& path) {
  return [path] { LockFile(path); };
}

// As if the disk held something else than what was written beside a file.
void AlterOnceWritten(const std::string& path) {
  for (const std::string& each : AllFiles()) {
    if (each.starts_with(path + ".")) return PutFile(each, "other");
  }
  QueueEvent([path] { AlterOnceWritten(path); });
}

Before Room(std::uint64_t bytes) {  // and the user says yes
  return [bytes] {
    Yes();
    SetFreeSpace('C', bytes);
  };
}

struct Import : Menu {};

TEST_F(Import, TakesAFileWholeOrLeavesItOutAndSaysSo) {
  const Before altered = [] { AlterOnceWritten(Roms + "NOVO.zip"); };
  const Before alteredOld = [] { Yes(), AlterOnceWritten(Roms + "SUPERJOG.zip"); };
  const Before inPlace = [] { Yes(), TakeNoNewFiles(Roms), TakeNoNewFiles(Imgs); };
  const std::string whole = Package("Super Jogo", "SUPERJOG", "new");  // its picture begins at byte 104
  const Files package = {{Roms + "ação.zip"_ansi, Rom},
                         {Imgs + "Ação=Jogo.gif"_ansi, "figura"},
                         {Home + "tolvaris.dat", "|SUPERJOG=Super Jogo||ULTIMO=Sem figura||AÇÃO=Ação=Jogo|"_ansi}};
  const Files replaced = {{Roms + "SUPERJOG.zip", Rom}, {Imgs + "Super Jogo.gif", "new"}};
  const Files renamed = {{Roms + "SUPERJOG.zip", Rom},
                         {Imgs + "Outro.gif", "new"},
                         {Home + "tolvaris.dat", "|SUPERJOG=Super Jogo||ULTIMO=Sem figura||SUPERJOG=Outro|"}};
  const std::string fresh = Package("Novo", "NOVO"), other = Package("Outro", "SUPERJOG", "new");
  const std::string anotherCase = Package("SUPER jogo", "SUPERJOG", "new");
  const std::string wrongSum = Package("Super Jogo", "SUPERJOG", "new", "987654321");
  const struct {
    const char* Name;
    std::string Path, Content;
    Texts Shown;
    Before Happens = Nothing;
    std::string Selected = {};
    Files New = {};  // what stands there afterwards, beside what stood there
  } cases[] = {
      {"a ROM", "D:\\NOVO.SMC", "rom", {Added}, Nothing, "NOVO", {{Roms + "NOVO.SMC", "rom"}}},
      {"two points in the name", "D:\\a.b.zip", "zip", {Added}, Nothing, "a.b", {{Roms + "a.b.zip", "zip"}}},
      {"a name that the list does not show", "D:\\x.gzip", "zip", {Added}, Nothing, "", {{Roms + "x.gzip", "zip"}}},
      {"a package", "D:\\p.tVk", Package("Ação=Jogo"_ansi, "ação"_ansi), {Added}, Nothing, "Ação=Jogo"_ansi, package},
      {"cancelled", "", "", {}},
      {"an empty file", "D:\\vazio.zip", "", {ReadError}},
      {"a locked file", "D:\\preso.zip", "x", {ReadError}, Locked("D:\\preso.zip")},
      {"no extension", "D:\\semponto", "x", {ReadError}},
      {"another extension", "D:\\x.txt", "x", {}},
      {"no package", "D:\\p.tvk", "no package", {ReadError}},
      {"another checksum", "D:\\p.tvk", Package("Novo", "NOVO", "figura", "123456788"), {Corrupt}},
      {"cut in the ROM", "D:\\p.tvk", fresh.substr(0, 105), {Corrupt}},
      {"the disk holds something else", "D:\\p.tvk", fresh, {Corrupt}, altered},
      {"the disk holds something else, over a game", "D:\\p.tvk", whole, {ReplaceGame, Corrupt}, alteredOld},
      {"cut in the ROM, over a game", "D:\\p.tvk", whole.substr(0, 115), {ReplaceGame, Corrupt}, Yes},
      {"cut behind the picture, over a game", "D:\\p.tvk", whole.substr(0, 107), {ReplaceGame, ReadError}, Yes},
      {"cut in the picture, over a game", "D:\\p.tvk", whole.substr(0, 105), {ReplaceGame, ReadError}, Yes},
      {"only the header, over a game", "D:\\p.tvk", whole.substr(0, 104), {ReplaceGame, ReadError}, Yes},
      {"no name for a picture: nor for the ROM", "D:\\p.tvk", Package("No|vo", "NOVO"), {ReadError}},
      {"no name for a ROM", "D:\\p.tvk", Package("Novo", "NO|VO"), {ReadError}},
      {"a ROM without a checksum", "D:\\p.tvk", Package("Longo", "LONGO", "figura", WithoutChecksum), {ReadError}},
      {"no room, over a ROM", "D:\\SUPERJOG.zip", "longer than it was", {WriteError}, Room(3)},
      {"no room", "D:\\novo.smc", "rom of a new game", {WriteError}, Room(3)},
      {"room for the picture only", "D:\\p.tvk", whole, {ReplaceGame, ReadError}, Room(5)},
      {"in place", "D:\\p.tvk", whole, {ReplaceGame, Added}, inPlace, "Super Jogo", replaced},
      {"in place, cut behind the picture", "D:\\p.tvk", whole.substr(0, 107), {ReplaceGame, ReadError}, inPlace},
      {"another game of that ROM: no", "D:\\p.tvk", other, {ReplaceGame}, No},
      {"another game of that ROM: yes", "D:\\p.tvk", other, {ReplaceGame, Added}, Yes, "", renamed},
      {"over a game in another letter case: no", "D:\\p.tvk", anotherCase, {ReplaceGame}, No},
      {"another checksum, over a game", "D:\\p.tvk", wrongSum, {ReplaceGame, Corrupt}, Yes},
      {"over a game: yes", "D:\\p.tvk", whole, {ReplaceGame, Added}, Yes, "Super Jogo", replaced},
  };
  for (const auto& each : cases) {
    SCOPED_TRACE(each.Name);
    SetUpMachine();
    AddDisk('D', 100'000'000);
    PutFile(Roms + "SUPERJOG.zip", "old");
    ASSERT_TRUE(Start());
    if (!each.Path.empty()) PutFile(each.Path, each.Content);
    Files expected = Standing();
    for (const auto& [path, content] : each.New) expected[path] = content;
    each.Happens();
    QueueEvent([this] { EXPECT_EQ(States(), Busy); });
    ChooseFile(form->Command4, each.Path);
    EXPECT_EQ(TakeMessages(), each.Shown);
    EXPECT_TRUE(Standing() == expected);
    EXPECT_EQ(Selected(), each.Selected);
    EXPECT_EQ(States(), each.Selected.empty() ? NothingSelected : GameSelected);
    const auto& asked = ShownFileDialogs().back();
    EXPECT_EQ(asked.Title + asked.Filter, "Adicionar...Arquivos suportados\0*.zip;*.smc;*.tvk\0"s);
  }
}

// Only another ROM is asked about.
TEST_F(Import, OfAPackageWithTheRomThatIsThereAlreadyAsksNothing) {
  PutFile(Roms + "UM.zip", Rom);
  PutFile("C:\\novo.tvk", Package("Novo", "UM"));
  ASSERT_TRUE(Start());
  ChooseFile(form->Command4, "C:\\novo.tvk");
  EXPECT_EQ(TakeMessages(), Texts{Added});
  EXPECT_EQ(Selected(), "Novo");
}

struct Export : Menu {};

// A package is offered only for a game of the catalogue that has a picture, but it can be written of each.
TEST_F(Export, OffersTheTypesOfAGameAndSavesItWholeOrNotAtAll) {
  const std::string both = "tvk;zipArquivo Tolvaris (*.tvk)\0*.tvk\0Arquivo ZIP (*.zip)\0*.zip\0"s;
  const std::string smc = "smcArquivo SMC (*.smc)\0*.smc\0"s;
  const std::string rom = Roms + "SUPERJOG.zip", picture = Imgs + "Super Jogo.gif";
  const Before putLongRom = [&] { PutFile(rom, WithoutChecksum); };
  const struct {
    const char* Name;
    std::string Game, Offered;  // the extension and the types
    std::string Target;
    Texts Shown;
    std::optional<std::string> Left;  // content of the target afterwards
    Before Happens = Nothing;
  } cases[] = {
      {"a ROM", "Super Jogo", both, "C:\\x.zip", {Saved}, Rom},
      {"a package", "Super Jogo", both, "C:\\x.TvK", {Saved}, Package("Super Jogo", "SUPERJOG")},
      {"a package without a picture", "Sem figura", smc, "C:\\x.tvk", {Saved}, Package("Sem figura", "ULTIMO", "")},
      {"a package without a DOS name", "Nome comprido", smc, "C:\\x.tvk", {Saved}, Package("Nome comprido", "")},
      {"no extension", "Nome comprido", smc, "C:\\x", {Saved}, Rom},
      {"cancelled", "Super Jogo", both, "", {}, {}},
      {"over a file: no", "Super Jogo", both, "C:\\old.zip", {ReplaceFile}, "old", No},
      {"over a file: yes", "Super Jogo", both, "C:\\old.zip", {ReplaceFile, Saved}, Rom, Yes},
      {"to a missing disk", "Super Jogo", both, "Q:\\x.zip", {WriteError}, {}},
      {"no room for a ROM", "Super Jogo", both, "C:\\x.zip", {WriteError}, {}, Room(3)},
      {"no room for a package over a file",
       "Super Jogo",
       both,
       "C:\\old.tvk",
       {ReplaceFile, WriteError},
       "old",
       Room(3)},
      {"a locked ROM", "Super Jogo", both, "C:\\x.zip", {ReadError}, {}, Locked(rom)},
      {"a locked ROM, as a package", "Super Jogo", both, "C:\\x.tvk", {ExportError}, {}, Locked(rom)},
      {"a locked picture", "Super Jogo", both, "C:\\x.tvk", {ExportError}, {}, Locked(picture)},
      {"a ROM without a checksum", "Super Jogo", both, "C:\\x.tvk", {ExportError}, {}, putLongRom},
  };
  for (const auto& each : cases) {
    SCOPED_TRACE(each.Name);
    SetUpMachine();
    for (const char* old : {"C:\\old.zip", "C:\\old.tvk"}) PutFile(old, "old");
    StartAndPick(each.Game);
    each.Happens();
    Files expected = Standing();
    if (each.Left) expected[each.Target] = each.Left;
    QueueEvent([this] {
      EXPECT_EQ(States(), Busy);
      DoubleClick(form->List1);
      PressKey(form->List1, platform::KeyEnter);
    });
    ChooseFile(form->Command5, each.Target);
    EXPECT_TRUE(StartedProcesses().empty()) << "by what was done with the list meanwhile";
    EXPECT_EQ(TakeMessages(), each.Shown);
    EXPECT_TRUE(Standing() == expected);
    EXPECT_EQ(States(), NothingSelected);  // the game commands wait for the next click
    const auto& asked = ShownFileDialogs().back();
    EXPECT_EQ(asked.DefaultExtension + asked.Filter, each.Offered);
    EXPECT_EQ(asked.Title + asked.File.substr(0, each.Game.size() + 1), "Salvar como..." + each.Game + " ");
  }
}

// Windows does not open the dialog on another one.
TEST_F(Export, OffersTheNameWithoutWhatNoFileNameCanHold) {
  const std::string name = "Mundo 2: A <volta>, \"parte\" 3/4\\5 *?\t";
  PutFile(Home + "tolvaris.dat", "|SUPERJOG=" + name + "|");
  StartAndPick(name);
  ChooseFile(form->Command5, "C:\\novo.zip");
  EXPECT_EQ(TakeMessages(), Texts{Saved});
  EXPECT_TRUE(ShownFileDialogs().back().File.starts_with("Mundo 2 A volta, parte 345    "));
}

TEST_F(Export, TakesAwayWhatAnEarlierOneToThatDirectoryHasLeftHalfWritten) {
  PutFile("C:\\x.zip.0f3a99c2.novo~", "half");
  PutFile("C:\\Outros\\x.zip.0f3a99c2.novo~", "half");
  PassTime(3601);
  StartAndPick("Super Jogo");
  ChooseFile(form->Command5, "C:\\novo.zip");
  EXPECT_EQ(Content("C:\\novo.zip"), Rom);
  EXPECT_FALSE(Content("C:\\x.zip.0f3a99c2.novo~"));
  EXPECT_TRUE(Content("C:\\Outros\\x.zip.0f3a99c2.novo~"));
}

}  // namespace
