#include "savemanager/Form4.h"

#include "platform/events.h"
#include "resources/ids.h"
#include "support/mod_Globais.h"
#include "support/mod_Traducao.h"

namespace {

constexpr platform::Bounds LugarFrame1 = {120, 120, 3255, 3015};
constexpr platform::Bounds LugarFrame2 = {4320, 120, 3255, 3015};
constexpr platform::Bounds LugarLista = {120, 360, 3015, 2205};    // in its frame
constexpr platform::Bounds LugarLixeira = {2940, 2640, 180, 195};  // in its frame
constexpr platform::Bounds LugarCommand1 = {3480, 1320, 735, 495};
constexpr platform::Bounds LugarCommand2 = {6240, 3240, 1335, 495};

platform::WindowStyle Janela() {
  return {.Caption = "Salvamentos dos jogos", .ClientWidth = 7680, .ClientHeight = 3825, .CloseOnEscape = true};
}

void TraduzirTitulo(auto& Controle) { Controle.SetCaption(Traduzir(Controle.Caption())); }

void TraduzirDica(platform::Control& Controle) { Controle.SetToolTip(Traduzir(Controle.ToolTip())); }

}  // namespace

Form4::Form4()
    : Window(Janela()),
      Frame1(*this, LugarFrame1, " Disquete "),
      List1(Frame1, LugarLista, platform::ListBox::Order::Sorted),
      Image1(Frame1, LugarLixeira, FIGURA_EXCLUIR, "Excluir"),
      Command1(*this, LugarCommand1, ICONE_SETA_DIREITA, ""),
      Frame2(*this, LugarFrame2, " Computador "),
      List2(Frame2, LugarLista, platform::ListBox::Order::Sorted),
      Image2(Frame2, LugarLixeira, FIGURA_EXCLUIR, "Excluir"),
      Command2(*this, LugarCommand2, "&Fechar"),
      disquete_{.Lado = Origem::Disquete,
                .Diretorio = Diretorios[0],
                .Lista = List1,
                .Lixeira = Image1,
                .Seta = ICONE_SETA_DIREITA,
                .Copiar = Texto::CopiarParaComputador,
                .JaExiste = Mensagem::SalvamentoNoDisquete,
                .Deletar = Mensagem::DeletarDoDisquete},
      computador_{.Lado = Origem::Computador,
                  .Diretorio = Diretorios[1],
                  .Lista = List2,
                  .Lixeira = Image2,
                  .Seta = ICONE_SETA_ESQUERDA,
                  .Copiar = Texto::CopiarParaDisquete,
                  .JaExiste = Mensagem::SalvamentoNoComputador,
                  .Deletar = Mensagem::DeletarDoComputador} {
  List1.OnClick = [this] { List1_Click(); };
  List2.OnClick = [this] { List2_Click(); };
  List1.OnKeyDown = [this](int KeyCode) { List1_KeyDown(KeyCode); };
  List2.OnKeyDown = [this](int KeyCode) { List2_KeyDown(KeyCode); };
  Image1.OnClick = [this] { Image1_Click(); };
  Image2.OnClick = [this] { Image2_Click(); };
  Command1.OnClick = [this] { Command1_Click(); };
  Command2.OnClick = [this] { Command2_Click(); };
}

void Form4::Mostrar() {
  Form4 janela;
  janela.Form_Load();
  janela.ShowModal();
}

void Form4::Form_Load() {
  TraduzirTitulo(static_cast<Window&>(*this));
  TraduzirTitulo(Frame1);
  TraduzirTitulo(Frame2);
  TraduzirTitulo(Command2);
  TraduzirDica(Image1);
  TraduzirDica(Image2);
  List1.SetAccessibleName(Traduzir(Texto::NomeDosSalvamentosNoDisquete));
  List2.SetAccessibleName(Traduzir(Texto::NomeDosSalvamentosNoComputador));
  platform::RunPendingEvents();
  Diretorios = {"A:\\", DirSaves};
  ListarComputador();
  ListarDisquete();
}

void Form4::Command2_Click() { Close(); }
