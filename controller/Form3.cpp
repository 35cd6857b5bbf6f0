#include "controller/Form3.h"

#include "controller/teclas.h"
#include "resources/ids.h"
#include "support/mensagens.h"
#include "support/mod_Traducao.h"
#include "support/textos.h"

namespace {

constexpr platform::Bounds LugarCombo1 = {120, 120, 2775, 315};
constexpr platform::Bounds LugarCommand1 = {6480, 4320, 1935, 495};
constexpr platform::Font LetraLabel1 = {.TenthsOfPoint = 98, .Bold = true};
constexpr std::uint32_t IntervaloTimer1 = 100;

platform::WindowStyle Janela() {
  return {.Caption = "Controle",
          .ClientWidth = 8490,
          .ClientHeight = 4905,
          .CloseOnEscape = true,
          .Background = FIGURA_CONTROLE};
}

Form3* Aberta = nullptr;  // the window, while it is shown

// For as long as the window itself lives, closed or never made by the platform.
class Lembrada {
 public:
  explicit Lembrada(Form3& Janela) { Aberta = &Janela; }
  ~Lembrada() { Aberta = nullptr; }
  Lembrada(const Lembrada&) = delete;
  Lembrada& operator=(const Lembrada&) = delete;
};

}  // namespace

Form3::Form3()
    : Window(Janela()),
      Combo1(*this, LugarCombo1),
      Command1(*this, LugarCommand1, "&Fechar"),
      Timer1(*this, IntervaloTimer1) {
  for (const Tecla& tecla : Teclas) Label1.emplace_back(*this, tecla.Left, tecla.Top, LetraLabel1);
  Combo1.OnClick = [this] { Combo1_Click(); };
  Command1.OnClick = [this] { Command1_Click(); };
  Timer1.OnTick = [this] { Timer1_Tick(); };
}

void Form3::ABRIR() {
  if (Aberta) return;
  Form3 janela;
  janela.Preparar();
  const Lembrada lembrada(janela);
  janela.ShowModal();
}

void Form3::Descarregar() {
  if (Aberta) Aberta->Close();
}

void Form3::Preparar() {
  Command1.SetCaption(Traduzir(Command1.Caption()));
  Combo1.Add(Traduzir(Texto::Jogador1));
  Combo1.Add(Traduzir(Texto::Jogador2));
  Combo1.SetAccessibleName(Traduzir(Texto::NomeDoJogador));
  Combo1.Select(0);
  MostrarTeclas();
  SetCaption(Traduzir(Caption()));
  Timer1.Enable(true);
}

void Form3::MostrarTeclas() {
  const int jogador = Combo1.Selected();
  if (jogador != 0 && jogador != 1) return;
  for (std::size_t i = 0; i < Teclas.size(); ++i) {
    Label1[i].SetCaption(Traduzir(Teclas[i].Nomes[static_cast<std::size_t>(jogador)]));
    Label1[i].SetAccessibleName(Traduzir(Teclas[i].Botao) + ": " + Label1[i].Caption());
  }
}

void Form3::Combo1_Click() { MostrarTeclas(); }

void Form3::Timer1_Tick() {
  Timer1.Enable(false);
  MostrarMensagem(Mensagem::GuardeOsComandos);
}

void Form3::Command1_Click() { Close(); }
