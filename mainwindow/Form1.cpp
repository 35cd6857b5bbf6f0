#include "mainwindow/Form1.h"

#include "platform/text.h"
#include "resources/ids.h"
#include "support/mod_Traducao.h"

using platform::Font;
using platform::ListBox;

// The layout: twips, from the top left corner of the client area.
Form1::Form1()
    : Window({.Caption = TituloPrograma(), .ClientWidth = 7935, .ClientHeight = 4095, .MinimizeBox = true}),
      List1(*this, {120, 240, 3615, 3570}, ListBox::Order::Sorted),
      Command1(*this, {3840, 3000, 3015, 855}, "Jogar", Font{.TenthsOfPoint = 180, .Bold = true}),
      Check1(*this, {6960, 240, 615, 600}, ICONE_DISQUETE, "Usar disquete para salvar o jogo"),
      Command2(*this, {6960, 840, 615, 600}, ""),
      Command3(*this, {6960, 1440, 615, 600}, ""),
      Command4(*this, {6960, 2040, 615, 600}, ""),
      Command5(*this, {6960, 2640, 615, 600}, ""),
      Command6(*this, {6960, 3240, 615, 600}, ""),
      Image1(*this, {3840, 240, 3000, 2595}),
      Timer1(*this, 1000),
      Picture1(platform::LoadPictureResource(FIGURA_PREVIA)) {
  struct Figura {
    platform::Button& Botao;
    int Icone;
    const char* Dica;
    void (Form1::*Comando)();
  };
  const Figura Figuras[] = {
      {Command2, ICONE_SALVAMENTOS, "Ler/Gravar salvamento de jogos do disquete", &Form1::Command2_Click},
      {Command3, ICONE_BAIXAR, "Baixar jogos da internet", &Form1::Command3_Click},
      {Command4, ICONE_IMPORTAR, "Importar jogo de...", &Form1::Command4_Click},
      {Command5, ICONE_EXPORTAR, "Exportar jogo para...", &Form1::Command5_Click},
      {Command6, ICONE_DELETAR, "Deletar jogo", &Form1::Command6_Click},
  };
  for (const Figura& Cada : Figuras) {
    Cada.Botao.SetIcon(Cada.Icone);
    Cada.Botao.SetToolTip(Cada.Dica);
    Cada.Botao.OnClick = [this, Comando = Cada.Comando] { (this->*Comando)(); };
  }
  Image1.SetPicture(Picture1);

  OnUnload = [this] { Form_Unload(); };
  List1.OnClick = [this] { List1_Click(); };
  List1.OnDoubleClick = [this] { List1_DblClick(); };
  List1.OnKeyDown = [this](int KeyCode) { List1_KeyDown(KeyCode); };
  Command1.OnClick = [this] { Command1_Click(); };
  Timer1.OnTick = [this] { Timer1_Tick(); };
}

std::string Form1::NomeSelecionado() const { return List1.Text(List1.Selected()); }
