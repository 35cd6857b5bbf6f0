// The first start, which leads to the auto-configuration program.
#include "tests/windows/installation.h"

namespace {

class FirstStart : public Installation {};

TEST_F(FirstStart, AsksAgainUntilConfiguredAndGoesOnWithWhatWasWritten) {
  const std::string configurator = Home + "tolvariscfg.exe";
  RemoveSettings();
  PutStandIn("tolvariscfg.exe");
  Put("Jogos\\Outro.smc", "jogo");
  Run();
  for (const char* written : {"", "EmuCFG=\\Emulador\\zsnesw.cfg\nRomDir=\\Jogos\\\nAvisoControle=2\n"}) {
    ASSERT_SOON(FindMessage(*program));
    Put("tolvariscfg.exe.settings", std::string("EmuExe=\\Emulador\\zsnesw.exe\n") + written);
    EXPECT_EQ(Answer(IDYES), Of(Mensagem::SemConfiguracao));
    EXPECT_EQ(NextCall(configurator), (Call{configurator, "C:\\Ensaio"}));
  }
  EXPECT_EQ(Entries(MainWindow(*program).List), Texts{"Outro"});
}

}  // namespace
