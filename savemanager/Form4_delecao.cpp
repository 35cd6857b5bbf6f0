// Deleting the picked file.
#include "savemanager/Form4.h"
#include "support/mensagens.h"
#include "support/mod_Arquivos.h"

namespace {

constexpr int TeclaDelete = 46;

}  // namespace

void Form4::Image1_Click() { Deletar(Disquete); }

void Form4::Image2_Click() { Deletar(Computador); }

void Form4::List1_KeyDown(int tecla) {
  if (tecla == TeclaDelete) Image1_Click();
}

void Form4::List2_KeyDown(int tecla) {
  if (tecla == TeclaDelete) Image2_Click();
}

void Form4::Deletar(const Painel& painel) {
  if (Direcao != painel.Lado) return;
  const std::string arquivo = painel.Diretorio + ArquivoAtual;
  if (MostrarMensagem(painel.Deletar, painel.Lista.Text(painel.Lista.Selected())) != platform::Answer::Yes) return;
  ApagarArquivo(arquivo);
  Listar(painel);
  painel.Lista.SetFocus();  // the picture that may have had the keyboard is hidden now
}
