#include "autoconfig/FormCfg.h"

#include <algorithm>
#include <array>
#include <iterator>

#include "autoconfig/procura.h"
#include "platform/events.h"
#include "platform/files.h"
#include "platform/keys.h"
#include "platform/text.h"
#include "support/caminhos.h"
#include "support/mod_Arquivos.h"
#include "support/mod_CommonDialog.h"
#include "support/mod_Configuracao.h"
#include "support/mod_Globais.h"
#include "support/mod_Traducao.h"
#include "support/textos.h"

using platform::Label;
using platform::ListBox;

namespace {

constexpr platform::Bounds LugarList1 = {120, 375, 8160, 1500};
constexpr platform::Bounds LugarCommand3 = {6360, 1965, 1920, 405};
constexpr platform::Bounds LugarFrame1 = {120, 2460, 8160, 2055};
constexpr platform::Bounds LugarCommand1 = {4920, 4680, 1620, 495};
constexpr platform::Bounds LugarCommand2 = {6660, 4680, 1620, 495};
constexpr int PrimeiraLinha = 345, AlturaDaLinha = 330, ColunaDosNomes = 120, ColunaDosCaminhos = 2160;  // in Frame1
constexpr std::size_t LarguraNaLista = 84, LarguraNoQuadro = 60;  // characters that a path may take

struct Linha {
  const char* Nome;
  std::string Ajustes::*Texto;
};
constexpr std::array<Linha, 5> Linhas = {{{"Emulador:", &Ajustes::EmuExe},
                                          {"Arquivo de configuração:", &Ajustes::EmuCFG},
                                          {"Jogos:", &Ajustes::RomDir},
                                          {"Salvamentos:", &Ajustes::SaveDir},
                                          {"Imagens:", &Ajustes::ImgDir}}};

constexpr std::uint32_t IntervaloTimer1 = 50;

platform::WindowStyle Janela() {
  return {.Caption = "Configuração do Tolvaris"_ansi, .ClientWidth = 8400, .ClientHeight = 5295, .CloseOnEscape = true};
}

// A path for the screen: of a long one the middle is left out.
std::string Abreviado(const std::string& Caminho, std::size_t Largura) {
  constexpr std::string_view reticencias = "...";
  constexpr std::size_t inicio = 20;
  if (Caminho.size() <= Largura) return Caminho;
  return Caminho.substr(0, inicio).append(reticencias) +
         Caminho.substr(Caminho.size() - (Largura - inicio - reticencias.size()));
}

// Equal for two paths that lead to the same file through long and short names.
std::string Identidade(const std::string& Caminho) {
  return platform::CharUpperBuffA(platform::GetShortPathNameA(Caminho, 1024).value_or(Caminho));
}

std::string FiltroDeEmuladores() {
  const auto par = [](Texto Nome, const std::string& Padrao) { return Traduzir(Nome) + '\0' + Padrao + '\0'; };
  return par(Texto::EmuladorZsnes, "zsnes*.exe") + par(Texto::Programas, "*.exe");
}

}  // namespace

FormCfg::FormCfg()
    : Window(Janela()),
      Label1(*this, 120, 120, {}, Label::Ground::Window),
      List1(*this, LugarList1, ListBox::Order::AsAdded),
      Label2(*this, 120, 2070, {}, Label::Ground::Window),
      Command3(*this, LugarCommand3, "&Procurar outro..."),
      Frame1(*this, LugarFrame1, " Configuração "_ansi),
      Command1(*this, LugarCommand1, "&Gravar"),
      Command2(*this, LugarCommand2, "&Cancelar"),
      Timer1(*this, IntervaloTimer1) {
  int topo = PrimeiraLinha;
  for (const Linha& cada : Linhas) {
    Label3.emplace_back(Frame1, ColunaDosNomes, topo, platform::Font{}, Label::Ground::Window);
    Label3.back().SetCaption(platform::FromUtf8(cada.Nome));
    Label4.emplace_back(Frame1, ColunaDosCaminhos, topo, platform::Font{}, Label::Ground::Window);
    topo += AlturaDaLinha;
  }
  Label1.SetCaption("Emuladores encontrados:");
  List1.OnClick = [this] { List1_Click(); };
  List1.OnDoubleClick = [this] { Command1_Click(); };
  List1.OnKeyDown = [this](int KeyCode) { List1_KeyDown(KeyCode); };
  Command1.OnClick = [this] { Command1_Click(); };
  Command2.OnClick = [this] { Command2_Click(); };
  Command3.OnClick = [this] { Command3_Click(); };
  Timer1.OnTick = [this] { Timer1_Tick(); };
}

