// Handing the window over to the downloader and taking it back.
#include "tests/windows/installation.h"
#include "tests/windows/main_window.h"

namespace {

using driver::Answer;
using driver::Message;
using driver::Program;

using Texts = std::vector<std::string>;

const Texts Games = {"abelha", "Água Viva", "Corrida das Nuvens", "Élan", "Zebra"};
constexpr ULONGLONG Soon = 2500;  // milliseconds: the program looks once a second, and this machine may be busy

class Downloader : public testing::Test {
 protected:
  Downloader() {
    installation.Configure();
    installation.PutGames();
    installation.Set("LRom", "Zebra");
  }

  Installation installation;
  const std::string Path = installation.Directory + "tolvarisdownload.exe";
};

std::string Number(const driver::Window& window) {
  return std::to_string(static_cast<int>(reinterpret_cast<intptr_t>(window.Handle())));
}

TEST_F(Downloader, GivesTheWindowBackWithTheGamesThatItBrought) {
  ASSERT_TRUE(CopyFileA(DOWNLOADER_STANDIN, Path.c_str(), FALSE));
  const HANDLE wanted = CreateEventA(nullptr, TRUE, FALSE, "TolvarisDownload");
  const Program program(installation.CommandLine());
  const MainWindow main(program);
  main.Pictures[1].Click();
  EXPECT_EQ(NextCall(Path), (Call{Path + " " + Number(main.Window) + "@" + Number(main.List), "C:\\Ensaio"}));
  EXPECT_FALSE(main.Window.Enabled());
  EXPECT_EQ(main.Window.Text(), "...");
  EXPECT_EQ(SelectedEntry(main.List), -1);
  main.Window.CloseByUser();  // to no effect

  SetEvent(wanted);
  ASSERT_SOON(main.Window.Enabled());
  const ULONGLONG back = GetTickCount64();
  Texts games = Games;
  games.insert(games.begin() + 4, "Nave Nova");
  EXPECT_SOON_EQ(games, Entries(main.List));
  EXPECT_SOON(main.Play.Enabled());
  const ULONGLONG taken = GetTickCount64() - back;
  EXPECT_LT(taken, Soon);
  RecordProperty("milliseconds", static_cast<int>(taken));
  EXPECT_EQ(SelectedEntry(main.List), 5);
  EXPECT_SOON_EQ(std::string("Tolvaris"), main.Window.Text());
  CloseHandle(wanted);
}

TEST_F(Downloader, ThatIsMissingOrCannotBeStartedLeavesTheWindowUsable) {
  const Program program(installation.CommandLine());
  const MainWindow main(program);
  main.Pictures[1].Click();
  EXPECT_EQ(Answer(program, IDOK), (Message{"Erro", "O programa de download não foi encontrado.", {IDOK}}));
  EXPECT_SOON(main.Window.Enabled());
  EXPECT_EQ(Entries(main.List), Games);
  EXPECT_TRUE(main.Play.Enabled());

  // The list that is built again shows that the attempt is over.
  installation.Put("tolvarisdownload.exe", "Isto não é um programa.");
  installation.Put("Roms\\Zorro.smc", "jogo");
  main.Pictures[1].Click();
  Texts games = Games;
  games.push_back("Zorro");
  EXPECT_SOON_EQ(games, Entries(main.List));
  EXPECT_SOON(main.Window.Enabled() && main.Play.Enabled());
  EXPECT_SOON_EQ(std::string("Tolvaris"), main.Window.Text());
  EXPECT_EQ(SelectedEntry(main.List), 4);
  EXPECT_FALSE(driver::FindMessage(program));
}

}  // namespace
