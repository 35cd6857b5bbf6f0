// Saving the settings.
#include "autoconfig/FormCfg.h"
#include "autoconfig/forma_nova.h"
#include "autoconfig/programa_dos.h"
#include "support/gravacao.h"
#include "support/mensagens.h"
#include "support/mod_Arquivos.h"
#include "support/mod_Configuracao.h"

using platform::Answer;

// The settings come last, and of them the emulator: as long as it is not set, the program asks for this window again.
void FormCfg::Command1_Click() {
  if (Selecionado().empty()) return;
  const Ajustes novos = AjustesEscolhidos();
  if (!Conferir(novos) || !PrepararConfiguracao(novos)) return;
  if (!GravarAjustes(registro_, novos)) {
    MostrarMensagem(Mensagem::ErroAoGravarAjustes);
    return;
  }
  Close();
}

// What is set already is taken as it is, but for an emulator that can never start.
bool FormCfg::Conferir(const Ajustes& Novos) const {
  if (EhProgramaDoDos(Selecionado())) {
    MostrarMensagem(Mensagem::EmuladorDoDos, Selecionado());
    return false;
  }
  for (const AjusteDeCaminho& cada : AjustesDeCaminhos) {
    const std::string& novo = Novos.*cada.Texto;
    const auto motivo = novo == atuais_.*cada.Texto ? std::nullopt : Impedimento(novo);
    if (!motivo) continue;
    MostrarMensagem(*motivo, novo);
    return false;
  }
  if (Novos.EmuExe == atuais_.EmuExe || ArquivoExiste(Selecionado())) return true;
  MostrarMensagem(Mensagem::EmuladorNaoEncontrado);
  return false;
}

// Without leave to write it the games start all the same: the person is told, and the settings are saved.
bool FormCfg::PrepararConfiguracao(const Ajustes& Novos) const {
  const std::string arquivo = CaminhoConfigurado(Novos.EmuCFG);
  const std::string texto = LerArquivo(arquivo);
  const bool nova = FormaNova(texto);
  const auto novo =
      nova ? ComDiretorios(texto, CaminhoConfigurado(Novos.RomDir), CaminhoConfigurado(Novos.SaveDir)) : std::nullopt;
  if (nova && !novo) return true;
  if (!PodeGravar(arquivo)) {
    MostrarMensagem(Mensagem::ConfiguracaoProtegida, arquivo);
    return true;
  }
  if (!nova) return true;
  const Answer resposta = MostrarMensagem(Mensagem::ConfiguracaoMaisNova);
  if (resposta != Answer::Yes) return resposta == Answer::No;
  if (GravarArquivo(arquivo, *novo, 1, true) == 1) return true;
  MostrarMensagem(Mensagem::ErroAoGravarConfiguracao, arquivo);
  return false;
}
