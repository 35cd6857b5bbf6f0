// The delete command. Only the ROM file goes; the catalogue's entry and the picture stay for when it comes back.
#include "mainwindow/Form1.h"
#include "support/mensagens.h"
#include "support/mod_Arquivos.h"

void Form1::Command6_Click() {
  const auto Escolhido = JogoSelecionado();
  if (!Escolhido) return;
  if (MostrarMensagem(Mensagem::DeletarJogo, NomeSelecionado()) != platform::Answer::Yes) {
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
