// The first start: the question whether to configure, and the controller help that comes once.
#include <array>

#include "tests/windows/installation.h"
#include "tests/windows/main_window.h"

namespace {

using driver::Answer;
using driver::Message;
using driver::Program;

const Message Question = {"Configuração",
                          "O Tolvaris não foi configurado.\r\n"
                          "Clique em 'Sim' para rodar o programa de auto-configuração.",
                          {IDYES, IDNO, IDCANCEL}};

class FirstStart : public testing::Test {
 protected:
  void PutAutoconfiguration() {
    installation.PutGames();
    installation.Configure();  // the emulator is there, the settings are gone again
    RegDeleteTreeA(HKEY_CURRENT_USER, "Software\\Roms\\Tolvaris");
    CopyFileA(AUTOCONFIGURATION_STANDIN, installation.Autoconfiguration.c_str(), FALSE);
  }

  Installation installation;
};

TEST_F(FirstStart, AsksToConfigureAndEndsOnNoAndOnCancel) {
  PutAutoconfiguration();
  for (const int answer : {IDNO, IDCANCEL}) {
    const Program program(installation.CommandLine());
    EXPECT_EQ(Answer(program, answer), Question);
    EXPECT_SOON(program.HasEnded());
  }
  EXPECT_EQ(GetFileAttributesA((installation.Autoconfiguration + ".call").c_str()), INVALID_FILE_ATTRIBUTES);
}

TEST_F(FirstStart, WithoutTheAutoconfigurationProgramSaysSoAndEnds) {
  const Program program(installation.CommandLine());
  const Message refusal = {"Erro",
                           "Não foi possível configurar o Tolvaris, o programa de auto-configuração não foi "
                           "encontrado.\r\nReinstale o programa.",
                           {IDOK}};
  EXPECT_EQ(Answer(program, IDOK), refusal);
  EXPECT_SOON(program.HasEnded());
}

TEST_F(FirstStart, AsksAgainUntilConfiguredAndGoesOnWithWhatWasWritten) {
  PutAutoconfiguration();
  installation.Put("Jogos\\Outro.smc", "jogo");
  const Call call = {installation.Autoconfiguration, "C:\\Ensaio"};
  const Program program(installation.CommandLine());

  installation.Put("tolvariscfg.exe.settings", "EmuExe=\\Emulador\\zsnesw.exe\n");
  EXPECT_EQ(Answer(program, IDYES), Question);
  EXPECT_EQ(NextCall(installation.Autoconfiguration), call);

  ASSERT_SOON(driver::FindMessage(program));
  installation.Put("tolvariscfg.exe.settings", "EmuCFG=\\Emulador\\zsnesw.cfg\nRomDir=\\Jogos\\\nAvisoControle=2\n");
  EXPECT_EQ(Answer(program, IDYES), Question);
  EXPECT_EQ(NextCall(installation.Autoconfiguration), call);

  const MainWindow window(program);
  EXPECT_EQ(Entries(window.List), std::vector<std::string>{"Outro"});
  EXPECT_EQ(installation.Settings()["AvisoControle"], "2");
}

// --- The controller help.

struct Key {
  int Left, Top;
  std::string Player1, Player2;
};

const std::array<Key, 12> Keys = {{{2040, 1560, "Seta cima", "Home"},
                                   {3330, 2460, "Seta direita", "Page Down"},
                                   {735, 2460, "Seta esquerda", "Delete"},
                                   {1965, 3360, "Seta baixo", "End"},
                                   {3675, 3240, "Shift e.", "Shift d."},
                                   {4710, 3240, "CTRL e.", "ENTER"},
                                   {2445, 720, "A", "U"},
                                   {6510, 720, "Z", "J"},
                                   {6870, 1965, "S", "I"},
                                   {6315, 2370, "X", "K"},
                                   {7320, 2580, "D", "O"},
                                   {6780, 3000, "C", "L"}}};

std::vector<std::string> Labels(const driver::Window& window) {
  std::vector<std::string> labels;
  for (const Key& key : Keys) labels.push_back(window.ChildAt(key.Left, key.Top).Text());
  return labels;
}

std::vector<std::string> Expected(std::string Key::*player) {
  std::vector<std::string> labels;
  for (const Key& key : Keys) labels.push_back(key.*player);
  return labels;
}

TEST_F(FirstStart, ShowsTheControllerOnceBeforeTheMainWindow) {
  installation.Configure();
  installation.Set("AvisoControle", "");
  {
    const Program program(installation.CommandLine());
    const Message reminder = {"Informação", "Guarde os comandos do controle. Se necessário anote-os.", {IDOK}};
    EXPECT_EQ(Answer(program, IDOK), reminder);
    EXPECT_FALSE(driver::FindVisible(program, "Tolvaris"));

    const driver::Window help = driver::FindVisible(program, "Controle");
    EXPECT_SOON_EQ(Expected(&Key::Player1), Labels(help));
    const auto choose = [&](WORD direction) {
      help.ChildAt(120, 120).Click();
      driver::PressKey(direction);
      driver::PressKey(VK_RETURN);
    };
    choose(VK_DOWN);
    EXPECT_SOON_EQ(Expected(&Key::Player2), Labels(help));
    choose(VK_UP);
    EXPECT_SOON_EQ(Expected(&Key::Player1), Labels(help));
    EXPECT_NE(installation.Settings()["AvisoControle"], "1");

    help.Child("&Fechar").Click();
    const MainWindow window(program);
    EXPECT_SOON(!help);
    window.Window.CloseByUser();
    EXPECT_SOON(program.HasEnded());
  }
  EXPECT_EQ(installation.Settings()["AvisoControle"], "1");

  const Program program(installation.CommandLine());
  const MainWindow window(program);
  EXPECT_FALSE(driver::FindVisible(program, "Controle"));
}

}  // namespace
