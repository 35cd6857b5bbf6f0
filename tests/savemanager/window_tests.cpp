// The save-file manager's window: its two panes, picking in them, copying to the other side and deleting.
#include "catalog/cls_DAT.h"
#include "resources/ids.h"
#include "savemanager/Form4.h"
#include "tests/fresh_machine.h"

namespace {

using namespace platform;

const std::string OnBoth = "Corrida 2 [State 0]", Old = "velho no disquete", New = "novo no computador";
const std::string Unnamed = "SEMNOME [State 2]", Source = "C:\\Saves\\SEMNOME.zs2", Target = "A:\\SEMNOME.zs2";

const std::string WriteError = Told(Mensagem::ErroAoGravar), ReadError = Told(Mensagem::ErroAoLer);
const std::string DiskFull = Told(Mensagem::DiscoCheio), OnTheFloppy = Told(Mensagem::SalvamentoNoDisquete);

// Where the save is that is on both sides, and what is asked before it is replaced or deleted.
struct Side {
  std::string Name, File, Content;
  Mensagem MayReplace, MayDelete;
  ListBox Form4::*Pane;
  ImageButton Form4::*Delete;
};
const Side Floppy = {
    "floppy",      "A:\\DOIS.zst", Old, Mensagem::SalvamentoNoDisquete, Mensagem::DeletarDoDisquete,
    &Form4::List1, &Form4::Image1,
};
const Side Computer = {
    "computer",    "C:\\Saves\\DOIS.zst", New, Mensagem::SalvamentoNoComputador, Mensagem::DeletarDoComputador,
    &Form4::List2, &Form4::Image2,
};

// Saves: one on the floppy, one on the computer, and one on both.
struct Saves : FreshMachine {
  Saves() { SetUpSaves(); }

  static void SetUpSaves() {
    Renew();
    AddDisk('A', 1457664);
    DirSaves = "C:\\Saves\\";
    PutFile("C:\\Tolvaris\\tolvaris.dat", "|UM=Jogo Um||DOIS=Corrida 2|");
    PutFile("A:\\UM.srm", "um no disquete");
    PutFile("A:\\DOIS.zst", Old);
    PutFile("C:\\Saves\\DOIS.zst", New);
    PutFile(Source, "sem nome");
    Catalogo().Fechar();
    Catalogo().Carregar();
  }

  // Opens the window with this user in front of it.
  static void OpenWith(const std::function<void(Form4&)>& user) {
    int times = 0;
    QueueModal([&](Window& window) { ++times, user(static_cast<Form4&>(window)); });
    Form4::Mostrar();
    EXPECT_EQ(times, 1);
  }

  static void Pick(ListBox& list, const std::string& text) { Choose(list, list.FindExact(text)); }

  // The direction, the selections of both lists, which delete pictures are seen, the copy button, and the file.
  static std::string StateOf(const Form4& window) {
    std::string text = "direction " + std::to_string(static_cast<int>(window.Direcao));
    text += ", left " + std::to_string(window.List1.Selected()) + ", right " + std::to_string(window.List2.Selected());
    if (window.Image1.Visible()) text += ", delete left";
    if (window.Image2.Visible()) text += ", delete right";
    if (!window.Command1.Visible()) return text;
    text += IconOf(window.Command1) == ICONE_SETA_DIREITA ? ", -> " : ", <- ";
    return text + window.Command1.ToolTip() + ": " + window.ArquivoAtual;
  }
  static bool NothingPicked(const Form4& window) { return StateOf(window) == "direction 0, left -1, right -1"; }

  // Copies the save that is on both sides over this side's one.
  static void CopyOver(const Side& side, const Side& other, Answer answer) {
    const bool yes = answer == Answer::Yes;
    SetUpSaves();
    QueueAnswer(answer);
    OpenWith([&](Form4& window) {
      Pick(window.*other.Pane, OnBoth);
      PressKey(window.*other.Pane, 13);  // does nothing
      Click(window.Command1);
      EXPECT_EQ(NothingPicked(window), yes);
      EXPECT_EQ((window.*side.Pane).Count(), 2);
      EXPECT_EQ(Focused() == &(window.*other.Pane), yes);
    });
    EXPECT_EQ(Content(side.File), yes ? other.Content : side.Content);
    EXPECT_EQ(Content(other.File), other.Content);
    EXPECT_EQ(TakeMessages(), Texts{Told(side.MayReplace)});
  }

