// Both lookups of the catalogue for every game, as a refill of the list asks for them.
#include <benchmark/benchmark.h>

#include <string>
#include <vector>

#include "benchmarks/games.h"
#include "catalog/busca.h"
#include "catalog/cls_DAT.h"
#include "platform/files.h"
#include "platform/text.h"

namespace {

using namespace benchmarks;

std::vector<std::string> DOSNames(int games) {
  std::vector<std::string> names;
  for (int game = 0; game < games; ++game) names.push_back(DOSNameOf(game));
  return names;
}

// Loading the file and building the index are part of the time.
void Index(benchmark::State& state) {
  const int games = static_cast<int>(state.range(0));
  DirPrograma = platform::ProgramDirectory() + "\\";
  if (GravarArquivo(DirPrograma + "tolvaris.dat", CatalogueOf(games), 1, true) != 1) {
    state.SkipWithError("no catalogue");
    return;
  }
  const std::vector<std::string> dosNames = DOSNames(games);
  for (auto _ : state) {
    cls_DAT catalogue;
    catalogue.Carregar();
    for (const std::string& each : dosNames) {
      Booleano found = Falso;
      const std::string name = catalogue.DefineNome(each, found);
      const std::string dosName = catalogue.DefineDOSName(name);
      if (found == Falso || dosName.size() != 8) state.SkipWithError("not found");
    }
  }
}

void PlainSearch(benchmark::State& state) {
  const int games = static_cast<int>(state.range(0));
  const std::string data = CatalogueOf(games);
  const std::vector<std::string> dosNames = DOSNames(games);
  for (auto _ : state) {
    for (const std::string& each : dosNames) {
      const std::string name(BuscarNome(data, platform::CharUpperBuffA(each)).value_or(""));
      const std::string dosName(BuscarChave(data, name).value_or(""));
      if (dosName.size() != 8) state.SkipWithError("not found");
    }
  }
}

BENCHMARK(Index)->Name("catalogue index")->Arg(10000)->Arg(100000)->Unit(benchmark::kMillisecond);
BENCHMARK(PlainSearch)->Name("catalogue plain search")->Arg(10000)->Unit(benchmark::kMillisecond);

}  // namespace
