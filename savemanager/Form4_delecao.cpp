// Deleting the picked file.
#include "platform/messages.h"
#include "platform/text.h"
#include "savemanager/Form4.h"
#include "support/mod_Arquivos.h"
#include "support/mod_Traducao.h"

namespace {

constexpr int TeclaDelete = 46;

bool ConfirmarDelecao(const std::string& jogo, const std::string& fim) {
  const std::string pergunta = Traduzir("Deletar o salvamento do jogo '") + jogo + Traduzir(fim);
  return platform::MessageBoxA(pergunta, Traduzir("Confirmar deleção"_ansi), platform::Buttons::YesNoCancel,
                               platform::Icon::Question) == platform::Answer::Yes;
}

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
  if (!ConfirmarDelecao(painel.Lista.Text(painel.Lista.Selected()), painel.FimPergunta)) return;
  ApagarArquivo(arquivo);
  Listar(painel);
  painel.Lista.SetFocus();  // the picture that may have had the keyboard is hidden now
}
