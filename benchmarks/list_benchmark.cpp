// Filling the list of the window with 10,000 and 100,000 games over the platform in memory, beside listing 10,000 files
// and filling a bare list with the same names.
#include <benchmark/benchmark.h>

#include "benchmarks/games.h"
#include "catalog/cls_DAT.h"
#include "mainwindow/Form1.h"
#include "platform/files.h"

namespace {

using namespace benchmarks;

constexpr int Games = 10000;

void ListFill(benchmark::State& state) {
  const auto games = static_cast<int>(state.range(0));
  if (!InstallGames(platform::ProgramDirectory() + "\\", games)) return state.SkipWithError("no games");
  Catalogo().Fechar();  // it is another one than that of the last measurement
  Form1 window;
  window.Show();
  for (auto _ : state) {
    window.CarregarLista(true);
    if (window.List1.Count() != games || !window.Jogos.back().Catalogado) state.SkipWithError("not filled");
  }
}

void BareListFill(benchmark::State& state) {
  if (!InstallGames(platform::ProgramDirectory() + "\\", Games)) return state.SkipWithError("no games");
  platform::Window window({"bare", 7935, 4095});
  platform::ListBox list(window, {120, 240, 3615, 3570}, platform::ListBox::Order::Sorted);
  window.Show();
  std::vector<std::string> names;
  for (int game = 0; game < Games; ++game) names.push_back(NameOf(game));
  for (auto _ : state) {
    const auto files = platform::ListDirectory(DirRoms, "*.zip;*.smc");
    list.Fill(names);
    if (files.size() != Games || list.Count() != Games) state.SkipWithError("not filled");
  }
}

BENCHMARK(ListFill)->Name("list fill")->Arg(10'000)->Arg(100'000)->Unit(benchmark::kMillisecond);
BENCHMARK(BareListFill)->Name("list fill, bare")->Unit(benchmark::kMillisecond);

}  // namespace
