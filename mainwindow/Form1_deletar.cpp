// The delete command. Only the ROM file goes; the catalogue's entry and the picture stay for when it comes back.
#include "mainwindow/Form1.h"
#include "platform/messages.h"
#include "platform/text.h"
#include "support/mod_Arquivos.h"
#include "support/mod_Traducao.h"

namespace {

bool ConfirmarDelecao(const std::string& Nome) {
  return platform::MessageBoxA(Traduzir("Deletar o jogo '") + " " + Nome + " " + Traduzir("' ?"),
                               Traduzir("Confirmar deleção"_ansi), platform::Buttons::YesNoCancel,
                               platform::Icon::Exclamation) == platform::Answer::Yes;
}

}  // namespace

void Form1::Command6_Click() {
  const auto Escolhido = JogoSelecionado();
  if (!Escolhido) return;
  if (!ConfirmarDelecao(NomeSelecionado())) {
    Ativar(true);
    return;
  }
  Desativar(false);
  ApagarArquivo(Escolhido->Arquivo);
  const int IndiceAntigo = List1.Selected();
  CarregarLista(true);
  SelecionarVizinho(IndiceAntigo);
}

// The game that followed the deleted one, or the new last one; none in an empty list.
void Form1::SelecionarVizinho(int IndiceAntigo) {
  const int Quantos = List1.Count();
  const int Indice = IndiceAntigo < Quantos ? IndiceAntigo : IndiceAntigo - 1 < Quantos ? IndiceAntigo - 1 : -1;
  List1.Select(Indice);
  if (Indice >= 0) List1_Click();
}
