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
bool Cabe(const std::string& arquivo, const std::string& destino) {
  return TamanhoArquivo(arquivo) <= EspacoLivre(destino);
}

}  // namespace

void Form4::Command1_Click() {
  if (Direcao == Origem::Disquete)
    Copiar(Disquete, Computador);
  else if (Direcao == Origem::Computador)
    Copiar(Computador, Disquete);
}

// The empty text when the pane has no directory.
std::string Form4::CaminhoAtual(const Painel& painel) const {
  return painel.Diretorio.empty() ? "" : painel.Diretorio + ArquivoAtual;
}

// The old file stays until the new one is complete, so there must be room for both. Events run meanwhile, so that the
// window stays painted and alive; it takes no input.
void Form4::Copiar(const Painel& origem, const Painel& destino) {
  const std::string de = CaminhoAtual(origem);
  const std::string para = CaminhoAtual(destino);
  if (de.empty() || para.empty()) return;
  ApagarRestos(destino.Diretorio);
  if (!Cabe(de, para)) {
    MostrarMensagem(Mensagem::DiscoCheio);
    return;
  }
  if (ArquivoExiste(para) && MostrarMensagem(destino.JaExiste) != platform::Answer::Yes) return;
  RecolherEscolha();
  Enable(false);
  const std::string titulo = Caption();
  MostrarAndamento("");
  const Copia copia =
      CopiarArquivo(de, para, [this](int porCento) { MostrarAndamento(" " + std::to_string(porCento) + "%"); });
  Enable(true);
  origem.Lista.SetFocus();  // the copy button, which may have had the keyboard, is hidden now
  if (copia != Copia::Feita) MostrarMensagem(copia == Copia::NaoLida ? Mensagem::ErroAoLer : Mensagem::ErroAoGravar);
  Listar(destino);
  SetCaption(titulo);
}

void Form4::MostrarAndamento(const std::string& andamento) {
  SetCaption(Traduzir(Texto::Copiando) + andamento);
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