void FormCfg::Form_Load() {
  DefinirDirPrograma();
  EscolherIdioma();
  LerCaminhos(registro_);
  atuais_ = LerAjustes(registro_);
  TraduzirControles();
  if (!ArquivoEmulador.empty()) Propor(ArquivoEmulador);
  MostrarEscolha();
  Timer1.Enable(true);
}

void FormCfg::TraduzirControles() {
  const auto traduzirTexto = [](auto& Controle) { Controle.SetCaption(Traduzir(Controle.Caption())); };
  traduzirTexto(static_cast<Window&>(*this));
  traduzirTexto(Label1);
  traduzirTexto(Command3);
  traduzirTexto(Frame1);
  for (Label& cada : Label3) traduzirTexto(cada);
  traduzirTexto(Command1);
  traduzirTexto(Command2);
}

void FormCfg::Timer1_Tick() {
  Timer1.Enable(false);
  Procurar();
}

// Between two directories the person can choose, save or cancel.
void FormCfg::Procurar() {
  Label2.SetCaption(Traduzir(Texto::Procurando));
  platform::RunPendingEvents();
  Procura busca(LugaresUsuais());
  while (!IsClosed() && !busca.Terminou()) {
    for (const std::string& emulador : busca.Passo()) Propor(emulador);
    platform::RunPendingEvents();
  }
  Label2.SetCaption(Traduzir(emuladores_.empty() ? Texto::NenhumEmulador : Texto::BuscaConcluida));
}

int FormCfg::Acrescentar(const std::string& Emulador) {
  const auto igual = std::find_if(emuladores_.begin(), emuladores_.end(),
                                  [&](const std::string& Outro) { return Identidade(Outro) == Identidade(Emulador); });
  if (igual != emuladores_.end()) return static_cast<int>(igual - emuladores_.begin());
  emuladores_.push_back(Emulador);
  List1.Add(Abreviado(Emulador, LarguraNaLista));
  return static_cast<int>(std::ssize(emuladores_)) - 1;
}

void FormCfg::Propor(const std::string& Emulador) {
  const int indice = Acrescentar(Emulador);
  if (List1.Selected() != -1) return;
  proposto_ = Emulador;
  Selecionar(indice);
}

void FormCfg::Selecionar(int Indice) {
  List1.Select(Indice);
  MostrarEscolha();
}

std::string FormCfg::Selecionado() const {
  const int indice = List1.Selected();
  return indice >= 0 && indice < std::ssize(emuladores_) ? emuladores_[static_cast<std::size_t>(indice)] : "";
}

Ajustes FormCfg::AjustesEscolhidos() const { return AjustesPara(Selecionado(), atuais_, Selecionado() != proposto_); }

// Without an emulator there is nothing to save yet.
void FormCfg::MostrarEscolha() {
  const Ajustes novos = AjustesEscolhidos();
  for (std::size_t i = 0; i < Linhas.size(); ++i) {
    const std::string caminho = CaminhoConfigurado(novos.*Linhas[i].Texto);
    Label4[i].SetCaption(Abreviado(caminho, LarguraNoQuadro));
    Label4[i].SetAccessibleName(Label3[i].Caption() + " " + caminho);
  }
  Command1.Enable(!Selecionado().empty());
}

void FormCfg::List1_Click() { MostrarEscolha(); }

void FormCfg::List1_KeyDown(int KeyCode) {
  if (KeyCode == platform::KeyEnter) Command1_Click();
}

void FormCfg::Command2_Click() { Close(); }

void FormCfg::Command3_Click() {
  std::string filtro = FiltroDeEmuladores();
  const std::string atual = Selecionado();
  const std::string caminho =
      AbrirArquivo(*this, DiretorioDe(atual), Traduzir(Texto::ProcurarEmulador), "", filtro, platform::HideReadOnly);
  if (caminho.empty()) return;
  Selecionar(Acrescentar(caminho));
}
