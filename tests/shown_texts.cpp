// Prints every text that the programs show, for the checks of the translation, the guide and the documentation: a line
// each, fields separated by tabs, in code page 1252. A message: "message", its name, title, buttons, icon and pieces
// (CR LF written as "\n"). Any other text: "text" and the text.
#include <cstdio>
#include <string>

#include "autoconfig/FormCfg.h"
#include "controller/Form3.h"
#include "controller/teclas.h"
#include "mainwindow/Form1.h"
#include "platform/simulated/simulated.h"
#include "platform/text.h"
#include "savemanager/Form4.h"
#include "support/mensagens.h"
#include "support/textos.h"

namespace {

using namespace platform::simulated;

void PrintText(const std::string& text) {
  if (!text.empty()) std::printf("text\t%s\n", text.c_str());
}

void PrintMessage(const DescricaoDeMensagem& message) {
  constexpr const char* buttons[] = {"OK", "Yes/No/Cancel", "Retry/Cancel"};
  constexpr const char* icons[] = {"critical", "question", "exclamation", "information"};
  std::printf("message\t%s\t%s\t%s\t%s", std::string(message.Nome).c_str(), platform::FromUtf8(message.Titulo).c_str(),
              buttons[static_cast<int>(message.Botoes)], icons[static_cast<int>(message.Icone)]);
  for (const std::string_view piece : message.Pecas) {
    if (piece.empty()) continue;
    const std::string shown = piece == Peca::Linha ? "\\n" : piece == Peca::Paragrafo ? "\\n\\n" : std::string(piece);
    std::printf("\t%s", platform::FromUtf8(shown).c_str());
  }
  std::printf("\n");
}

void PrintWindow(const platform::Window& window) {
  PrintText(window.Caption());
  for (const platform::Control* control : ControlsOf(window)) {
    PrintText(control->Caption());
    PrintText(control->ToolTip());
  }
}

}  // namespace

int main() {
  for (const DescricaoDeMensagem& message : TodasAsMensagens()) PrintMessage(message);
  for (const std::string_view text : TodosOsTextos()) PrintText(platform::FromUtf8(text));
  for (const Tecla& key : Teclas) {
    PrintText(key.Botao);
    for (const char* name : key.Nomes) PrintText(name);
  }
  Reset();
  PrintWindow(Form1());
  PrintWindow(FormCfg());
  for (int i = 0; i < 2; ++i) QueueModal(PrintWindow);
  Form4::Mostrar();
  Form3::ABRIR();
  return 0;
}
