// The save-file manager between the save directory and a floppy disk: a file system of its own, of 1440 KiB.
#include "tests/windows/installation.h"

namespace {

constexpr size_t Block = 4096;  // the disk gives its space away in blocks
const Message DiskFull = Of(Mensagem::DiscoCheio);

size_t FreeOnFloppy() {
  ULARGE_INTEGER available{};
  GetDiskFreeSpaceExA("A:\\", &available, nullptr, nullptr);
  return static_cast<size_t>(available.QuadPart);
}

// A side of the manager, and the files that it is to have.
struct Side {
  std::string Directory, CopyFromHere;
  std::vector<bool> Offered;  // for an entry of its own
  Files Expected;
};

// Both sides, and the window that acts on them.
class Saves : public Installation {
 protected:
  void SetUp() override {
    if (!disk.IsSmall()) GTEST_SKIP() << "drive A: has more than 1440 KiB: no file system could be mounted for it";
  }

  void OpenWith(const Files& onFloppy, const Files& onComputer) {
    floppy.Expected = onFloppy;
    computer.Expected = onComputer;
    for (const Side* side : {&floppy, &computer}) {
      for (const auto& [name, content] : side->Expected) PutFile(side->Directory + name, content);
    }
    Start();
    Click(ManageSaves);
    manager.emplace(*program);
  }

  const SaveManager::Pane& PaneOf(const Side& side) const {
    return &side == &floppy ? manager->Floppy : manager->Computer;
  }

  // Picks an entry and waits until it can be copied the right way.
  void Pick(const Side& side, const std::string& text) const {
    ClickEntry(PaneOf(side).List, text);
    EXPECT_SOON_EQ(side.Offered, manager->Offered());
    EXPECT_EQ(manager->Copy.Text(), side.CopyFromHere);
  }

  void ExpectBothSides() const {
    for (const Side* side : {&floppy, &computer}) ExpectFiles(side->Expected, FilesIn(side->Directory));
  }

  // Waits until a side has a file of the other and the window has nothing left to do.
  void ExpectCopied(Side& to, const std::string& name, const std::string& content) {
    to.Expected[name] = content;
    EXPECT_SOON(ContentOf(to.Directory + name) == content) << name;
    manager->FinishPainting();
    EXPECT_EQ(manager->Offered(), NothingOffered);
    EXPECT_EQ(manager->Text(), "Salvamentos dos jogos");
    ExpectBothSides();
  }

  const FloppyDisk disk;
  Side floppy = {"A:\\", "Copiar do disquete para o computador", FloppyOffered, {}};
  Side computer = {Home + "Saves\\", "Copiar do computador para o disquete", ComputerOffered, {}};
  std::optional<SaveManager> manager;
};

// Which files are listed, and what is asked, is seen on the twin.
TEST_F(Saves, AreCopiedFromAFloppyDiskReplacedAndDeleted) {
  OpenWith({{"AGUA.ZST", Bytes(2, 300'000)}}, {{"AGUA.zst", "antigo"}, {"elan.zst", ""}});
  const std::string entry = "Água Viva [State 0]";
  EXPECT_EQ(Entries(manager->Floppy.List), Texts{entry});
  EXPECT_EQ(Entries(manager->Computer.List), (Texts{entry, "Élan [State 0]"}));
  EXPECT_FALSE(window->Enabled());

  Pick(floppy, entry);
  manager->Copy.Click();
  EXPECT_EQ(Answer(IDYES), Of(Mensagem::SalvamentoNoComputador));
  ExpectCopied(computer, "AGUA.zst", Bytes(2, 300'000));
  Pick(floppy, entry);
  manager->Floppy.Delete.Click();
  EXPECT_EQ(Answer(IDYES), Of(Mensagem::DeletarDoDisquete, entry));
  EXPECT_SOON_EQ(Texts(), Entries(manager->Floppy.List));
  floppy.Expected.clear();
  ExpectBothSides();
  manager->Close.Click();
  EXPECT_SOON(window->Enabled());
  EXPECT_SOON(!*manager);
}

TEST_F(Saves, ThatDoNotFitOnTheFloppyAreRefused) {
  const size_t fill = FreeOnFloppy() - 5 * Block;
  OpenWith({{"ZEBRA.zs1", Bytes(1, 2 * Block)}, {"leia.txt", std::string(fill, ' ')}},
           {{"ZEBRA.zs1", Bytes(2, 5 * Block)}, {"AGUA.srm", Bytes(3, 3 * Block)}, {"AGUA.zs2", "x"}});
  ASSERT_EQ(FreeOnFloppy(), 3 * Block);
  // It would fit only in the old one's place, which is not given up.
  Pick(computer, "Zebra [State 1]");
  manager->Copy.Click();
  EXPECT_EQ(Answer(IDOK), DiskFull);
  EXPECT_EQ(manager->Offered(), ComputerOffered);
  ExpectBothSides();

  Pick(computer, "Água Viva [State 2]");
  {
    const HeldFile held(computer.Directory + "AGUA.zs2");
    manager->Copy.Click();
    EXPECT_EQ(Answer(IDOK), Of(Mensagem::ErroAoLer));
  }
  EXPECT_SOON_EQ(NothingOffered, manager->Offered());
  ExpectBothSides();

  Pick(computer, "Água Viva");  // fits to the last byte
  manager->Copy.Click();
  ExpectCopied(floppy, "AGUA.srm", Bytes(3, 3 * Block));
  EXPECT_EQ(FreeOnFloppy(), 0u);
  Pick(computer, "Água Viva [State 2]");
  manager->Copy.Click();
  EXPECT_EQ(Answer(IDOK), DiskFull);
  ExpectBothSides();
}

}  // namespace
