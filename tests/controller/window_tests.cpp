// The help on the keys of the controller.
#include "controller/Form3.h"
#include "tests/fresh_machine.h"

namespace {

// Opens the window: what it shows of both players, and that only its first tick reminds.
void Use(const std::string& first, const std::string& second, void (*close)(Form3&)) {
  QueueModal([&](platform::Window& shown) {
    auto& window = static_cast<Form3&>(shown);
    EXPECT_EQ(TextsOf(window), first);
    Choose(window.Combo1, 1);
    EXPECT_EQ(TextsOf(window), second);
    Choose(window.Combo1, 2);
    EXPECT_EQ(window.Combo1.Selected(), 1) << "there is no third player";
    for (int tick = 0; tick < 2; ++tick) Tick(window.Timer1);
    close(window);
    EXPECT_TRUE(window.IsClosed());
  });
  Form3::ABRIR();
}

TEST(ControllerHelp, ShowsTheKeysOfTheChosenPlayerAndRemindsOnceAtEachOpening) {
  FreshMachine::Renew();
  const std::string keys2 = "Home|Page Down|Delete|End|Shift d.|ENTER|U|J|I|K|O|L";
  const std::string keys1 = "Seta direita|Seta esquerda|Seta baixo|Shift e.|CTRL e.|A|Z|S|X|D|C";
  Use("Controle||&Fechar|Seta cima|" + keys1, "Controle||&Fechar|" + keys2,
      [](Form3& window) { Click(window.Command1); });
  ArquivoIdioma = "C:\\Tolvaris\\language.ini";
  PutFile(ArquivoIdioma,
          "[TOLVARIS20]\r\nControle=Pad\r\n&Fechar=&Close\r\nSeta cima=Up\r\nInformação=Note\r\n"
          "Guarde os comandos do controle. Se necessário anote-os.=Learn them.\r\n"_ansi);
  Use("Pad||&Close|Up|" + keys1, "Pad||&Close|" + keys2, [](Form3&) { Form3::Descarregar(); });
  const Texts reminders = {Told(Mensagem::GuardeOsComandos), "Note, OK, information: Learn them."};
  EXPECT_EQ(TakeMessages(), reminders) << "also: both windows were opened";
}

TEST(ControllerHelp, OpensAgainAfterAWindowThatCouldNotBeMade) {
  FreshMachine::Renew();
  RefuseWindows();
  Form3::ABRIR();
  Form3::Descarregar();
  RefuseWindows(false);
  bool opened = false;
  QueueModal([&](platform::Window&) { opened = true; });
  Form3::ABRIR();
  EXPECT_TRUE(opened);
}

}  // namespace
