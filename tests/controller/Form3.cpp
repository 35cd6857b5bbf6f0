#include "controller/Form3.h"

#include <gtest/gtest.h>

#include "platform/simulated/simulated.h"
#include "platform/text.h"
#include "support/mod_Globais.h"

namespace {

using namespace platform;

std::string Titulos(const Form3& janela) {
  std::string titulos = janela.Caption() + "|" + janela.Command1.Caption();
  for (const Label& label : janela.Label1) titulos += "|" + label.Caption();
  return titulos;
}

// What a fresh window shows of both players, and that only its first tick reminds.
void UsarJanela(Form3& janela, const std::string& primeiro, const std::string& segundo) {
  EXPECT_EQ(Titulos(janela), primeiro);
  simulated::Choose(janela.Combo1, 1);
  EXPECT_EQ(Titulos(janela), segundo);
  janela.Combo1.Select(-1);
  janela.MostrarTeclas();
  EXPECT_EQ(Titulos(janela), segundo) << "nobody is chosen: nothing changes";
  simulated::Choose(janela.Combo1, 0);
  EXPECT_EQ(Titulos(janela), primeiro);
  simulated::Choose(janela.Combo1, 2);
  EXPECT_EQ(janela.Combo1.Selected(), 0) << "there is no third entry";
  for (int vez = 0; vez < 2; ++vez) simulated::Tick(janela.Timer1);
}

TEST(Form3, ShowsTheKeysOfTheChosenPlayerAndRemindsOnceAtEachOpening) {
  simulated::Reset();
  ArquivoIdioma.clear();
  simulated::QueueModal([](Window& janela) {
    UsarJanela(static_cast<Form3&>(janela),
               "Controle|&Fechar|Seta cima|Seta direita|Seta esquerda|Seta baixo|Shift e.|CTRL e.|A|Z|S|X|D|C",
               "Controle|&Fechar|Home|Page Down|Delete|End|Shift d.|ENTER|U|J|I|K|O|L");
    simulated::Click(static_cast<Form3&>(janela).Command1);
    EXPECT_TRUE(janela.IsClosed());
  });
  Form3::ABRIR();
  Form3::Descarregar();  // nothing is open

  ArquivoIdioma = "C:\\Tolvaris\\language.ini";
  simulated::PutFile(ArquivoIdioma,
                     "[TOLVARIS20]\r\nControle=Pad\r\n&Fechar=&Close\r\nSeta cima=Up\r\nInformação=Note\r\n"
                     "Guarde os comandos do controle. Se necessário anote-os.=Learn them.\r\n"_ansi);
  simulated::QueueModal([](Window& janela) {
    UsarJanela(static_cast<Form3&>(janela),
               "Pad|&Close|Up|Seta direita|Seta esquerda|Seta baixo|Shift e.|CTRL e.|A|Z|S|X|D|C",
               "Pad|&Close|Home|Page Down|Delete|End|Shift d.|ENTER|U|J|I|K|O|L");
    Form3::Descarregar();
    EXPECT_TRUE(janela.IsClosed());
  });
  Form3::ABRIR();
  const std::vector<simulated::ShownMessage> lembretes = {
      {"Guarde os comandos do controle. Se necessário anote-os."_ansi, "Informação"_ansi, Buttons::Ok,
       Icon::Information},
      {"Learn them.", "Note", Buttons::Ok, Icon::Information}};
  EXPECT_EQ(simulated::ShownMessages(), lembretes) << "also: both windows were opened";
}

}  // namespace
