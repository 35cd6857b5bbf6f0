#include "tests/mainwindow/menu.h"

namespace menu {
namespace {

class HandOver : public Menu {
 protected:
  static inline const std::string Downloader = Home + "tolvarisdownload.exe";
};

TEST_F(HandOver, TheWindowWaitsForTheDownloaderAndShowsWhatItBrought) {
  PutFile(Downloader, "MZ");
  PutCatalogue("|A=Jogo A|");
  PutRom("A.smc");
  PutText(Key, "LRom", "Jogo A");
  ASSERT_TRUE(Start());
  Click(form->Command3);
  ASSERT_EQ(StartedProcesses().size(), 1U);
  EXPECT_EQ(StartedProcesses()[0].CommandLine,
            Downloader + " " + std::to_string(form->Handle()) + "@" + std::to_string(form->List1.Handle()));
  EXPECT_EQ(StartedProcesses()[0].Directory, Home);
  EXPECT_FALSE(form->Enabled());
  EXPECT_EQ(form->Caption(), "...");
  EXPECT_EQ(form->List1.Selected(), -1);

  Tick(form->Timer1);
  EXPECT_EQ(form->Caption(), "...");
  PutRom("B.smc");
  PutCatalogue("|A=Jogo A||B=Jogo B|");
  form->Enable(true);
  Tick(form->Timer1);
  EXPECT_FALSE(form->Timer1.Enabled());
  EXPECT_EQ(Names(), (Texts{"Jogo A", "Jogo B"}));
  EXPECT_EQ(form->List1.Text(form->List1.Selected()), "Jogo A");
  EXPECT_EQ(form->Caption(), "Tolvaris");
  EXPECT_EQ(States(), GameSelected);
}

TEST_F(HandOver, AMissingDownloaderIsToldAndOneThatDoesNotStartGivesTheWindowBack) {
  PutRom("A.smc");
  ASSERT_TRUE(Start());
  Choose(form->List1, 0);
  Click(form->Command3);
  EXPECT_EQ(Messages(), Texts{"Erro: O programa de download não foi encontrado."_ansi});
  EXPECT_EQ(States(), GameSelected);

  PutFile(Downloader, "no program");
  RefuseToStart(Downloader);
  Click(form->Command3);
  EXPECT_TRUE(form->Enabled());
  EXPECT_FALSE(form->Timer1.Enabled());
  EXPECT_EQ(form->Caption(), "Tolvaris");
  EXPECT_EQ(States(), NothingSelected);
  EXPECT_EQ(Names(), Texts{"A"});
}

TEST_F(HandOver, TheSaveManagerOpensOnceADiskIsReady) {
  ASSERT_TRUE(Start());
  int opened = 0;
  const auto open = [&](platform::Window& window) {
    ++opened;
    EXPECT_EQ(window.Caption(), "Salvamentos dos jogos");
  };
  QueueModal(open);
  QueueAnswer(Answer::Retry);
  QueueAnswer(Answer::Cancel);
  Click(form->Command2);
  EXPECT_EQ(opened, 0);
  EXPECT_EQ(Messages().size(), 2U);

  QueueAnswer(Answer::Retry, [] { AddDisk('A', 1457664); });
  Click(form->Command2);
  EXPECT_EQ(opened, 1);
  QueueModal(open);
  Click(form->Command2);
  EXPECT_EQ(opened, 2);
  EXPECT_EQ(Messages().size(), 1U);
}

}  // namespace
}  // namespace menu
