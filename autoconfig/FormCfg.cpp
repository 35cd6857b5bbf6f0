#include "autoconfig/FormCfg.h"

#include <algorithm>
#include <array>
#include <iterator>

#include "autoconfig/procura.h"
#include "platform/events.h"
#include "platform/files.h"
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
constexpr int Enter = 13;

platform::WindowStyle Janela() {
  return {.Caption = "Configuração do Tolvaris"_ansi, .ClientWidth = 8400, .ClientHeight = 5295, .CloseOnEscape = true};
}

// A path for the screen: of a long one the middle is left out.
std::string Abreviado(const std::string& Caminho, std::size_t Largura) {
  constexpr std::string_view Reticencias = "...";
  constexpr std::size_t Inicio = 20;
  if (Caminho.size() <= Largura) return Caminho;
  return Caminho.substr(0, Inicio).append(Reticencias) +
         Caminho.substr(Caminho.size() - (Largura - Inicio - Reticencias.size()));
}

// Equal for two paths that lead to the same file through long and short names.
std::string Identidade(const std::string& Caminho) {
  return platform::CharUpperBuffA(platform::GetShortPathNameA(Caminho, 1024).value_or(Caminho));
}

std::string FiltroDeEmuladores() {
  const auto Par = [](Texto Nome, const std::string& Padrao) { return Traduzir(Nome) + '\0' + Padrao + '\0'; };
  return Par(Texto::EmuladorZsnes, "zsnes*.exe") + Par(Texto::Programas, "*.exe");
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
  int Topo = PrimeiraLinha;
  for (const Linha& Cada : Linhas) {
    Label3.emplace_back(Frame1, ColunaDosNomes, Topo, platform::Font{}, Label::Ground::Window);
    Label3.back().SetCaption(platform::FromUtf8(Cada.Nome));
    Label4.emplace_back(Frame1, ColunaDosCaminhos, Topo, platform::Font{}, Label::Ground::Window);
    Topo += AlturaDaLinha;
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
  LerCaminhos(Registro);
  Atuais = LerAjustes(Registro);
  TraduzirControles();
  if (!ArquivoEmulador.empty()) Propor(ArquivoEmulador);
  MostrarEscolha();
  Timer1.Enable(true);
}

void FormCfg::TraduzirControles() {
  const auto TraduzirTexto = [](auto& Controle) { Controle.SetCaption(Traduzir(Controle.Caption())); };
  TraduzirTexto(static_cast<Window&>(*this));
  TraduzirTexto(Label1);
  TraduzirTexto(Command3);
  TraduzirTexto(Frame1);
  for (Label& Cada : Label3) TraduzirTexto(Cada);
  TraduzirTexto(Command1);
  TraduzirTexto(Command2);
}

void FormCfg::Timer1_Tick() {
  Timer1.Enable(false);
  Procurar();
}

// Between two directories the person can choose, save or cancel.
void FormCfg::Procurar() {
  Label2.SetCaption(Traduzir(Texto::Procurando));
  platform::RunPendingEvents();
  Procura Busca(LugaresUsuais());
  while (!IsClosed() && !Busca.Terminou()) {
    for (const std::string& Emulador : Busca.Passo()) Propor(Emulador);
    platform::RunPendingEvents();
  }
  Label2.SetCaption(Traduzir(Emuladores.empty() ? Texto::NenhumEmulador : Texto::BuscaConcluida));
}

int FormCfg::Acrescentar(const std::string& Emulador) {
  const auto Igual = std::find_if(Emuladores.begin(), Emuladores.end(),
                                  [&](const std::string& Outro) { return Identidade(Outro) == Identidade(Emulador); });
  if (Igual != Emuladores.end()) return static_cast<int>(Igual - Emuladores.begin());
  Emuladores.push_back(Emulador);
  List1.Add(Abreviado(Emulador, LarguraNaLista));
  return static_cast<int>(std::ssize(Emuladores)) - 1;
}

void FormCfg::Propor(const std::string& Emulador) {
  const int Indice = Acrescentar(Emulador);
  if (List1.Selected() != -1) return;
  Proposto = Emulador;
  Selecionar(Indice);
}

void FormCfg::Selecionar(int Indice) {
  List1.Select(Indice);
  MostrarEscolha();
}

std::string FormCfg::Selecionado() const {
  const int Indice = List1.Selected();
  return Indice >= 0 && Indice < std::ssize(Emuladores) ? Emuladores[static_cast<std::size_t>(Indice)] : "";
}

Ajustes FormCfg::AjustesEscolhidos() const { return AjustesPara(Selecionado(), Atuais, Selecionado() != Proposto); }

// Without an emulator there is nothing to save yet.
void FormCfg::MostrarEscolha() {
  const Ajustes Novos = AjustesEscolhidos();
  for (std::size_t i = 0; i < Linhas.size(); ++i) {
    Label4[i].SetCaption(Abreviado(CaminhoConfigurado(Novos.*Linhas[i].Texto, ""), LarguraNoQuadro));
  }
  Command1.Enable(!Selecionado().empty());
}

void FormCfg::List1_Click() { MostrarEscolha(); }

void FormCfg::List1_KeyDown(int KeyCode) {
  if (KeyCode == Enter) Command1_Click();
}

void FormCfg::Command2_Click() { Close(); }

void FormCfg::Command3_Click() {
  std::string Filtro = FiltroDeEmuladores();
  const std::string Atual = Selecionado();
  const std::string Caminho =
      AbrirArquivo(*this, DiretorioDe(Atual), Traduzir(Texto::ProcurarEmulador), "", Filtro, platform::HideReadOnly);
  if (Caminho.empty()) return;
  Selecionar(Acrescentar(Caminho));
}
