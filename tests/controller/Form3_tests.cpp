#include "controller/Form3.h"
#include "tests/fresh_machine.h"

namespace {

// Opens a window: what it shows of both players, and that only its first tick reminds.
void Usar(const std::string& primeiro, const std::string& segundo, void (*fechar)(Form3&)) {
  QueueModal([&](platform::Window& aberta) {
    auto& janela = static_cast<Form3&>(aberta);
    EXPECT_EQ(TextsOf(janela), primeiro);
    Choose(janela.Combo1, 1);
    EXPECT_EQ(TextsOf(janela), segundo);
    Choose(janela.Combo1, 2);
    EXPECT_EQ(janela.Combo1.Selected(), 1) << "there is no third player";
    for (int vez = 0; vez < 2; ++vez) Tick(janela.Timer1);
    fechar(janela);
    EXPECT_TRUE(janela.IsClosed());
  });
  Form3::ABRIR();
}

TEST(Form3, ShowsTheKeysOfTheChosenPlayerAndRemindsOnceAtEachOpening) {
  FreshMachine::Renew();
  const std::string teclas2 = "Home|Page Down|Delete|End|Shift d.|ENTER|U|J|I|K|O|L";
  const std::string teclas1 = "Seta direita|Seta esquerda|Seta baixo|Shift e.|CTRL e.|A|Z|S|X|D|C";
  Usar("Controle||&Fechar|Seta cima|" + teclas1, "Controle||&Fechar|" + teclas2,
       [](Form3& aberta) { Click(aberta.Command1); });
  ArquivoIdioma = "C:\\Tolvaris\\language.ini";
  PutFile(ArquivoIdioma,
          "[TOLVARIS20]\r\nControle=Pad\r\n&Fechar=&Close\r\nSeta cima=Up\r\nInformação=Note\r\n"
          "Guarde os comandos do controle. Se necessário anote-os.=Learn them.\r\n"_ansi);
  Usar("Pad||&Close|Up|" + teclas1, "Pad||&Close|" + teclas2, [](Form3&) { Form3::Descarregar(); });
  const Texts lembretes = {"Informação, OK, information: Guarde os comandos do controle. Se necessário anote-os."_ansi,
                           "Note, OK, information: Learn them."};
  EXPECT_EQ(TakeMessages(), lembretes) << "also: both windows were opened";
}

TEST(Form3, OpensAgainAfterAWindowThatCouldNotBeMade) {
  FreshMachine::Renew();
  RefuseWindows();
  Form3::ABRIR();
  Form3::Descarregar();
  RefuseWindows(false);
  bool aberta = false;
  QueueModal([&](platform::Window&) { aberta = true; });
  Form3::ABRIR();
  EXPECT_TRUE(aberta);
}

}  // namespace
