#include "tests/keeper/keeper.h"

namespace {

struct Installing : Keeper {
  Installing() { SetUp(); }

  void SetUp() override {
    Renew();
    PutDirectory("C:\\T");
    PutFile("C:\\p\\um.tvk", Package("Um Jogo", "UM"));
    PutFile("C:\\p\\dois.tvk", Package("Ação"_ansi, "dois"));
  }

  static Outcome Install(Texts more = {}) {
    Texts arguments = {"instalar", "--instalacao", "C:\\T", "C:\\p"};
    arguments.insert(arguments.end(), more.begin(), more.end());
    return RunTvk(arguments);
  }
};

TEST_F(Installing, PutsGamesWhereTheMenuListsThemAndLeavesThoseThatAreThere) {
  Files expected = Standing();
  expected[Target + "Roms\\UM.zip"] = expected[Target + "Roms\\dois.zip"] = Rom;
  expected[Target + "Imgs\\Um Jogo.gif"] = expected[Target + "Imgs\\Ação.gif"_ansi] = Picture;
  expected[Catalogue] = "|DOIS=Ação||UM=Um Jogo|"_ansi;
  const Texts twice = {"C:\\p\\um.tvk"};  // and in the directory
  EXPECT_EQ(Install(twice), (Outcome{0, "dois      Ação\nUM        Um Jogo\n", ""}));
  EXPECT_EQ(Standing(), expected);
  const std::uint64_t writes = WritesEver();
  EXPECT_EQ(Install(), (Outcome{0, "", ""}));
  EXPECT_EQ(WritesEver(), writes);
}

TEST_F(Installing, ReplacesADifferentGameOnRequestOnly) {
  const struct {
    const char *Name, *Path, *Content;  // what is there already
  } cases[] = {
      {"another ROM of that file", "Roms\\UM.zip", "other"},
      {"another game of that name", "Roms\\um jogo.smc", "other"},
      {"the same name in the catalogue", "Roms\\TRES.zip", "other"},
  };
  for (const auto& [name, path, content] : cases) {
    SCOPED_TRACE(name);
    SetUp();
    PutFile(Catalogue, "|TRES=Um Jogo|");
    PutFile(Target + path, content);
    PutFile("C:\\p\\dois.tvk", "");
    RemoveFile("C:\\p\\dois.tvk");
    const Files before = Standing();
    EXPECT_EQ(Install(),
              (Outcome{1, "", "C:\\p\\um.tvk: já há outro jogo com esse nome ou arquivo; --substituir o troca\n"}));
    EXPECT_EQ(Standing(), before);
    EXPECT_EQ(Install({"--substituir"}), (Outcome{0, "UM        Um Jogo\n", ""}));
    EXPECT_EQ(Content(Target + "Roms\\UM.zip"), Rom);
  }
}

TEST_F(Installing, AGameThatIsThereUnderAnotherNameGetsItsOwn) {
  PutFile(Catalogue, "|UM=Outro|");
  PutFile(Target + "Roms\\UM.zip", Rom);
  PutFile(Target + "Imgs\\Um Jogo.gif", Picture);
  EXPECT_EQ(Install().Output, "dois      Ação\nUM        Um Jogo\n");
}

TEST_F(Installing, TakesAwayWhatAnEarlierRunHasLeftHalfWritten) {
  const Texts halves = {Target + "Roms\\x.0f3a99c2.novo~", Target + "Imgs\\x.0f3a99c2.novo~"};
  for (const std::string& half : halves) PutFile(half, "half");
  PassTime(3601);
  EXPECT_EQ(Install().Status, 0);
  for (const std::string& half : halves) EXPECT_FALSE(Content(half)) << half;
}

TEST_F(Installing, ThePersonsOwnCollectionIsThatOfTheSettings) {
  const Texts arguments = {"instalar", "C:\\p\\um.tvk"};
  EXPECT_EQ(RunTvk(arguments),
            (Outcome{1, "", "C:\\Tolvaris\\tolvaris.exe: o Tolvaris não está ao lado do tvk.exe; use --instalacao\n"}));
  PutFile("C:\\Tolvaris\\tolvaris.exe", "MZ");
  PutText("Software\\Roms\\Tolvaris", "RomDir", "D:\\meus\\");
  AddDisk('D', 1'000'000);
  EXPECT_EQ(RunTvk(arguments).Status, 0);
  EXPECT_EQ(Content("D:\\meus\\UM.zip"), Rom);
  EXPECT_EQ(Content("C:\\Tolvaris\\Imgs\\Um Jogo.gif"), Picture);
  EXPECT_EQ(Content("C:\\Tolvaris\\tolvaris.dat"), "|UM=Um Jogo|");
}

TEST_F(Installing, WhatCannotBeInstalledIsNamedAndTheRestStillHappens) {
  PutFile("C:\\p\\mau.tvk", Package("Mau", "MAU", "123456788"));
  PutFile("C:\\p\\sinal.tvk", Package("Si|nal", "SINAL"));
  EXPECT_EQ(Install(), (Outcome{1, "dois      Ação\nUM        Um Jogo\n",
                                "C:\\p\\mau.tvk: a soma do jogo é outra: o pacote está cortado ou danificado\n"
                                "C:\\p\\sinal.tvk: não pode ser gravado na coleção\n"}));
  SetUp();
  PutFile(Catalogue, "");
  LockFile(Catalogue);
  const std::string said = "o jogo foi posto na coleção, mas o catálogo não pode ser gravado\n";
  EXPECT_EQ(Install(), (Outcome{1, "", "C:\\p\\dois.tvk: " + said + "C:\\p\\um.tvk: " + said}));
}

}  // namespace
