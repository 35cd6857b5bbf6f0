// What the tests of the program's logic share: a fresh machine in memory, what its person has seen, and an operation
// with each of its platform calls failing in turn.
#pragma once

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "platform/simulated/simulated.h"
#include "platform/text.h"
#include "support/mod_Globais.h"

using namespace platform::simulated;
using namespace std::string_literals;
using platform::Answer;
using Textos = std::vector<std::string>;

// A test on a fresh machine, with the program's texts as they are there.
struct Maquina : testing::Test {
  Maquina() { Reiniciar(); }

  static void Reiniciar() {
    Reset();
    DirPrograma = "C:\\Tolvaris\\";
    ArquivoIdioma.clear();
  }
};

inline const std::string Erro = "Erro, OK, critical: ";

// The messages shown since the last call, as "title, buttons, icon: text".
inline Textos Mensagens() {
  constexpr const char* botoes[] = {"OK", "Yes/No/Cancel", "Retry/Cancel"};
  constexpr const char* icones[] = {"critical", "question", "exclamation", "information"};
  Textos textos;
  for (const auto& [texto, titulo, escolha, simbolo] : ShownMessages()) {
    const std::string botao = botoes[static_cast<int>(escolha)], icone = icones[static_cast<int>(simbolo)];
    textos.push_back(titulo + ", " + botao + ", " + icone + ": " + texto);
  }
  ForgetMessages();
  return textos;
}

// The entries of a list, with a bar behind each.
inline std::string Entradas(const platform::ListBox& lista) {
  std::string entradas;
  for (int i = 0; i < lista.Count(); ++i) entradas += lista.Text(i) + "|";
  return entradas;
}

// The captions and tool tips of a window and its controls, between bars.
inline std::string TextosDe(const platform::Window& janela) {
  std::string textos = janela.Caption();
  for (const platform::Control* cada : ControlsOf(janela)) textos += "|" + cada->Caption() + cada->ToolTip();
  return textos;
}

// On a fresh machine each time: prepares, runs the operation with the n-th platform call failing, and looks at what is
// left; n = 1, 2, 3 ... until no call is left to fail, which is the last look. The returned number of faults tells that
// there were some.
template <typename Preparar, typename Operar, typename Conferir>
int ComCadaFalha(Preparar preparar, Operar operar, Conferir conferir) {
  for (int n = 1; n < 1000; ++n) {
    Maquina::Reiniciar();
    preparar();
    FailCall(n);
    operar();
    const bool falhou = CallFailed();
    FailCall(0);
    SCOPED_TRACE(testing::Message() << "platform call " << n << (falhou ? " failed" : " does not exist"));
    conferir();
    if (!falhou || testing::Test::HasFatalFailure()) return n - 1;
  }
  ADD_FAILURE() << "the faults never end";
  return 0;
}
