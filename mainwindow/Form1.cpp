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
      Command2(*this, {6960, 840, 615, 600}, ICONE_SALVAMENTOS, "Ler/Gravar salvamento de jogos do disquete"),
      Command3(*this, {6960, 1440, 615, 600}, ICONE_BAIXAR, "Baixar jogos da internet"),
      Command4(*this, {6960, 2040, 615, 600}, ICONE_IMPORTAR, "Importar jogo de..."),
      Command5(*this, {6960, 2640, 615, 600}, ICONE_EXPORTAR, "Exportar jogo para..."),
      Command6(*this, {6960, 3240, 615, 600}, ICONE_DELETAR, "Deletar jogo"),
      Image1(*this, {3840, 240, 3000, 2595}),
      Timer1(*this, 1000),
      Picture1(platform::LoadPictureResource(FIGURA_PREVIA)) {
  Image1.SetPicture(Picture1);

  OnHelp = [this] { Form_Help(); };
  OnUnload = [this] { Form_Unload(); };
  List1.OnClick = [this] { List1_Click(); };
  List1.OnDoubleClick = [this] { List1_DblClick(); };
  List1.OnKeyDown = [this](int KeyCode) { List1_KeyDown(KeyCode); };
  Command1.OnClick = [this] { Command1_Click(); };
  Command2.OnClick = [this] { Command2_Click(); };
  Command3.OnClick = [this] { Command3_Click(); };
  Command4.OnClick = [this] { Command4_Click(); };
  Command5.OnClick = [this] { Command5_Click(); };
  Command6.OnClick = [this] { Command6_Click(); };
  Timer1.OnTick = [this] { Timer1_Tick(); };
}

std::string Form1::NomeSelecionado() const { return List1.Text(List1.Selected()); }
