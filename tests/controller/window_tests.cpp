// The help on the keys of the controller.
#include "controller/Form3.h"
#include "tests/fresh_machine.h"

namespace {

// Opens the window: what it shows of the second player, and that only its first tick reminds.
void Use(void (*close)(Form3&)) {
  QueueModal([&](platform::Window& shown) {
    auto& window = static_cast<Form3&>(shown);
    Choose(window.Combo1, 1);
    EXPECT_EQ(TextsOf(window), "Controle||&Fechar|Home|Page Down|Delete|End|Shift d.|ENTER|U|J|I|K|O|L");
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
  Use([](Form3& window) { Click(window.Command1); });
  Use([](Form3&) { Form3::Descarregar(); });
  EXPECT_EQ(TakeMessages(), Texts(2, Told(Mensagem::GuardeOsComandos))) << "also: both windows were opened";
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
