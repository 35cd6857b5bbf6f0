#include "platform/windows/whole_file.h"

#include <cstdint>
#include <cstdlib>

#include "platform/windows/pixels.h"

namespace platform {
namespace {

std::uint32_t Byte(std::string_view content, std::size_t at) { return static_cast<unsigned char>(content[at]); }

std::uint32_t Little(std::string_view content, std::size_t at, std::size_t bytes) {
  std::uint32_t value = 0;
  for (std::size_t i = bytes; i-- > 0;) value = value << 8 | Byte(content, at + i);
  return value;
}

std::int64_t Signed(std::uint32_t value) { return static_cast<std::int32_t>(value); }

}  // namespace

bool BmpIsWhole(std::string_view content) {
  constexpr std::size_t CoreHeader = 12, InfoHeader = 40, Header = 14;
  if (content.size() < Header + CoreHeader) return false;
  const std::int64_t start = Little(content, 10, 4);
  const bool core = Little(content, Header, 4) == CoreHeader;
  if (!core && content.size() < Header + InfoHeader) return false;
  const std::int64_t width = core ? Little(content, 18, 2) : Signed(Little(content, 18, 4));
  const std::int64_t height = std::llabs(core ? Little(content, 20, 2) : Signed(Little(content, 22, 4)));
  const std::int64_t bits = Little(content, core ? 24 : 28, 2);
  if (width <= 0 || width > MostPixels || height <= 0 || width * height > MostPixels || bits > 64) return false;

  const std::uint32_t compression = core ? 0 : Little(content, 30, 4);
  const bool runs = compression == 1 || compression == 2;
  const std::int64_t length = runs ? Little(content, 34, 4) : (width * bits + 31) / 32 * 4 * height;
  return start + length <= static_cast<std::int64_t>(content.size());
}

// Goes from marker to marker up to the one that ends the picture.
bool JpegIsWhole(std::string_view content) {
  constexpr std::uint32_t EndOfImage = 0xD9, StartOfScan = 0xDA, FirstRestart = 0xD0, LastRestart = 0xD7;
  for (std::size_t at = 2; at + 1 < content.size();) {
    if (Byte(content, at) != 0xFF) return false;
    const std::uint32_t marker = Byte(content, ++at);
    if (marker == EndOfImage) return true;
    if (marker == 0xFF) continue;  // filling
    ++at;
    if (at + 2 > content.size()) return false;
    const std::size_t length = Byte(content, at) << 8 | Byte(content, at + 1);
    if (length < 2) return false;
    at += length;
    if (marker != StartOfScan) continue;
    // In the scan's data an FF is part of the data before a zero, and before the markers between its pieces.
    for (; at + 1 < content.size(); ++at) {
      const std::uint32_t next = Byte(content, at + 1);
      if (Byte(content, at) == 0xFF && next != 0 && (next < FirstRestart || next > LastRestart)) break;
    }
  }
  return false;
}

}  // namespace platform
