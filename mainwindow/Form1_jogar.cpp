// The play command.
#include "mainwindow/Form1.h"
#include "mainwindow/configuracao_emulador.h"
#include "platform/events.h"
#include "platform/registry.h"
#include "support/caracteres.h"
#include "support/gravacao.h"
#include "support/mensagens.h"
#include "support/mod_Arquivos.h"
#include "support/mod_Globais.h"
#include "support/mod_exe.h"

namespace {

using platform::Existing;

// Points the emulator at the program's directories. When that fails the game starts all the same, with the emulator's
// old settings. What is there but cannot be read is left alone: only a file that is missing is made.
void ConfigurarEmulador(const std::string& DirSavesDoJogo) {
  platform::File arquivo(ArquivoCfgEmulador, platform::Access::Read);
  const auto texto = arquivo.IsOpen() ? LerInteiro(arquivo) : std::nullopt;
  const bool existe = arquivo.IsOpen();
  arquivo.Close();
  if (existe && !texto) return;
  const auto nova = !texto || texto->empty() ? ConfiguracaoInicial(DirSavesDoJogo, DirRoms)
                                             : ConfiguracaoAtualizada(*texto, DirSavesDoJogo, DirRoms);
  if (nova) Substituicao(ArquivoCfgEmulador, *nova, existe ? Existing::Replace : Existing::Keep).Concluir();
}

}  // namespace

void Form1::Command1_Click() {
  if (List1.Selected() == -1) {
    List1.SetFocus();
    return;
  }
  const std::string nome = NomeSelecionado();
  const auto escolhido = JogoSelecionado();
  if (!escolhido) return;
  if (!ArquivoExiste(ArquivoEmulador)) {
    MostrarMensagem(Mensagem::EmuladorNaoEncontrado);
    return;
  }
  platform::RunPendingEvents();
  const auto dirSavesEscolhido = DirSavesDoJogo();
  if (!dirSavesEscolhido) return;
  AvisarALTF4();
  ConfigurarEmulador(*dirSavesEscolhido);
  GravarPartida(nome);
  platform::RunPendingEvents();
  IniciarEmulador(*escolhido);
  JogoIniciado = true;
}

std::optional<Jogo> Form1::JogoSelecionado() const {
  const int linha = List1.Selected() == -1 ? -1 : IndiceJogo(NomeSelecionado());
  if (linha == -1) {
    MostrarMensagem(Mensagem::JogoDesconhecido);
    return std::nullopt;
  }
  const Jogo& selecionado = Jogos[static_cast<std::size_t>(linha)];
  if (selecionado.SemCaminho) {
    MostrarMensagem(Mensagem::NomeForaDoWindows);
    return std::nullopt;
  }
  if (!ArquivoExiste(selecionado.Arquivo)) {
    MostrarMensagem(Mensagem::JogoNaoEncontrado);
    return std::nullopt;
  }
  return selecionado;
}

// Where the emulator keeps the saves of this launch. Nothing when the user wanted the floppy and gave up waiting for
// one.
std::optional<std::string> Form1::DirSavesDoJogo() {
  if (Check1.Value() != 1) return DirSaves;
  if (EsperarDisquete()) return "A:\\";
  Check1.SetFocus();
  Ativar(List1.Selected() == -1);
  return std::nullopt;
}

bool Form1::EsperarDisquete() {
  while (!DisqueteNoDrive()) {
    if (MostrarMensagem(Mensagem::SemDisquete) != platform::Answer::Retry) return false;
  }
  return true;
}

void Form1::AvisarALTF4() {
  if (LerTexto("AvisoALTF4") == "1") return;
  MostrarMensagem(Mensagem::ComoFecharOJogo);
  GravarAjuste("AvisoALTF4", "1");
}

void Form1::GravarPartida(const std::string& UltimoJogo) {
  GravarAjuste("LRom", UltimoJogo);
  GravarAjuste("Disquete", std::to_string(Check1.Value()));
  GravarAjuste("pl", std::to_string(Left()));
  GravarAjuste("pt", std::to_string(Top()));
}

// The short form of the ROM's path has no blanks where the disk keeps short names; the long one may need quotes.
void Form1::IniciarEmulador(const Jogo& Escolhido) {
  const auto barra = AcharUltimo(ArquivoEmulador, '\\');
  if (barra == std::string::npos) return;
  std::string diretorio = ArquivoEmulador.substr(0, barra);
  ExecutarPrograma(Argumento(ArquivoEmulador) + " " + Argumento(Escolhido.ArquivoCurto), 100, false, 2, diretorio);
}
