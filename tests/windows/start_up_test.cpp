// The first start: the question whether to configure, and the controller help that comes once.
#include <filesystem>

#include "tests/windows/installation.h"

namespace {

const Message Configure = Of(Mensagem::SemConfiguracao);
const std::string Autoconfiguration = Home + "tolvariscfg.exe";

class FirstStart : public Installation {
 protected:
  FirstStart() {
    RemoveSettings();
    PutStandIn("tolvariscfg.exe");
  }
};

TEST_F(FirstStart, EndsWhenItIsNotOrCannotBeConfigured) {
  for (const int answer : {IDNO, IDCANCEL}) {
    Run();
    EXPECT_EQ(Answer(answer), Configure);
    EXPECT_SOON(program->HasEnded());
  }
  EXPECT_EQ(Content("tolvariscfg.exe.call"), "");
  Remove("tolvariscfg.exe");
  Run();
  EXPECT_EQ(Answer(IDOK), Of(Mensagem::SemConfigurador));
  EXPECT_SOON(program->HasEnded());
}

TEST_F(FirstStart, AsksAgainUntilConfiguredAndGoesOnWithWhatWasWritten) {
  Put("Jogos\\Outro.smc", "jogo");
  Run();
  for (const char* written : {"", "EmuCFG=\\Emulador\\zsnesw.cfg\nRomDir=\\Jogos\\\nAvisoControle=2\n"}) {
    ASSERT_SOON(FindMessage(*program));
    Put("tolvariscfg.exe.settings", std::string("EmuExe=\\Emulador\\zsnesw.exe\n") + written);
    EXPECT_EQ(Answer(IDYES), Configure);
    EXPECT_EQ(NextCall(Autoconfiguration), (Call{Autoconfiguration, "C:\\Ensaio"}));
  }
  EXPECT_EQ(Entries(MainWindow(*program).List), Texts{"Outro"});
}

class Leftovers : public Installation {};

TEST_F(Leftovers, OfAnEarlierRunGoOnceTheyAreOldAndNobodyWritesThem) {
  const std::string mark = ".0f3a99c2.novo~";
  const Texts old = {"Roms\\X.zip", "Imgs\\X.gif", "Saves\\X.srm", "Emulador\\zsnesw.cfg"};
  for (const std::string& name : old) {
    Put(name + mark, "half");
    const std::filesystem::path file = Home + name + mark;
    last_write_time(file, last_write_time(file) - std::chrono::hours(2));
  }
  Put("Roms\\novo.zip" + mark, "half");
  Put("Roms\\minha.zip.novo~", "the person's own");
  Start();
  for (const std::string& name : old) EXPECT_SOON(Content(name + mark).empty()) << name;
  EXPECT_EQ(Content("Roms\\novo.zip" + mark), "half");
  EXPECT_EQ(Content("Roms\\minha.zip.novo~"), "the person's own");
  EXPECT_EQ(Entries(window->List), Games);
}

class ControllerHelp : public Installation {};

TEST_F(ControllerHelp, ComesOnceBeforeTheMainWindow) {
  Set("AvisoControle", "");
  Run();
  EXPECT_EQ(Answer(IDOK), Of(Mensagem::GuardeOsComandos));
  EXPECT_FALSE(FindVisible(*program, "Tolvaris"));
  const Window help = FindVisible(*program, "Controle");
  const Window upKey = help.ChildAt(2040, 1560);
  EXPECT_EQ(upKey.Text(), "Seta cima");
  EXPECT_EQ(help.ChildAt(3330, 2460).Text(), "Seta direita");
  help.ChildAt(120, 120).Click();
  PressKey(VK_DOWN);
  PressKey(VK_RETURN);
  EXPECT_SOON_EQ(std::string("Home"), upKey.Text());
  EXPECT_NE(Settings()["AvisoControle"], "1");

  help.Child("&Fechar").Click();
  MainWindow(*program).CloseByUser();
  EXPECT_SOON(program->HasEnded());
  EXPECT_EQ(Settings()["AvisoControle"], "1");
  Start();
  EXPECT_FALSE(FindVisible(*program, "Controle"));
}

}  // namespace
