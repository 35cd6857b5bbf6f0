// Copying the picked file to the other side.
#include "platform/events.h"
#include "savemanager/EspacoLivre.h"
#include "savemanager/Form4.h"
#include "support/gravacao.h"
#include "support/mensagens.h"
#include "support/mod_Arquivos.h"
#include "support/textos.h"

namespace {

// A missing file has length 0: its copy is tried, and fails.
bool Cabe(const std::string& Arquivo, const std::string& Destino) {
  return TamanhoArquivo(Arquivo) <= EspacoLivre(Destino);
}

}  // namespace

void Form4::Command1_Click() {
  if (Direcao == Origem::Disquete)
    Copiar(disquete_, computador_);
  else if (Direcao == Origem::Computador)
    Copiar(computador_, disquete_);
}

// The empty text when the pane has no directory.
std::string Form4::CaminhoAtual(const Painel& Este) const {
  return Este.Diretorio.empty() ? "" : Este.Diretorio + ArquivoAtual;
}

// The old file stays until the new one is complete, so there must be room for both. Events run meanwhile, so that the
// window stays painted and alive; it takes no input.
void Form4::Copiar(const Painel& De, const Painel& Para) {
  const std::string origem = CaminhoAtual(De);
  const std::string destino = CaminhoAtual(Para);
  if (origem.empty() || destino.empty()) return;
  ApagarRestos(Para.Diretorio);
  if (!Cabe(origem, destino)) {
    MostrarMensagem(Mensagem::DiscoCheio);
    return;
  }
  if (ArquivoExiste(destino) && MostrarMensagem(Para.JaExiste) != platform::Answer::Yes) return;
  RecolherEscolha();
  Enable(false);
  const std::string titulo = Caption();
  MostrarAndamento("");
  const Copia copia =
      CopiarArquivo(origem, destino, [this](int PorCento) { MostrarAndamento(" " + std::to_string(PorCento) + "%"); });
  Enable(true);
  De.Lista.SetFocus();  // the copy button, which may have had the keyboard, is hidden now
  if (copia != Copia::Feita) MostrarMensagem(copia == Copia::NaoLida ? Mensagem::ErroAoLer : Mensagem::ErroAoGravar);
  Listar(Para);
  SetCaption(titulo);
}

void Form4::MostrarAndamento(const std::string& Quanto) {
  SetCaption(Traduzir(Texto::Copiando) + Quanto);
  platform::RunPendingEvents();
}

void Form4::RecolherEscolha() {
  Direcao = Origem::Nenhuma;
  Image1.Show(false);
  Image2.Show(false);
  Command1.Show(false);
  List1.Select(-1);
  List2.Select(-1);
}