  // Deletes this side's save of what is on both sides.
  static void DeleteFrom(const Side& side, const Side& other, Answer answer) {
    const bool yes = answer == Answer::Yes;
    SetUpSaves();
    QueueAnswer(answer);
    OpenWith([&](Form4& window) {
      Pick(window.*other.Pane, OnBoth);
      Pick(window.*side.Pane, OnBoth);
      PressKey(window.*other.Pane, 46);  // nothing is picked there any more
      Click(window.*side.Delete);
      EXPECT_EQ(NothingPicked(window), yes);
      EXPECT_EQ((window.*side.Pane).Count(), yes ? 1 : 2);
      EXPECT_EQ(Focused() == &(window.*side.Pane), yes);
    });
    EXPECT_EQ(Content(side.File), yes ? std::nullopt : std::optional(side.Content));
    EXPECT_EQ(Content(other.File), other.Content);
    EXPECT_EQ(TakeMessages(), Texts{Told(side.MayDelete, OnBoth)});
  }
};

TEST_F(Saves, AreListedUnderTheNamesOfTheirGamesAndThePickedOneDecides) {
  for (const char* const file : {"A:\\UM.ZS3", "A:\\um.zst", "A:\\UM.txt"}) PutFile(file, "x");
  PutForeignFile("A:\\Um?.srm", "x");
  KeepNoShortNames();
  PutForeignFile("A:\\Dois?.srm", "x");  // no path leads to it
  const std::string fromFloppy = ", right -1, delete left, -> Copiar do disquete para o computador: ";
  const std::tuple<ListBox Form4::*, int, std::string> steps[] = {
      {&Form4::List1, 1, "direction 1, left 1" + fromFloppy + "UM.srm"},
      {&Form4::List1, 0, "direction 1, left 0" + fromFloppy + "DOIS.zst"},
      {&Form4::List2, 1,
       "direction 2, left -1, right 1, delete right, <- Copiar do computador para o disquete: SEMNOME.zs2"},
      {&Form4::List1, 4, "direction 1, left 4" + fromFloppy + "UM_~1.srm"},
  };
  OpenWith([&](Form4& window) {
    EXPECT_EQ(EntriesOf(window.List1), "Corrida 2 [State 0]|Jogo Um|Jogo Um [State 0]|Jogo Um [State 3]|UM_~1|");
    EXPECT_EQ(EntriesOf(window.List2), "Corrida 2 [State 0]|SEMNOME [State 2]|");
    window.List2_Click();
    window.Command1_Click();
    EXPECT_TRUE(NothingPicked(window));
    EXPECT_TRUE(ShownMessages().empty()) << "nothing is picked yet";
    for (const auto& [list, index, after] : steps) {
      Choose(window.*list, index);
      EXPECT_EQ(StateOf(window), after);
    }
    Click(window.Command2);
    EXPECT_TRUE(window.IsClosed());
  });
}

// A long save: the title tells how far its copy is, events run between its pieces, and the window takes no input.
TEST_F(Saves, AreCopiedInPiecesWhateverIsClickedMeanwhile) {
  const std::string longSave(131'073, 'l');  // three pieces
  PutFile("A:\\UM.srm", longSave);
  PutFile("A:\\RESTO.srm.0f3a99c2.novo~", "of a copy that was broken off");
  PassTime(3601);
  Texts titles;
  OpenWith([&](Form4& window) {
    Pick(window.List1, "Jogo Um");
    const std::function<void()> look = [&] {
      titles.push_back(window.Caption());
      PressKey(window.List1, 46);
      Pick(window.List1, OnBoth);
      Click(window.Command1);
      Click(window.Command2);
      CloseWindow(window);
      PutFile("A:\\UM.zst", "x");
      QueueEvent(look);
    };
    QueueEvent(look);
    Click(window.Command1);
    EXPECT_EQ(titles, (Texts{"Copiando...", "Copiando... 49%", "Copiando... 99%"}));
    EXPECT_EQ(window.Caption(), "Salvamentos dos jogos");
    EXPECT_FALSE(window.IsClosed());
    EXPECT_EQ(Focused(), &window.List1) << "the copy button is hidden: the keyboard goes where the copy came from";
    EXPECT_TRUE(NothingPicked(window));
    EXPECT_EQ(EntriesOf(window.List1), "Corrida 2 [State 0]|Jogo Um|") << "the pane of the source is not filled again";
    EXPECT_EQ(EntriesOf(window.List2), "Corrida 2 [State 0]|Jogo Um|SEMNOME [State 2]|");
  });
  EXPECT_EQ(Content("C:\\Saves\\UM.srm"), longSave);
  EXPECT_EQ(Content("C:\\Saves\\DOIS.zst"), New);
  EXPECT_TRUE(ShownMessages().empty());
}

TEST_F(Saves, AreReplacedAndDeletedOnlyAfterYes) {
  const std::pair<const char*, Answer> answers[] = {
      {"yes", Answer::Yes}, {"no", Answer::No}, {"cancel", Answer::Cancel}};
  for (const auto& [name, answer] : answers) {
    for (const auto& [side, other] : {std::pair(Floppy, Computer), {Computer, Floppy}}) {
      SCOPED_TRACE(side.Name + ", " + name);
      CopyOver(side, other, answer);
      DeleteFrom(side, other, answer);
    }
  }
}

TEST_F(Saves, ThatCannotBeCopiedLeaveTheOldOneWholeAndAreToldOf) {
  using Action = std::function<void()>;
  const Action nothing = [] {}, takeOut = [] { RemoveDisk('A'); };
  const Action leftover = [] {
    PutFile("A:\\X.srm.0f3a99c2.novo~", std::string(600, 'h'));
    SetFreeSpace('A', 0);
  };
  const Action oldLeftover = [&] { leftover(), SetAge("A:\\X.srm.0f3a99c2.novo~", 3601); };
  // What happens before the copy button is pressed, and during the copy; what is said; what the floppy holds then.
  const std::tuple<const char*, Action, Action, Texts, std::optional<std::string>> cases[] = {
      {"just room", [] { SetFreeSpace('A', 512); }, nothing, {}, "sem nome"},
      {"no room", [] { SetFreeSpace('A', 0); }, nothing, {DiskFull}, {}},
      {"no disk", takeOut, nothing, {DiskFull}, {}},
      {"an empty save", [] { PutFile(Source, ""); }, nothing, {}, ""},
      {"over an empty save", [] { PutFile(Target, ""); }, nothing, {}, "sem nome"},
      {"source gone", [] { RemoveFile(Source); }, nothing, {ReadError}, {}},
      {"source cannot be read", [] { LockFile(Source); }, nothing, {ReadError}, {}},
      {"full of a broken copy", oldLeftover, nothing, {}, "sem nome"},
      {"full of what may still be a copy", leftover, nothing, {DiskFull}, {}},
      {"a stick with more than 2 GiB free", [] { AddDisk('A', std::uint64_t{3} << 30); }, nothing, {}, "sem nome"},
      {"full half-way",
       [] { PutFile(Target, "velho"); },
       [] { SetFreeSpace('A', 2); },
       {OnTheFloppy, WriteError},
       "velho"},
      {"disk taken out", nothing, takeOut, {WriteError}, {}},
  };
  for (const auto& [name, before, meanwhile, said, onFloppy] : cases) {
    SCOPED_TRACE(name);
    SetUpSaves();
    QueueAnswer(Answer::Yes);
    const bool tried = said != Texts{DiskFull};
    OpenWith([&, &before = before, &meanwhile = meanwhile, &onFloppy = onFloppy](Form4& window) {
      Pick(window.List2, Unnamed);
      before();
      QueueEvent(meanwhile);
      Click(window.Command1);
      EXPECT_EQ(NothingPicked(window), tried);
      EXPECT_EQ(window.List1.FindExact(Unnamed) >= 0, tried && onFloppy);
      EXPECT_EQ(window.Caption(), "Salvamentos dos jogos");
    });
    EXPECT_EQ(TakeMessages(), said);
    EXPECT_EQ(Content(Target), onFloppy);
  }
}

// The save of the computer that is on both sides is copied over the floppy's one. Where a pane could not be read there
// is nothing to pick, and nothing happens.
TEST_F(Saves, AreOldOrNewButWholeWhateverCallOfThePlatformFails) {
  bool offered = false;
  int warnings = 0;
  const auto copy = [&] {
    QueueAnswer(Answer::Yes);
    OpenWith([&](Form4& window) {
      Pick(window.List2, OnBoth);
      offered = window.Command1.Visible();
      Click(window.Command1);
      EXPECT_TRUE(window.List1.Enabled());
    });
  };
  const auto check = [&] {
    const Texts said = TakeMessages();
    const bool warned = !said.empty() && said.back() != OnTheFloppy;
    warnings += warned ? 1 : 0;
    EXPECT_EQ(Content("A:\\DOIS.zst"), offered && !warned ? New : Old);
    EXPECT_EQ(Content("C:\\Saves\\DOIS.zst"), New);
    EXPECT_EQ(Leftovers({"A:\\"}), Texts{});
  };
  EXPECT_GE(WithEachFault(SetUpSaves, copy, check), 3);
  EXPECT_TRUE(offered);
  EXPECT_GT(warnings, 0);
}

}  // namespace
