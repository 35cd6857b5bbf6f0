#include "autoconfig/procura.h"

#include <algorithm>
#include <array>
#include <iterator>
#include <utility>

#include "platform/environment.h"
#include "platform/files.h"
#include "platform/text.h"
#include "platform/wildcards.h"
#include "support/mod_Arquivos.h"
#include "support/mod_Globais.h"

namespace {

constexpr std::array Executaveis = {"zsnesw.exe", "zsnes.exe"};
constexpr int NiveisDoPrograma = 3, NiveisDeProgramas = 2, NiveisDaRaiz = 3;
constexpr const char* NomesDeEmuladores = "ZSNES*;EMU*";
constexpr std::array VariaveisDeProgramas = {"ProgramFiles", "ProgramFiles(x86)", "ProgramW6432"};
constexpr int MaisDiretorios = 3000;  // at each place

std::string ComBarra(std::string Diretorio) {
  if (!Diretorio.ends_with('\\')) Diretorio += '\\';
  return Diretorio;
}

// What stands between semicolons, without quotes and blanks around it.
std::vector<std::string> Partes(const std::string& Texto) {
  std::vector<std::string> Achadas;
  for (std::size_t Inicio = 0; Inicio < Texto.size();) {
    const std::size_t Fim = std::min(Texto.find(';', Inicio), Texto.size());
    const auto Primeiro = Texto.find_first_not_of(" \"", Inicio);
    if (Primeiro < Fim) {
      Achadas.push_back(Texto.substr(Primeiro, Texto.find_last_not_of(" \"", Fim - 1) - Primeiro + 1));
    }
    Inicio = Fim + 1;
  }
  return Achadas;
}

bool TemUm(const std::string& Nome, const std::string& Padroes) {
  return platform::MatchesAnyPattern(platform::CharUpperBuffA(Nome), Padroes);
}

bool ComecaComUm(const std::string& Caminho, const std::vector<std::string>& Raizes) {
  const std::string Raiz = platform::CharUpperBuffA(Caminho.substr(0, 3));
  return std::find(Raizes.begin(), Raizes.end(), Raiz) != Raizes.end();
}

// Behind the root, the directories in which programs are installed.
std::vector<std::string> PastasDeProgramas() {
  std::vector<std::string> Pastas;
  for (const char* Variavel : VariaveisDeProgramas) {
    const std::string Caminho = platform::GetEnvironmentVariableA(Variavel);
    if (Caminho.size() > 3 && Caminho.compare(1, 2, ":\\") == 0) Pastas.push_back(ComBarra(Caminho.substr(3)));
  }
  return Pastas;
}

}  // namespace

// A directory of the PATH in a network is left out: it can take very long to answer.
std::vector<Lugar> LugaresUsuais() {
  std::vector<Lugar> Lugares = {{DirPrograma, NiveisDoPrograma}};
  const std::vector<std::string> Raizes = platform::FixedDrives();
  const std::vector<std::string> Pastas = PastasDeProgramas();
  for (const std::string& Raiz : Raizes) {
    for (const std::string& Pasta : Pastas) Lugares.push_back({Raiz + Pasta, NiveisDeProgramas});
    Lugares.push_back({Raiz, NiveisDaRaiz, NomesDeEmuladores});
  }
  for (const std::string& Parte : Partes(platform::GetEnvironmentVariableA("PATH"))) {
    if (ComecaComUm(Parte, Raizes)) Lugares.push_back({ComBarra(Parte), 0});
  }
  return Lugares;
}

Procura::Procura(std::vector<Lugar> Lugares)
    : Faltam(std::make_move_iterator(Lugares.begin()), std::make_move_iterator(Lugares.end())) {}

std::vector<std::string> Procura::Passo() {
  if (Fila.empty()) {
    if (Faltam.empty()) return {};
    Fila.push_back(std::move(Faltam.front()));
    Faltam.pop_front();
    Resto = MaisDiretorios;
  }
  const Lugar Atual = std::move(Fila.front());
  Fila.pop_front();
  const auto [Visto, Novo] = Vistos.try_emplace(platform::CharUpperBuffA(Atual.Diretorio), Atual.Niveis);
  if (!Novo && Visto->second >= Atual.Niveis) return {};
  Visto->second = Atual.Niveis;
  Descer(Atual);
  if (!Novo) return {};
  std::vector<std::string> Achados;
  for (const char* Executavel : Executaveis) {
    if (ArquivoExiste(Atual.Diretorio + Executavel)) Achados.push_back(Atual.Diretorio + Executavel);
  }
  return Achados;
}

// The likeliest names first: where there are very many directories the last ones are not looked into.
void Procura::Descer(const Lugar& Atual) {
  if (Atual.Niveis == 0) return;
  std::vector<std::string> Nomes = platform::ListSubdirectories(Atual.Diretorio);
  std::stable_partition(Nomes.begin(), Nomes.end(),
                        [](const std::string& Nome) { return TemUm(Nome, NomesDeEmuladores); });
  for (const std::string& Nome : Nomes) {
    if (!TemUm(Nome, Atual.Nomes)) continue;
    if (Resto-- <= 0) return;
    Fila.push_back({Atual.Diretorio + Nome + '\\', Atual.Niveis - 1});
  }
}
