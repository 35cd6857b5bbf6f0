// Start-up and shutdown of the main window.
#include "catalog/cls_DAT.h"
#include "controller/Form3.h"
#include "mainwindow/Form1.h"
#include "mainwindow/janela_inicial.h"
#include "platform/events.h"
#include "platform/registry.h"
#include "platform/screen.h"
#include "support/caminhos.h"
#include "support/gravacao.h"
#include "support/mensagens.h"
#include "support/mod_Arquivos.h"
#include "support/mod_Configuracao.h"
#include "support/mod_Globais.h"
#include "support/mod_Traducao.h"
#include "support/mod_exe.h"
#include "support/textos.h"

namespace {

// What an earlier run of the program has left half written.
void ApagarRestosDeAntes() {
  for (const std::string& diretorio : {DirRoms, DirSaves, DirImgs, DiretorioDe(ArquivoCfgEmulador)}) {
    ApagarRestos(diretorio);
  }
}

}  // namespace

bool Form1::Form_Load() {
  for (Configuracao estado = Configuracao::Repetir; estado == Configuracao::Repetir;) {
    if (JogoIniciado) {
      Close();
      return false;
    }
    DefinirDirPrograma();
    Catalogo().Carregar();
    EscolherIdioma();
    RestaurarJanela();
    LerCaminhos(Registro);
    estado = VerificarConfiguracao();
    if (estado == Configuracao::Desistir) {
      Close();
      return false;
    }
  }
  TraduzirControles();
  platform::RunPendingEvents();
  CarregarLista(false);
  platform::RunPendingEvents();
  ApagarRestosDeAntes();
  MostrarControleNaPrimeiraVez();
  return true;
}

void Form1::RestaurarJanela() {
  Check1.SetValue(EstadoDisquete(LerTexto("Disquete")));
  const platform::Bounds janela = {.Width = Width(), .Height = Height()};
  const platform::Bounds tela = {.Width = platform::ScreenWidth(), .Height = platform::ScreenHeight()};
  const auto [esquerda, topo] = CantoInicial(LerTexto("pl"), LerTexto("pt"), janela, tela, platform::Monitors());
  if (esquerda) SetLeft(*esquerda);
  if (topo) SetTop(*topo);
}

Form1::Configuracao Form1::VerificarConfiguracao() {
  if (!ArquivoEmulador.empty() && !ArquivoCfgEmulador.empty()) return Configuracao::Pronta;
  const std::string configurador = DirPrograma + "tolvariscfg.exe";
  if (!ArquivoExiste(configurador)) {
    MostrarMensagem(Mensagem::SemConfigurador);
    return Configuracao::Desistir;
  }
  if (MostrarMensagem(Mensagem::SemConfiguracao) != platform::Answer::Yes) return Configuracao::Desistir;
  std::string diretorio = DirPrograma;
  ExecutarPrograma(Argumento(configurador), 500, true, 2, diretorio);
  platform::RunPendingEvents();
  return Configuracao::Repetir;
}

void Form1::TraduzirControles() {
  Command1.SetCaption(Traduzir(Command1.Caption()));
  for (platform::Control* cada :
       {static_cast<platform::Control*>(&Check1), static_cast<platform::Control*>(&Command2),
        static_cast<platform::Control*>(&Command3), static_cast<platform::Control*>(&Command4),
        static_cast<platform::Control*>(&Command5), static_cast<platform::Control*>(&Command6)}) {
    cada->SetToolTip(Traduzir(cada->ToolTip()));
  }
  List1.SetAccessibleName(Traduzir(Texto::NomeDosJogos));
  Image1.SetAccessibleName(Traduzir(Texto::NomeDaFigura));
}

void Form1::MostrarControleNaPrimeiraVez() {
  const std::string mostrado = LerTexto("AvisoControle");
  if (mostrado == "1" || mostrado == "2") return;
  Form3::ABRIR();
  GravarAjuste("AvisoControle", "1");
}

std::string Form1::LerTexto(const std::string& Ajuste) const {
  return TextoDe(Registro.GetValue(platform::RootCurrentUser, ChaveConfiguracao, Ajuste));
}

void Form1::GravarAjuste(const std::string& Ajuste, const std::string& Texto) const {
  Registro.SetValue(platform::RootCurrentUser, ChaveConfiguracao, Ajuste, Texto);
}

void Form1::Form_Help() {
  if (Command4.Enabled()) Form3::ABRIR();
}

void Form1::Form_Unload() { Form3::Descarregar(); }
