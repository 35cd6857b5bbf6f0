// The checksum of a ROM file beside only reading it in the same pieces: one line each with the name, a tab and the
// median time in milliseconds. The file lies in the current directory and is deleted at the end.
#include <algorithm>
#include <chrono>
#include <cstddef>
#include <cstdint>
#include <cstdio>
#include <memory>
#include <string>
#include <vector>

#include "package/cls_CRC.h"
#include "platform/files.h"

namespace {

constexpr int Rounds = 101;
constexpr std::size_t Length = (6 << 20) + 512;  // with the header that old copiers put before a ROM
const char* const Path = "checksum_benchmark.smc";

struct alignas(4096) Piece {
  char Bytes[1 << 20];
};

bool WriteRom() {
  std::string rom(Length, '\0');
  std::uint32_t state = 1;
  for (char& byte : rom) byte = static_cast<char>((state = state * 1'664'525 + 1'013'904'223) >> 24);
  return platform::File(Path, platform::Access::ReplaceContent).Write(0, rom);
}

bool OnlyRead() {
  platform::File file(Path, platform::Access::Read);
  const auto piece = std::make_unique_for_overwrite<Piece>();
  std::int64_t position = 0;
  for (std::int64_t read; (read = file.Read(position, piece->Bytes, sizeof piece->Bytes)) > 0;) position += read;
  return position == static_cast<std::int64_t>(Length);
}

bool Checksum() {
  platform::File file(Path, platform::Access::Read);
  return cls_CRC().CRC(file).has_value();
}

// Adds the milliseconds that one run takes.
bool Time(bool (*run)(), std::vector<double>& times) {
  const auto start = std::chrono::steady_clock::now();
  const bool done = run();
  times.push_back(std::chrono::duration<double, std::milli>(std::chrono::steady_clock::now() - start).count());
  return done;
}

double Median(std::vector<double> times) {
  std::ranges::nth_element(times, times.begin() + Rounds / 2);
  return times[Rounds / 2];
}

}  // namespace

int main() {
  std::vector<double> checksum, read;
  bool done = WriteRom();
  for (int round = 0; done && round < Rounds; ++round) done = Time(OnlyRead, read) && Time(Checksum, checksum);
  platform::DeleteFileA(Path);
  if (!done) {
    std::puts("the file cannot be written or read");
    return 1;
  }
  std::printf("checksum of a file\t%.3f\nonly reading it\t%.3f\n", Median(checksum), Median(read));
  return 0;
}
