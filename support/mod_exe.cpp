#include "support/mod_exe.h"

#include <algorithm>
#include <string_view>

#include "platform/events.h"
#include "platform/processes.h"
#include "support/brancos.h"
#include "support/caminhos.h"

namespace {

std::uint32_t ClasseDePrioridade(int Prioridade) {
  switch (Prioridade) {
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

// Where an absolute path begins that stands at the beginning of the text or behind a blank or a quotation mark.
bool ComecaCaminho(const std::string& Texto, std::size_t Posicao) {
  return (Posicao == 0 || Texto[Posicao - 1] == ' ' || Texto[Posicao - 1] == '"') &&
         (Texto.compare(Posicao + 1, 2, ":\\") == 0 || Texto.compare(Posicao, 2, "\\\\") == 0);
}

// The command line up to its last backslash. Where that lies in an argument that is an absolute path, the directory is
// the argument's.
std::string DiretorioDoComando(const std::string& Comando) {
  std::string ate = DiretorioDe(Comando);
  for (std::size_t i = ate.size(); i-- > 0;) {
    if (ComecaCaminho(ate, i)) return ate.substr(i);
  }
  return ate;
}

struct Linha {
  std::string Programa, Argumentos;
};

// The program at the beginning of a command line, without its quotes, and what stands behind it.
Linha Separar(const std::string& Comando) {
  const std::size_t inicio = Comando.starts_with('"') ? 1 : 0;
  const std::size_t fim = std::min(Comando.find(inicio == 1 ? '"' : ' ', inicio), Comando.size());
  const std::string_view resto = std::string_view(Comando).substr(std::min(fim + 1, Comando.size()));
  return {Comando.substr(inicio, fim - inicio), std::string(SemBrancos(resto, " "))};
}

// What must run as an administrator is started by the shell, which asks the person; its priority is normal then.
platform::Process Iniciar(const std::string& Comando, int Prioridade, const std::string& Diretorio) {
  platform::Process processo = platform::CreateProcessA(Comando, ClasseDePrioridade(Prioridade), Diretorio);
  if (!processo.NeedsElevation()) return processo;
  const Linha linha = Separar(Comando);
  return platform::ShellExecuteExA("runas", linha.Programa, linha.Argumentos, Diretorio);
}

// A program that did not start is waited for once, like one that ends at once.
void EsperarFim(const platform::Process& Processo, std::uint32_t Intervalo) {
  do {
    platform::RunPendingEvents();
    if (!Processo.Started()) platform::Sleep(Intervalo);
  } while (!Processo.WaitForEnd(Intervalo));
}

}  // namespace

std::string Argumento(const std::string& Texto) {
  return Texto.find(' ') == std::string::npos ? Texto : '"' + Texto + '"';
}

bool ExecutarPrograma(const std::string& Comando, std::uint32_t Intervalo, bool Esperar, int Prioridade,
                      std::string& Diretorio) {
  if (Diretorio.empty()) Diretorio = DiretorioDoComando(Comando);
  const auto processo = Iniciar(Comando, Prioridade, Diretorio);
  if (Esperar) EsperarFim(processo, Intervalo);
  return processo.Started();
}
