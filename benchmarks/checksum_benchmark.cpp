// The CRC-32 of a ROM in memory beside zlib's.
#include <benchmark/benchmark.h>
#include <zlib.h>

#include <algorithm>
#include <random>
#include <string>

#include "package/crc32.h"

namespace {

const std::string& Rom() {
  static const std::string rom = [] {
    std::mt19937 random(1);
    std::string bytes(6 << 20, '\0');
    std::ranges::generate(bytes, [&] { return static_cast<char>(random()); });
    return bytes;
  }();
  return rom;
}

void Checksum(benchmark::State& state) {
  for (auto _ : state) benchmark::DoNotOptimize(~CRC32::Atualizar(CRC32::Inicial, Rom()));
}

void ByTables(benchmark::State& state) {
  for (auto _ : state) benchmark::DoNotOptimize(~CRC32::AtualizarPorFatias(CRC32::Inicial, Rom()));
}

void Zlib(benchmark::State& state) {
  for (auto _ : state) {
    benchmark::DoNotOptimize(::crc32(0, reinterpret_cast<const Bytef*>(Rom().data()), static_cast<uInt>(Rom().size())));
  }
}

BENCHMARK(Checksum)->Name("checksum in memory")->Unit(benchmark::kMicrosecond);
BENCHMARK(ByTables)->Name("checksum in memory by tables")->Unit(benchmark::kMicrosecond);
BENCHMARK(Zlib)->Name("zlib's crc32")->Unit(benchmark::kMicrosecond);

}  // namespace
