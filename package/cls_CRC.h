// The checksum of a ROM file that a package carries.
#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

#include "platform/files.h"

class cls_CRC {
 public:
  // The checksum of an open file, which stays open: the sum of the CRC-32 values, as signed 32-bit numbers, that are
  // reached at the end of every chunk of 1,048,576 bytes and at the end of the file. Nothing when the file cannot be
  // read. Nothing either when its length is a multiple of the chunk's: such a ROM cannot be packed.
  std::optional<std::int64_t> CRC(platform::File& Filenr);

  // The same of a file's content.
  std::optional<std::int64_t> CRC(std::string_view Conteudo);

 private:
  std::int32_t Acrescentar(std::string_view Bytes);

  std::uint32_t registro_ = 0;  // carried from chunk to chunk
};

// The checksum as a package holds it: decimal digits, after a "-" when it is negative.
std::string TextoCRC(std::int64_t Valor);
