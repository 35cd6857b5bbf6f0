// The save-file manager between the save directory and a floppy disk: a file system of its own, of 1440 KiB.
#include <memory>

#include "tests/windows/installation.h"
#include "tests/windows/main_window.h"
#include "tests/windows/save_manager.h"

namespace {

using driver::Answer;
using driver::Message;
using driver::Program;
using Texts = std::vector<std::string>;

constexpr char FloppyRoot[] = "A:\\";
constexpr char SaveDirectory[] = "C:\\Ensaio\\Saves\\";
constexpr size_t Block = 4096;  // the disk gives its space away in blocks

size_t FreeOnFloppy() {
  ULARGE_INTEGER available{};
  GetDiskFreeSpaceExA(FloppyRoot, &available, nullptr, nullptr);
  return static_cast<size_t>(available.QuadPart);
}

// Both sides as they are to be, and the window that acts on them.
class Saves : public testing::Test {
 protected:
  void SetUp() override {
    if (!disk.IsSmall()) {
      GTEST_SKIP() << "no file system of 1440 KiB at " << FloppyDisk::SmallDirectory
                   << ": this machine does not let scripts/testing.sh mount one";
    }
    for (const auto& [name, content] : FilesIn(FloppyRoot)) DeleteFileA((FloppyRoot + name).c_str());
    installation.Configure();
    installation.PutGames();
  }

  void PutFiles() const {
    for (const auto& [name, content] : floppy) installation.Put("..\\Disquete1440\\" + name, content);
    for (const auto& [name, content] : computer) installation.Put("Saves\\" + name, content);
  }

  void ExpectFiles() const {
    for (const auto& [directory, expected] :
         {std::pair{std::string(FloppyRoot), &floppy}, {SaveDirectory, &computer}}) {
      const Files found = FilesIn(directory);
      for (const auto& [name, content] : found) {
        EXPECT_TRUE(expected->count(name) == 1) << directory << name << " should not be there";
      }
      for (const auto& [name, content] : *expected) {
        EXPECT_TRUE(found.count(name) == 1 && found.at(name) == content) << directory << name << " has other bytes";
      }
    }
  }

  static void Open(const MainWindow& main) { main.Pictures[0].Click(); }

  // Picks an entry and waits until it can be copied the right way.
  static void Pick(const SaveManager& manager, bool onFloppy, const std::string& text) {
    ClickEntry(onFloppy ? manager.Floppy.List : manager.Computer.List, text);
    EXPECT_SOON_EQ(onFloppy ? FloppyOffered : ComputerOffered, manager.Offered());
    EXPECT_EQ(manager.Copy.Text(),
              onFloppy ? "Copiar do disquete para o computador" : "Copiar do computador para o disquete");
  }

  // Waits until a side has the new contents and the window has nothing left to do.
  void ExpectSoon(const SaveManager& manager, bool onFloppy, const std::string& name, const std::string& content) {
    (onFloppy ? floppy : computer)[name] = content;
    EXPECT_SOON(ContentOf((onFloppy ? FloppyRoot : SaveDirectory) + name) == content) << name;
    manager.Window.FinishPainting();
    EXPECT_EQ(manager.Offered(), NothingOffered);
    EXPECT_EQ(manager.Window.Text(), "Salvamentos dos jogos");
    ExpectFiles();
  }

