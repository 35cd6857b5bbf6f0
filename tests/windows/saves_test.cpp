// The save-file manager between the save directory and a floppy disk. Which files are listed, what is asked, and what
// becomes of a full disk is seen on the twin.
#include "tests/windows/installation.h"

namespace {

class Saves : public Installation {};

TEST_F(Saves, AreCopiedFromAFloppyDiskReplacedAndDeleted) {
  const FloppyDisk disk;
  const std::string save = Bytes(2, 300'000);
  PutFile("A:\\AGUA.ZST", save);
  Put("Saves\\AGUA.zst", "antigo");
  Put("Saves\\elan.zst", "");
  Start();
  Click(ManageSaves);
  const SaveManager manager(*program);
  const std::string entry = "Água Viva [State 0]";
  EXPECT_EQ(Entries(manager.Floppy.List), Texts{entry});
  EXPECT_EQ(Entries(manager.Computer.List), (Texts{entry, "Élan [State 0]"}));
  EXPECT_FALSE(window->Enabled());

  ClickEntry(manager.Floppy.List, entry);
  EXPECT_SOON_EQ(FloppyOffered, manager.Offered());
  EXPECT_EQ(manager.Copy.Text(), "Copiar do disquete para o computador");
  manager.Copy.Click();
  EXPECT_EQ(Answer(IDYES), Of(Mensagem::SalvamentoNoComputador));
  EXPECT_SOON(Content("Saves\\AGUA.zst") == save);
  EXPECT_SOON_EQ(std::string("Salvamentos dos jogos"), manager.Text());
  ClickEntry(manager.Floppy.List, entry);
  EXPECT_SOON_EQ(FloppyOffered, manager.Offered());
  manager.Floppy.Delete.Click();
  EXPECT_EQ(Answer(IDYES), Of(Mensagem::DeletarDoDisquete, entry));
  EXPECT_SOON_EQ(Texts(), Entries(manager.Floppy.List));
  ExpectFiles({}, FilesIn("A:\\"));
  ExpectFiles({{"AGUA.zst", save}, {"elan.zst", ""}}, FilesIn(Home + "Saves\\"));
  manager.Close.Click();
  EXPECT_SOON(window->Enabled());
  EXPECT_SOON(!manager);
}

}  // namespace
