// Deleting the picked file.
#include "platform/keys.h"
#include "savemanager/Form4.h"
#include "support/mensagens.h"
#include "support/mod_Arquivos.h"

void Form4::Image1_Click() { Deletar(disquete_); }

void Form4::Image2_Click() { Deletar(computador_); }

void Form4::List1_KeyDown(int KeyCode) {
  if (KeyCode == platform::KeyDelete) Image1_Click();
}

void Form4::List2_KeyDown(int KeyCode) {
  if (KeyCode == platform::KeyDelete) Image2_Click();
}

void Form4::Deletar(const Painel& Este) {
  if (Direcao != Este.Lado) return;
  const std::string arquivo = Este.Diretorio + ArquivoAtual;
  if (MostrarMensagem(Este.Deletar, Este.Lista.Text(Este.Lista.Selected())) != platform::Answer::Yes) return;
  ApagarArquivo(arquivo);
  Listar(Este);
  Este.Lista.SetFocus();  // the picture that may have had the keyboard is hidden now
}
