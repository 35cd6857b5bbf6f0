#include "autoconfig/procura.h"

#include <algorithm>
#include <array>
#include <iterator>
#include <string_view>
#include <utility>

#include "autoconfig/programa_dos.h"
#include "platform/environment.h"
#include "platform/files.h"
#include "platform/text.h"
#include "platform/wildcards.h"
#include "support/brancos.h"
#include "support/caminhos.h"
#include "support/caracteres.h"
#include "support/mod_Arquivos.h"
#include "support/mod_Globais.h"

namespace {

constexpr std::array Executaveis = {"zsnesw.exe", "zsnes.exe"};
constexpr int NiveisDoPrograma = 3, NiveisDeProgramas = 2, NiveisDaRaiz = 3;
constexpr const char* NomesDeEmuladores = "ZSNES*;EMU*";
constexpr std::array VariaveisDeProgramas = {"ProgramFiles", "ProgramFiles(x86)", "ProgramW6432"};
constexpr int MaisDiretorios = 3000;  // at each place

// What stands between semicolons, without quotes and blanks around it.
std::vector<std::string> Partes(std::string_view Texto) {
  std::vector<std::string> achadas;
  for (std::size_t inicio = 0; inicio < Texto.size();) {
    const std::size_t fim = std::min(Texto.find(';', inicio), Texto.size());
    const std::string_view parte = SemBrancos(Texto.substr(inicio, fim - inicio), " \"");
    if (!parte.empty()) achadas.emplace_back(parte);
    inicio = fim + 1;
  }
  return achadas;
}

bool TemUm(const std::string& Nome, const std::string& Padroes) {
  return platform::MatchesAnyPattern(platform::CharUpperBuffA(Nome), Padroes);
}

bool ComecaComUm(const std::string& Caminho, const std::vector<std::string>& Raizes) {
  const std::string raiz = platform::CharUpperBuffA(Caminho.substr(0, 3));
  return std::find(Raizes.begin(), Raizes.end(), raiz) != Raizes.end();
}

// Behind the root, the directories in which programs are installed.
std::vector<std::string> PastasDeProgramas() {
  std::vector<std::string> pastas;
  for (const char* variavel : VariaveisDeProgramas) {
    const std::string caminho = platform::GetEnvironmentVariableA(variavel);
    if (caminho.size() > 3 && caminho.compare(1, 2, ":\\") == 0) pastas.push_back(ComBarra(caminho.substr(3)));
  }
  return pastas;
}

}  // namespace

// A directory of the PATH in a network is left out: it can take very long to answer.
std::vector<Lugar> LugaresUsuais() {
  std::vector<Lugar> lugares = {{DirPrograma, NiveisDoPrograma}};
  const std::vector<std::string> raizes = platform::FixedDrives();
  const std::vector<std::string> pastas = PastasDeProgramas();
  for (const std::string& raiz : raizes) {
    for (const std::string& pasta : pastas) lugares.push_back({raiz + pasta, NiveisDeProgramas});
    lugares.push_back({raiz, NiveisDaRaiz, NomesDeEmuladores});
  }
  for (const std::string& parte : Partes(platform::GetEnvironmentVariableA("PATH"))) {
    if (ComecaComUm(parte, raizes)) lugares.push_back({ComBarra(parte), 0});
  }
  return lugares;
}

Procura::Procura(std::vector<Lugar> Lugares)
    : faltam_(std::make_move_iterator(Lugares.begin()), std::make_move_iterator(Lugares.end())) {}

std::vector<std::string> Procura::Passo() {
  if (fila_.empty()) {
    if (faltam_.empty()) return {};
    fila_.push_back(std::move(faltam_.front()));
    faltam_.pop_front();
    resto_ = MaisDiretorios;
  }
  const Lugar atual = std::move(fila_.front());
  fila_.pop_front();
  const auto [visto, novo] = vistos_.try_emplace(platform::CharUpperBuffA(atual.Diretorio), atual.Niveis);
  if (!novo && visto->second >= atual.Niveis) return {};
  visto->second = atual.Niveis;
  Descer(atual);
  if (!novo) return {};
  std::vector<std::string> achados;
  for (const char* executavel : Executaveis) {
    const std::string caminho = atual.Diretorio + executavel;
    if (ArquivoExiste(caminho) && !EhProgramaDoDos(caminho)) achados.push_back(caminho);
  }
  return achados;
}

// The likeliest names first: where there are very many directories the last ones are not looked into.
void Procura::Descer(const Lugar& Atual) {
  if (Atual.Niveis == 0) return;
  std::vector<std::string> nomes = platform::ListSubdirectories(Atual.Diretorio);
  std::stable_partition(nomes.begin(), nomes.end(),
                        [](const std::string& Nome) { return TemUm(Nome, NomesDeEmuladores); });
  for (const std::string& nome : nomes) {
    if (!TemUm(nome, Atual.Nomes)) continue;
    if (resto_-- <= 0) return;
    fila_.push_back({Atual.Diretorio + nome + '\\', Atual.Niveis - 1});
  }
}
