// Saving the settings.
#include "autoconfig/FormCfg.h"
#include "autoconfig/configuracao_nova.h"
#include "support/mensagens.h"
#include "support/mod_Arquivos.h"
#include "support/mod_Configuracao.h"

using platform::Answer;

// The settings come last, and of them the emulator: as long as it is not set, the program asks for this window again.
void FormCfg::Command1_Click() {
  if (Selecionado().empty()) return;
  const Ajustes Novos = AjustesEscolhidos();
  if (!Conferir(Novos) || !ConfigurarFormaNova(Novos)) return;
  if (!GravarAjustes(Registro, Novos)) {
    MostrarMensagem(Mensagem::ErroAoGravarAjustes);
    return;
  }
  Close();
}

// What is set already is taken as it is.
bool FormCfg::Conferir(const Ajustes& Novos) const {
  for (const NomeDeAjuste& Cada : NomesDosAjustes) {
    const std::string& Novo = Novos.*Cada.Texto;
    const auto Motivo = Novo == Atuais.*Cada.Texto ? std::nullopt : Impedimento(Novo);
    if (!Motivo) continue;
    MostrarMensagem(*Motivo, Novo);
    return false;
  }
  if (Novos.EmuExe == Atuais.EmuExe) return true;
  if (!ArquivoExiste(Selecionado())) {
    MostrarMensagem(Mensagem::EmuladorNaoEncontrado);
    return false;
  }
  const std::string Emulador = CaminhoConfigurado(Novos.EmuExe, "");
  if (TemBranco(Emulador)) MostrarMensagem(Mensagem::EmuladorComEspacos, Emulador);
  return true;
}

bool FormCfg::ConfigurarFormaNova(const Ajustes& Novos) const {
  const std::string Arquivo = CaminhoConfigurado(Novos.EmuCFG, "");
  const std::string Texto = LerArquivo(Arquivo);
  if (!FormaNova(Texto)) return true;
  const auto Novo = ComDiretorios(Texto, CaminhoConfigurado(Novos.RomDir, ""), CaminhoConfigurado(Novos.SaveDir, ""));
  if (!Novo) return true;
  const Answer Resposta = MostrarMensagem(Mensagem::ConfiguracaoMaisNova);
  if (Resposta != Answer::Yes) return Resposta == Answer::No;
  if (GravarArquivo(Arquivo, *Novo, 1, true) == 1) return true;
  MostrarMensagem(Mensagem::ErroAoGravarConfiguracao, Arquivo);
  return false;
}
