#include "support/mod_exe.h"

#include "platform/events.h"
#include "platform/processes.h"
#include "support/caminhos.h"

namespace {

std::uint32_t ClasseDePrioridade(int prioridade) {
  switch (prioridade) {
    case 1:
      return platform::PriorityIdle;
    case 3:
      return platform::PriorityHigh;
    case 4:
      return platform::PriorityRealtime;
    default:
      return platform::PriorityNormal;
  }
}

// Where an absolute path begins that stands at the beginning of the text or behind a blank.
bool ComecaCaminho(const std::string& texto, std::size_t posicao) {
  return (posicao == 0 || texto[posicao - 1] == ' ') &&
         (texto.compare(posicao + 1, 2, ":\\") == 0 || texto.compare(posicao, 2, "\\\\") == 0);
}

// The command line up to its last backslash. Where that lies in an argument that is an absolute path, the directory is
// the argument's.
std::string DiretorioDoComando(const std::string& comando) {
  std::string ate = DiretorioDe(comando);
  for (std::size_t i = ate.size(); i-- > 0;) {
    if (ComecaCaminho(ate, i)) return ate.substr(i);
  }
  return ate;
}

// A program that did not start is waited for once, like one that ends at once.
void EsperarFim(const platform::Process& processo, std::uint32_t intervalo) {
  do {
    platform::RunPendingEvents();
    if (!processo.Started()) platform::Sleep(intervalo);
  } while (!processo.WaitForEnd(intervalo));
}

}  // namespace

bool ExecutarPrograma(const std::string& Comando, std::uint32_t Intervalo, bool Esperar, int Prioridade,
                      std::string& Diretorio) {
  if (Diretorio.empty()) Diretorio = DiretorioDoComando(Comando);
  const auto processo = platform::CreateProcessA(Comando, ClasseDePrioridade(Prioridade), Diretorio);
  if (Esperar) EsperarFim(processo, Intervalo);
  return processo.Started();
}
