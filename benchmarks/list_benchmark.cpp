// Filling the list of the window with 10,000 games over the platform in memory, beside listing the files and filling a
// bare list with the same names.
#include <benchmark/benchmark.h>

#include "benchmarks/games.h"
#include "mainwindow/Form1.h"
#include "platform/files.h"

namespace {

using namespace benchmarks;

constexpr int Games = 10000;

void ListFill(benchmark::State& state) {
  if (!InstallGames(platform::ProgramDirectory() + "\\", Games)) return state.SkipWithError("no games");
  Form1 window;
  window.Show();
  for (auto _ : state) {
    window.CarregarLista(true);
    if (window.List1.Count() != Games || !window.Jogos.back().Catalogado) state.SkipWithError("not filled");
  }
}

void BareListFill(benchmark::State& state) {
  if (!InstallGames(platform::ProgramDirectory() + "\\", Games)) return state.SkipWithError("no games");
  platform::Window window({"bare", 7935, 4095});
  platform::ListBox list(window, {120, 240, 3615, 3570}, platform::ListBox::Order::Sorted);
  window.Show();
  for (auto _ : state) {
    const auto files = platform::ListDirectory(DirRoms, "*.zip;*.smc");
    list.Clear();
    for (int game = 0; game < Games; ++game) list.Add(NameOf(game));
    if (files.size() != Games || list.Count() != Games) state.SkipWithError("not filled");
  }
}

BENCHMARK(ListFill)->Name("list fill")->Unit(benchmark::kMillisecond);
BENCHMARK(BareListFill)->Name("list fill, bare")->Unit(benchmark::kMillisecond);

}  // namespace
