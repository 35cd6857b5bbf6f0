// Every message that a window of ours shows, as data: its name, its pieces of text, its title, buttons and icon. A text
// is written here once; the translation, the guide and the tests are held against this table.
#pragma once

#include <array>
#include <span>
#include <string>
#include <string_view>

#include "platform/messages.h"

enum class Mensagem {
  // The start.
  SemConfiguracao,
  SemConfigurador,
  GuardeOsComandos,
  // Playing.
  JogoDesconhecido,
  JogoNaoEncontrado,
  NomeForaDoWindows,
  EmuladorNaoEncontrado,
  SemDisquete,
  ComoFecharOJogo,
  // Games.
  JogoAdicionado,
  JogoJaExiste,
  JogoCorrompido,
  ErroAoLer,
  ErroAoGravar,
  ErroAoSalvar,
  ArquivoJaExiste,
  ArquivoSalvo,
  DeletarJogo,
  SemDownloader,
  // Saves.
  DiscoCheio,
  SalvamentoNoDisquete,
  SalvamentoNoComputador,
  DeletarDoDisquete,
  DeletarDoComputador,
  // The auto-configuration.
  CaminhoLongo,
  CaminhoEmRede,
  EmuladorDoDos,
  ConfiguracaoMaisNova,
  ConfiguracaoProtegida,
  ErroAoGravarConfiguracao,
  ErroAoGravarAjustes,
};

// What stands between the pieces that are translated, each by itself, or around what is not translated: Valor, which
// the message is shown with.
namespace Peca {
inline constexpr std::string_view Linha = "\r\n", Paragrafo = "\r\n\r\n", Branco = " ", Valor = "%";
}

struct DescricaoDeMensagem {
  Mensagem Qual;
  std::string_view Nome;
  std::array<std::string_view, 5> Pecas;  // UTF-8; the empty ones behind the last are none
  std::string_view Titulo;                // UTF-8
  platform::Buttons Botoes;
  platform::Icon Icone;
};

// All of them, in the order of their names above.
std::span<const DescricaoDeMensagem> TodasAsMensagens();

// Whether a piece goes through the translation.
bool EhTexto(std::string_view Peca);

// The text and the title in the ANSI code page, translated.
std::string TextoDaMensagem(Mensagem Qual, const std::string& ComValor = "");
std::string TituloDaMensagem(Mensagem Qual);

// Shows the message and waits for the answer.
platform::Answer MostrarMensagem(Mensagem Qual, const std::string& ComValor = "");
