// What the tests of the program's logic share: a fresh machine in memory, what its person has seen, and an operation
// with each of its platform calls failing in turn.
#pragma once

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "platform/simulated/simulated.h"
#include "platform/text.h"
#include "support/gravacao.h"
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

// Once the hour is over in which another program may still be writing: deletes what was left half written in these
// directories, and says what is left all the same.
inline Textos Restos(const Textos& diretorios) {
  PassTime(3601);
  for (const std::string& diretorio : diretorios) ApagarRestos(diretorio);
  Textos restos = AllFiles();
  std::erase_if(restos, [](const std::string& arquivo) { return !arquivo.ends_with(".novo~"); });
  return restos;
}

// On a fresh machine each time: prepares, runs the operation with the n-th platform call failing in this way, and looks
// at what is left; n = 1, 2, 3 ... until no call is left to fail, which is the last look. The returned number of faults
// tells that there were some.
template <typename Preparar, typename Operar, typename Conferir>
int ComCadaFalha(Fault falha, Preparar preparar, Operar operar, Conferir conferir) {
  for (int n = 1; n < 1000; ++n) {
    Maquina::Reiniciar();
    preparar();
    FailCall(n, falha);
    operar();
    const bool falhou = CallFailed();
    FailCall(0);
    constexpr const char* como[] = {" failed", " and all later ones failed", " met a power cut"};
    SCOPED_TRACE(testing::Message() << "platform call " << n << (falhou ? como[static_cast<int>(falha)] : " is none"));
    conferir();
    if (!falhou || testing::Test::HasFatalFailure()) return n - 1;
  }
  ADD_FAILURE() << "the faults never end";
  return 0;
}

// The same with each kind of failure; the number of those that failed once.
template <typename Preparar, typename Operar, typename Conferir>
int ComCadaFalha(Preparar preparar, Operar operar, Conferir conferir) {
  ComCadaFalha(Fault::FromThenOn, preparar, operar, conferir);
  ComCadaFalha(Fault::PowerCut, preparar, operar, conferir);
  return ComCadaFalha(Fault::Once, preparar, operar, conferir);
}
