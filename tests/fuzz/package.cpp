// The reader of packages. Each input is used twice: as a package's content, and as the five pieces of a package to be
// written and read back.
#include <algorithm>
#include <array>
#include <iterator>
#include <string>

#include "package/pacote.h"
#include "platform/text.h"
#include "tests/fuzz/target.h"

namespace {

constexpr std::size_t LongestHeader = 10'240;

// What no text may hold that is to be read back as it was written.
constexpr std::array<std::string_view, 9> Reserved = {
    "NOME=", "NOMEDOS=", "CRC=", "IIMG=", "TIMG=", "IROM=", "TROM=", "\r\n", "|IMGROMDAT|"};

bool IsFree(std::string_view text) {
  const std::string upper = platform::CharUpperBuffA(std::string(text));
  return std::ranges::none_of(Reserved,
                              [&](std::string_view reserved) { return upper.find(reserved) != std::string::npos; });
}

// Writes these pieces and reads them: what comes back is what was written, or is refused where it has to be.
void WriteAndRead(std::string_view name, std::string_view dosName, std::string_view checksum, std::string_view picture,
                  std::string_view rom) {
  const std::string content = MontarPacote(name, dosName, checksum, std::ssize(picture), std::ssize(rom), picture, rom);
  const auto read = LerPacote(content);
  if (!IsFree(name) || !IsFree(dosName) || !IsFree(checksum)) return;
  const bool fits = content.size() - picture.size() - rom.size() <= LongestHeader;
  const bool complete = !picture.empty() && !rom.empty() && NomeSeguro(name) && NomeSeguro(dosName);
  Require(read.has_value() == (fits && complete));
  if (!read) return;
  Require(read->Nome == name && read->DOSName == dosName && read->CRC == checksum && read->Imagem == picture &&
          read->Rom == rom);
}

// A block that is no part of the content is found when it is written.
void ReadAsPackage(std::string_view content) {
  const auto read = LerPacote(content);
  if (!read) return;
  Require((read->Nome + read->DOSName).find_first_of(std::string_view("\\/:\r\n\0", 6)) == std::string::npos);
  WriteAndRead(read->Nome, read->DOSName, read->CRC, read->Imagem, read->Rom);
}

// The pieces end at line feeds, which no name holds; the last one is all the rest.
void ReadAsPieces(std::string_view input) {
  std::array<std::string_view, 4> pieces;
  for (std::string_view& piece : pieces) piece = TakeLine(input);
  WriteAndRead(pieces[0], pieces[1], pieces[2], pieces[3], input);
}

}  // namespace

void Test(std::string_view input) {
  ReadAsPackage(input);
  ReadAsPieces(input);
}
