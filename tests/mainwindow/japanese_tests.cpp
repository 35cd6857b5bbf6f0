// Games with Japanese names, in code page 932: a character may have two bytes, and the second may equal "\\" or "|".
#include "tests/mainwindow/menu.h"

namespace {

const std::string So = "\x83\x5C", Po = "\x83\x7C";  // so, whose second byte is "\", and po, whose is "|"

struct Japanese : Menu {
  Japanese() {
    SetCodePage(932);
    for (const char* directory : {"RomDir", "SaveDir", "ImgDir"}) PutText(Key, directory, Mine + directory + "\\");
  }

  const std::string Mine = "C:\\" + So + "\\";  // not there yet
};

TEST_F(Japanese, GamesComeInArePlayedAndGoOutUnderTheirWholeNames) {
  PutFile("C:\\Fora\\" + So + ".zip", Rom);
  PutFile("C:\\Fora\\x.tvk", Package("A" + Po + So, "PONTO"));
  ASSERT_TRUE(Start());
  for (const std::string& file : {So + ".zip", "x.tvk"s}) {
    ChooseFile(form->Command4, "C:\\Fora\\" + file);
    EXPECT_EQ(TakeMessages(), Texts{Told(Mensagem::JogoAdicionado)}) << file;
  }
  EXPECT_EQ(EntriesOf(form->List1), So + "|A" + Po + So + "|");  // this machine orders letters as code page 1252 does
  EXPECT_EQ(Content(Mine + "RomDir\\" + So + ".zip"), Rom);
  EXPECT_EQ(Content(Mine + "ImgDir\\A" + Po + So + ".gif"), "figura");

  Click(form->Command1);
  EXPECT_TRUE(StartedProcesses().back().CommandLine.ends_with("\\PONTO.zip")) << StartedProcesses().back().CommandLine;
  ChooseFile(form->Command5, "C:\\y.tvk");
  EXPECT_EQ(TakeMessages(), Texts{Told(Mensagem::ArquivoSalvo)});
  EXPECT_TRUE(ShownFileDialogs().back().File.starts_with("A" + Po + So + "  "));
  EXPECT_EQ(Content("C:\\y.tvk"), Content("C:\\Fora\\x.tvk"));
}

TEST_F(Japanese, TranslationsKeepTheirCharactersAndLoseTheirBars) {
  PutFile(Home + "language.ini", "[TOLVARIS20]\r\nJogar=|" + Po + " |\r\nDeletar jogo=" + Po + "|" + Po + "\r\n");
  ASSERT_TRUE(Start());
  EXPECT_EQ(form->Command1.Caption(), Po + " ");
  EXPECT_EQ(form->Command6.ToolTip(), Po + Po);
}

TEST_F(Japanese, TheProgramsOwnDirectoryMayEndWithSuchACharacter) {
  SetProgramDirectory("C:\\" + So);
  PutFile("C:\\" + So + "\\tolvaris.dat", "|A=B|");
  ASSERT_TRUE(Start());
  EXPECT_EQ(DirPrograma, "C:\\" + So + "\\");
}

}  // namespace
