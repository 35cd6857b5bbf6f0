// The checksum of a ROM file, in turn with only reading that file in the same pieces.
#include <cstddef>
#include <cstdint>
#include <memory>
#include <string>
#include <vector>

#include "benchmarks/median.h"
#include "package/cls_CRC.h"
#include "platform/files.h"

namespace {

using namespace benchmarks;

constexpr int Rounds = 101;
constexpr std::size_t Length = (6 << 20) + 512;  // with the header that old copiers put before a ROM

struct alignas(4096) Piece {
  char Bytes[1 << 18];
};

std::string Path() { return platform::ProgramDirectory() + "\\checksum_benchmark.smc"; }

bool WriteRom() {
  std::string rom(Length, '\0');
  std::uint32_t state = 1;
  for (char& byte : rom) byte = static_cast<char>((state = state * 1'664'525 + 1'013'904'223) >> 24);
  return platform::File(Path(), platform::Access::ReadWrite).Write(0, rom);
}

bool OnlyRead() {
  platform::File file(Path(), platform::Access::Read);
  const auto piece = std::make_unique_for_overwrite<Piece>();
  std::int64_t position = 0;
  for (std::int64_t read; (read = file.Read(position, piece->Bytes, sizeof piece->Bytes)) > 0;) position += read;
  return position == static_cast<std::int64_t>(Length);
}

bool Checksum() {
  platform::File file(Path(), platform::Access::Read);
  return cls_CRC().CRC(file).has_value();
}

bool Time(bool (*run)(), std::vector<double>& times) {
  const Stopwatch watch;
  const bool done = run();
  times.push_back(watch.Milliseconds());
  return done;
}

}  // namespace

int main() {
  std::vector<double> checksum, read;
  bool done = WriteRom();
  for (int round = 0; done && round < Rounds; ++round) done = Time(OnlyRead, read) && Time(Checksum, checksum);
  platform::DeleteFileA(Path());
  if (!done) return 1;
  Tell("checksum of a file", checksum);
  Tell("checksum of a file, only reading", read);
  return 0;
}
