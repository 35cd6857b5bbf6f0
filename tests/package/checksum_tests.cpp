// The checksum of a ROM; and below it every way through the CRC-32 against the plain one, a table look-up for each
// byte.
#include <algorithm>
#include <random>

#include "package/cls_CRC.h"
#include "package/crc32.h"
#include "tests/fresh_machine.h"

namespace {

constexpr std::size_t ChunkSize = 1'048'576;
const std::string Path = "C:\\Roms\\JOGO.ZIP";

TEST(Checksum, AddsTheValuesAtTheEndOfEveryChunk) {
  const struct {
    const char* Name;
    std::string Content, Text;
  } cases[] = {
      {"the nine digits", "123456789", "-873187034"},
      {"a value above zero", "abc", "891568578"},
      {"a chunk and a byte", std::string(ChunkSize + 1, '\0'), "-2451737276"},
      {"two chunks and a piece", std::string(2 * ChunkSize + 512, '\xFF'), "-3555091706"},
      {"no bytes", "", "none"},
      {"two whole chunks", std::string(2 * ChunkSize, 'x'), "none"},
  };
  Reset();
  cls_CRC sum;  // the same for all: nothing is left from one file to the next
  for (const auto& [name, content, text] : cases) {
    PutFile(Path, content);
    platform::File file(Path, platform::Access::Read);
    for (const auto& value : {sum.CRC(file), sum.CRC(content)}) {
      EXPECT_EQ(value ? TextoCRC(*value) : "none", text) << name;
    }
    EXPECT_TRUE(file.IsOpen());
  }
}

// The register is all that is carried on, so any register stands for bytes that another way has taken before.
TEST(Crc32, AllWaysAgreeOnEveryLengthWhateverTheAlignmentAndTheRegister) {
  std::vector ways = {CRC32::Atualizar, CRC32::AtualizarPorFatias};
  if (CRC32::TemMultiplicacao()) ways.push_back(CRC32::AtualizarPorDobras);
  std::mt19937 random(1);
  std::string bytes(3'000, '\0');
  std::ranges::generate(bytes, [&] { return static_cast<char>(random()); });
  for (const auto way : ways) {
    for (std::size_t length = 0; length < bytes.size() - 16; ++length) {
      const std::string_view part = std::string_view(bytes).substr(random() % 16, length);
      const auto start = static_cast<std::uint32_t>(random());
      ASSERT_EQ(way(start, part), CRC32::AtualizarPorByte(start, part)) << length;
    }
  }
}

}  // namespace
