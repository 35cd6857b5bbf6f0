// Saving the settings.
#include "autoconfig/FormCfg.h"
#include "autoconfig/configuracao_nova.h"
#include "platform/messages.h"
#include "platform/text.h"
#include "support/mod_Arquivos.h"
#include "support/mod_Configuracao.h"
#include "support/mod_Traducao.h"

using platform::Answer;
using platform::Buttons;
using platform::Icon;

namespace {

void MostrarErro(const std::string& Texto, const std::string& Caminho = "") {
  const std::string Fim = Caminho.empty() ? "" : "\r\n\r\n" + Caminho;
  platform::MessageBoxA(Traduzir(Texto) + Fim, Traduzir("Erro"), Buttons::Ok, Icon::Critical);
}

void AvisarDosEspacos(const std::string& Emulador) {
  platform::MessageBoxA(Traduzir("O caminho do emulador tem espaços e o disco não tem um nome curto para ele."_ansi) +
                            "\r\n" +
                            Traduzir("Se os jogos não abrirem, mude o emulador para um diretório sem espaços."_ansi) +
                            "\r\n\r\n" + Emulador,
                        Traduzir("Informação"_ansi), Buttons::Ok, Icon::Exclamation);
}

Answer PerguntarPelosDiretorios() {
  const std::string Pergunta =
      Traduzir("Este emulador guarda a configuração em uma forma mais nova, que o Tolvaris não altera ao jogar."_ansi) +
      "\r\n" + Traduzir("Com ele a opção de usar disquete não tem efeito."_ansi) + "\r\n\r\n" +
      Traduzir("Gravar agora nessa configuração os diretórios de jogos e de salvamentos do Tolvaris ?"_ansi);
  return platform::MessageBoxA(Pergunta, Traduzir("Confirmar"), Buttons::YesNoCancel, Icon::Question);
}

}  // namespace

// The settings come last, and of them the emulator: as long as it is not set, the program asks for this window again.
void FormCfg::Command1_Click() {
  if (Selecionado().empty()) return;
  const Ajustes Novos = AjustesEscolhidos();
  if (!Conferir(Novos) || !ConfigurarFormaNova(Novos)) return;
  if (!GravarAjustes(Registro, Novos)) {
    MostrarErro("Não foi possível gravar a configuração."_ansi);
    return;
  }
  Close();
}

// What is set already is taken as it is.
bool FormCfg::Conferir(const Ajustes& Novos) const {
  for (const NomeDeAjuste& Cada : NomesDosAjustes) {
    const std::string& Novo = Novos.*Cada.Texto;
    const std::string Motivo = Novo == Atuais.*Cada.Texto ? "" : Impedimento(Novo);
    if (Motivo.empty()) continue;
    MostrarErro(Motivo, Novo);
    return false;
  }
  if (Novos.EmuExe == Atuais.EmuExe) return true;
  if (!ArquivoExiste(Selecionado())) {
    MostrarErro("O emulador ZSnes não foi encontrado."_ansi);
    return false;
  }
  const std::string Emulador = CaminhoConfigurado(Novos.EmuExe, "");
  if (TemBranco(Emulador)) AvisarDosEspacos(Emulador);
  return true;
}

bool FormCfg::ConfigurarFormaNova(const Ajustes& Novos) const {
  const std::string Arquivo = CaminhoConfigurado(Novos.EmuCFG, "");
  const std::string Texto = LerArquivo(Arquivo);
  if (!FormaNova(Texto)) return true;
  const auto Novo = ComDiretorios(Texto, CaminhoConfigurado(Novos.RomDir, ""), CaminhoConfigurado(Novos.SaveDir, ""));
  if (!Novo) return true;
  const Answer Resposta = PerguntarPelosDiretorios();
  if (Resposta != Answer::Yes) return Resposta == Answer::No;
  if (GravarArquivo(Arquivo, *Novo, 1, true) == 1) return true;
  MostrarErro("Erro ao gravar arquivo.", Arquivo);
  return false;
}