  Installation installation;
  FloppyDisk disk{FloppyDisk::SmallDirectory};
  Files floppy, computer;
};

TEST_F(Saves, AreListedAndCopiedBothWays) {
  floppy = {{"agua.srm", Bytes(1, 8192)}, {"AGUA.ZST", Bytes(2, 5000)}, {"MEUJOGO.zs2", "x"}, {"leia.txt", "texto"}};
  computer = {{"zebra.srm", Bytes(3, 2048)}, {"ZEBRA.zs9", Bytes(4, 300'000)}, {"elan.zst", ""}};
  PutFiles();
  const Program program(installation.CommandLine());
  const MainWindow main(program);
  Open(main);
  const SaveManager manager(program);
  for (const char* text : {" Disquete ", " Computador ", "&Fechar"}) EXPECT_TRUE(manager.Window.Child(text)) << text;
  EXPECT_EQ(Entries(manager.Floppy.List), (Texts{"Água Viva", "Água Viva [State 0]", "MEUJOGO [State 2]"}));
  EXPECT_EQ(Entries(manager.Computer.List), (Texts{"Élan [State 0]", "Zebra", "Zebra [State 9]"}));
  EXPECT_EQ(manager.Offered(), NothingOffered);
  EXPECT_FALSE(main.Window.Enabled());

  Pick(manager, false, "Zebra");
  Pick(manager, true, "Água Viva [State 0]");
  EXPECT_EQ(SelectedEntry(manager.Computer.List), -1);
  manager.Copy.Click();
  ExpectSoon(manager, false, "AGUA.zst", floppy["AGUA.ZST"]);
  EXPECT_EQ(Entries(manager.Computer.List),
            (Texts{"Água Viva [State 0]", "Élan [State 0]", "Zebra", "Zebra [State 9]"}));

  Pick(manager, false, "Zebra [State 9]");
  manager.Copy.Click();
  ExpectSoon(manager, true, "ZEBRA.zs9", computer["ZEBRA.zs9"]);
  EXPECT_EQ(Entries(manager.Floppy.List),
            (Texts{"Água Viva", "Água Viva [State 0]", "MEUJOGO [State 2]", "Zebra [State 9]"}));

  // The file goes while its entry stands.
  Pick(manager, true, "MEUJOGO [State 2]");
  DeleteFileA("A:\\MEUJOGO.zs2");
  floppy.erase("MEUJOGO.zs2");
  manager.Copy.Click();
  EXPECT_EQ(Answer(program, IDOK), (Message{"Erro", "Erro ao gravar arquivo.", {IDOK}}));
  ExpectFiles();

  manager.Close.Click();
  EXPECT_SOON(main.Window.Enabled());
  EXPECT_SOON(!manager.Window);
}

TEST_F(Saves, AreReplacedOnYesOnly) {
  floppy = {{"ZEBRA.srm", Bytes(1, 8192)}, {"AGUA.zs1", Bytes(2, 9000)}};
  computer = {{"ZEBRA.srm", Bytes(3, 8192)}, {"AGUA.zs1", Bytes(4, 3000)}};
  PutFiles();
  const Program program(installation.CommandLine());
  const MainWindow main(program);
  Open(main);
  const SaveManager manager(program);
  const struct {
    bool FromFloppy;
    std::string Entry, File, Place;
  } copies[] = {{true, "Zebra", "ZEBRA.srm", "Computador"},
                {false, "Água Viva [State 1]", "AGUA.zs1", "Disquete (A:)"}};
  for (const auto& copy : copies) {
    const Message question = {
        "Salvamento já existente",
        "O salvamento selecionado já se encontra no " + copy.Place + ".\r\nVocê deseja substituí-lo ?",
        {IDYES, IDNO, IDCANCEL}};
    Pick(manager, copy.FromFloppy, copy.Entry);
    for (const int answer : {IDNO, IDCANCEL}) {
      manager.Copy.Click();
      EXPECT_EQ(Answer(program, answer), question);
      EXPECT_EQ(manager.Offered(), copy.FromFloppy ? FloppyOffered : ComputerOffered);
      ExpectFiles();
    }
    manager.Copy.Click();
    EXPECT_EQ(Answer(program, IDYES), question);
    ExpectSoon(manager, !copy.FromFloppy, copy.File, (copy.FromFloppy ? floppy : computer)[copy.File]);
  }
}

TEST_F(Saves, ThatDoNotFitOnTheFloppyAreRefused) {
  floppy = {{"ZEBRA.zs1", Bytes(1, 2 * Block)}, {"leia.txt", ""}};
  computer = {{"ZEBRA.zs1", Bytes(2, 5 * Block)}, {"AGUA.srm", Bytes(3, 3 * Block)}, {"AGUA.zs2", "x"}};
  PutFiles();
  floppy["leia.txt"] = std::string(FreeOnFloppy() - 3 * Block, ' ');
  PutFiles();
  ASSERT_EQ(FreeOnFloppy(), 3 * Block);
  const Program program(installation.CommandLine());
  const MainWindow main(program);
  Open(main);
  const SaveManager manager(program);
  const Message refusal = {"Disco cheio", "Não há espaço livre suficiente em disco para completar a operação.", {IDOK}};
  // It would fit only in the old one's place, which is not given up.
  Pick(manager, false, "Zebra [State 1]");
  manager.Copy.Click();
  EXPECT_EQ(Answer(program, IDOK), refusal);
  EXPECT_EQ(manager.Offered(), ComputerOffered);
  ExpectFiles();

  Pick(manager, false, "Água Viva");  // fits to the last byte
  manager.Copy.Click();
  ExpectSoon(manager, true, "AGUA.srm", computer["AGUA.srm"]);
  EXPECT_EQ(FreeOnFloppy(), 0u);
  Pick(manager, false, "Água Viva [State 2]");
  manager.Copy.Click();
  EXPECT_EQ(Answer(program, IDOK), refusal);
  ExpectFiles();
}

TEST_F(Saves, AreDeletedOnTheirSideOnYesOnly) {
  floppy = computer = {{"ZEBRA.srm", Bytes(1, 100)}, {"ZEBRA.zs3", Bytes(2, 100)}};
  PutFiles();
  const Program program(installation.CommandLine());
  const MainWindow main(program);
  Open(main);
  const SaveManager manager(program);
  for (const bool onFloppy : {true, false}) {
    const SaveManager::Pane& pane = onFloppy ? manager.Floppy : manager.Computer;
    const Message question = {"Confirmar deleção",
                              std::string("Deletar o salvamento do jogo 'Zebra [State 3]' que está no ") +
                                  (onFloppy ? "Disquete (A:) ?" : "Computador ?"),
                              {IDYES, IDNO, IDCANCEL}};
    Pick(manager, onFloppy, "Zebra [State 3]");
    EXPECT_EQ(pane.Delete.Text(), "Excluir");
    for (const int answer : {IDNO, IDCANCEL}) {
      pane.Delete.Click();
      EXPECT_EQ(Answer(program, answer), question);
      ExpectFiles();
    }
    pane.Delete.Click();
    EXPECT_EQ(Answer(program, IDYES), question);
    EXPECT_SOON_EQ(Texts{"Zebra"}, Entries(pane.List));
    EXPECT_SOON_EQ(NothingOffered, manager.Offered());
    (onFloppy ? floppy : computer).erase("ZEBRA.zs3");
    ExpectFiles();
  }
}

// Any directory does for a disk that comes and goes.
TEST(SavesWithoutDisk, AreAskedForUntilADiskIsThere) {
  const Installation installation;
  installation.Configure();
  installation.PutGames();
  installation.Put("Saves\\ZEBRA.srm", "bateria");
  const Program program(installation.CommandLine());
  const MainWindow main(program);
  const Message prompt = {"Disquete A:",
                          "Não há disquete na unidade A:\\\r\n\r\nColoque um disquete e clique em 'Repetir'.",
                          {IDRETRY, IDCANCEL}};
  main.Pictures[0].Click();
  EXPECT_EQ(Answer(program, IDRETRY), prompt);
  EXPECT_EQ(Answer(program, IDCANCEL), prompt);
  EXPECT_SOON(main.Window.Enabled());
  EXPECT_FALSE(driver::FindVisible(program, "Salvamentos dos jogos"));

  main.Pictures[0].Click();
  ASSERT_SOON(driver::FindMessage(program));
  auto disk = std::make_unique<FloppyDisk>(installation.Directory + "Disquete");
  EXPECT_EQ(Answer(program, IDRETRY), prompt);
  const SaveManager manager(program);
  EXPECT_TRUE(Entries(manager.Floppy.List).empty());
  EXPECT_TRUE(manager.Floppy.List.Enabled());

  disk.reset();
  ClickEntry(manager.Computer.List, "Zebra");
  ASSERT_SOON(manager.Copy.Visible());
  manager.Copy.Click();
  EXPECT_EQ(Answer(program, IDOK).Title, "Disco cheio");
  EXPECT_EQ(installation.Content("Saves\\ZEBRA.srm"), "bateria");
}

}  // namespace
