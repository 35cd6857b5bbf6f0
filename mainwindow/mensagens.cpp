#include "mainwindow/mensagens.h"

#include "platform/text.h"
#include "support/mod_Traducao.h"

using platform::Answer;
using platform::Buttons;
using platform::Icon;

void MostrarErro(const std::string& Texto) {
  platform::MessageBoxA(Traduzir(Texto), Traduzir("Erro"), Buttons::Ok, Icon::Critical);
}

void MostrarAviso(const std::string& Texto, const std::string& Titulo) {
  platform::MessageBoxA(Traduzir(Texto), Traduzir(Titulo), Buttons::Ok, Icon::Information);
}

void ErroJogoDesconhecido() { MostrarErro("Erro interno: jogo não encontrado no sistema."_ansi); }

void ErroJogoNaoEncontrado() { MostrarErro("O jogo não foi encontrado."_ansi); }

void ErroAoLer() { MostrarErro("Erro ao ler arquivo."); }

void ErroAoGravar() { MostrarErro("Erro ao gravar arquivo."); }

bool ConfirmarSubstituicao(const std::string& Texto) {
  const std::string Pergunta = Traduzir(Texto) + "\r\n\r\n" + Traduzir("Substituir ?");
  return platform::MessageBoxA(Pergunta, Traduzir("Confirmar"), Buttons::YesNoCancel, Icon::Exclamation) == Answer::Yes;
}

bool PedirDisquete() {
  const std::string Pedido = Traduzir("Não há disquete na unidade A:\\"_ansi) + "\r\n\r\n" +
                             Traduzir("Coloque um disquete e clique em 'Repetir'.");
  return platform::MessageBoxA(Pedido, Traduzir("Disquete A:"), Buttons::RetryCancel, Icon::Exclamation) ==
         Answer::Retry;
}
