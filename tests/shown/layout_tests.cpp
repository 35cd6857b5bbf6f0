// Where everything stands in the windows and how it looks, before anything is translated: in tab order, twips from the
// top left corner of the client area.
#include "autoconfig/FormCfg.h"
#include "controller/Form3.h"
#include "mainwindow/Form1.h"
#include "resources/ids.h"
#include "savemanager/Form4.h"
#include "tests/fresh_machine.h"

namespace {

using platform::Bounds;
using platform::Control;
using platform::Font;
using platform::Window;
using platform::WindowStyle;

struct Row {
  const char* Text;  // its caption or its tool tip
  Bounds Place;      // a label is as large as its text needs: 0
  int Picture = 0;
  Font Letters = {};
  bool WhiteGround = false;
};

std::string TextOf(const Bounds& place) {
  return std::to_string(place.Left) + ", " + std::to_string(place.Top) + ", " + std::to_string(place.Width) + " x " +
         std::to_string(place.Height);
}

void ExpectControls(const Window& window, const std::vector<Row>& rows) {
  const std::vector<Control*> controls = ControlsOf(window);
  ASSERT_EQ(controls.size(), rows.size());
  for (std::size_t i = 0; i < rows.size(); ++i) {
    SCOPED_TRACE(testing::Message() << "control " << i << ", " << rows[i].Text);
    const Control& control = *controls[i];
    EXPECT_EQ(control.Caption() + control.ToolTip(), platform::FromUtf8(rows[i].Text));
    EXPECT_EQ(TextOf(BoundsOf(control)), TextOf(rows[i].Place));
    EXPECT_EQ(IconOf(control), rows[i].Picture);
    EXPECT_EQ(FontOf(control).TenthsOfPoint, rows[i].Letters.TenthsOfPoint);
    EXPECT_EQ(FontOf(control).Bold, rows[i].Letters.Bold);
    EXPECT_EQ(HasWhiteGround(control), rows[i].WhiteGround);
  }
}

void ExpectStyle(const Window& window, const WindowStyle& expected) {
  const WindowStyle style = StyleOf(window);
  EXPECT_EQ(style.Caption, expected.Caption);
  EXPECT_EQ(style.ClientWidth, expected.ClientWidth);
  EXPECT_EQ(style.ClientHeight, expected.ClientHeight);
  EXPECT_EQ(style.MinimizeBox, expected.MinimizeBox);
  EXPECT_EQ(style.CloseOnEscape, expected.CloseOnEscape);
  EXPECT_EQ(style.Background, expected.Background);
}

struct Layout : FreshMachine {};

TEST_F(Layout, OfTheMainWindow) {
  const Form1 window;
  ExpectStyle(window, {.Caption = "Tolvaris", .ClientWidth = 7935, .ClientHeight = 4095, .MinimizeBox = true});
  ExpectControls(window, {{"", {120, 240, 3615, 3570}},
                          {"Jogar", {3840, 3000, 3015, 855}, 0, {180, true}},
                          {"Usar disquete para salvar o jogo", {6960, 240, 615, 600}, ICONE_DISQUETE},
                          {"Ler/Gravar salvamento de jogos do disquete", {6960, 840, 615, 600}, ICONE_SALVAMENTOS},
                          {"Baixar jogos da internet", {6960, 1440, 615, 600}, ICONE_BAIXAR},
                          {"Importar jogo de...", {6960, 2040, 615, 600}, ICONE_IMPORTAR},
                          {"Exportar jogo para...", {6960, 2640, 615, 600}, ICONE_EXPORTAR},
                          {"Deletar jogo", {6960, 3240, 615, 600}, ICONE_DELETAR},
                          {"", {3840, 240, 3000, 2595}}});
  EXPECT_EQ(ResourceOf(window.Image1.ShownPicture()), FIGURA_PREVIA);
  EXPECT_EQ(IntervalOf(window.Timer1), 1000U);
}

TEST_F(Layout, OfTheSaveManager) {
  QueueModal([](const Window& window) {
    ExpectStyle(window,
                {.Caption = "Salvamentos dos jogos", .ClientWidth = 7680, .ClientHeight = 3825, .CloseOnEscape = true});
    ExpectControls(window, {{" Disquete ", {120, 120, 3255, 3015}},
                            {"", {240, 480, 3015, 2205}},
                            {"Excluir", {3060, 2760, 180, 195}, FIGURA_EXCLUIR},
                            {"", {3480, 1320, 735, 495}, ICONE_SETA_DIREITA},
                            {" Computador ", {4320, 120, 3255, 3015}},
                            {"", {4440, 480, 3015, 2205}},
                            {"Excluir", {7260, 2760, 180, 195}, FIGURA_EXCLUIR},
                            {"&Fechar", {6240, 3240, 1335, 495}}});
  });
  Form4::Mostrar();
}

TEST_F(Layout, OfTheControllerHelp) {
  constexpr Font letters = {98, true};
  QueueModal([&](const Window& window) {
    ExpectStyle(window, {.Caption = "Controle",
                         .ClientWidth = 8490,
                         .ClientHeight = 4905,
                         .CloseOnEscape = true,
                         .Background = FIGURA_CONTROLE});
    ExpectControls(window, {{"", {120, 120, 2775, 315}},
                            {"&Fechar", {6480, 4320, 1935, 495}},
                            {"Seta cima", {2040, 1560, 0, 0}, 0, letters, true},
                            {"Seta direita", {3330, 2460, 0, 0}, 0, letters, true},
                            {"Seta esquerda", {735, 2460, 0, 0}, 0, letters, true},
                            {"Seta baixo", {1965, 3360, 0, 0}, 0, letters, true},
                            {"Shift e.", {3675, 3240, 0, 0}, 0, letters, true},
                            {"CTRL e.", {4710, 3240, 0, 0}, 0, letters, true},
                            {"A", {2445, 720, 0, 0}, 0, letters, true},
                            {"Z", {6510, 720, 0, 0}, 0, letters, true},
                            {"S", {6870, 1965, 0, 0}, 0, letters, true},
                            {"X", {6315, 2370, 0, 0}, 0, letters, true},
                            {"D", {7320, 2580, 0, 0}, 0, letters, true},
                            {"C", {6780, 3000, 0, 0}, 0, letters, true}});
    EXPECT_EQ(IntervalOf(static_cast<const Form3&>(window).Timer1), 100U);
  });
  Form3::ABRIR();
}

TEST_F(Layout, OfTheConfigurator) {
  const FormCfg window;
  ExpectStyle(
      window,
      {.Caption = "Configuração do Tolvaris"_ansi, .ClientWidth = 8400, .ClientHeight = 5295, .CloseOnEscape = true});
  ExpectControls(window, {{"Emuladores encontrados:", {120, 120, 0, 0}},
                          {"", {120, 375, 8160, 1500}},
                          {"", {120, 2070, 0, 0}},
                          {"&Procurar outro...", {6360, 1965, 1920, 405}},
                          {" Configuração ", {120, 2460, 8160, 2055}},
                          {"&Gravar", {4920, 4680, 1620, 495}},
                          {"&Cancelar", {6660, 4680, 1620, 495}},
                          {"Emulador:", {240, 2805, 0, 0}},
                          {"", {2280, 2805, 0, 0}},
                          {"Arquivo de configuração:", {240, 3135, 0, 0}},
                          {"", {2280, 3135, 0, 0}},
                          {"Jogos:", {240, 3465, 0, 0}},
                          {"", {2280, 3465, 0, 0}},
                          {"Salvamentos:", {240, 3795, 0, 0}},
                          {"", {2280, 3795, 0, 0}},
                          {"Imagens:", {240, 4125, 0, 0}},
                          {"", {2280, 4125, 0, 0}}});
  EXPECT_EQ(IntervalOf(window.Timer1), 50U);
}

}  // namespace
