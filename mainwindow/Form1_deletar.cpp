// The delete command. Only the ROM file goes, to the recycle bin; the catalogue's entry and the picture stay for when
// it comes back.
#include "mainwindow/Form1.h"
#include "support/mensagens.h"
#include "support/mod_Arquivos.h"

void Form1::Command6_Click() {
  const auto escolhido = JogoSelecionado();
  if (!escolhido) return;
  if (MostrarMensagem(Mensagem::DeletarJogo, NomeSelecionado()) != platform::Answer::Yes) {
    Ativar(true);
    return;
  }
  Desativar(false);
  DescartarArquivo(escolhido->Arquivo);
  const int indiceAntigo = List1.Selected();
  CarregarLista(true);
  SelecionarVizinho(indiceAntigo);
}

// The game that followed the deleted one, or the new last one; none in an empty list.
void Form1::SelecionarVizinho(int IndiceAntigo) {
  const int quantos = List1.Count();
  const int indice = IndiceAntigo < quantos ? IndiceAntigo : IndiceAntigo - 1 < quantos ? IndiceAntigo - 1 : -1;
  List1.Select(indice);
  if (indice >= 0) List1_Click();
}
