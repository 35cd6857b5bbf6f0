// Pictures are looked through far enough to tell whole ones from damaged ones; no pixel is made of them.
#include "platform/pictures.h"

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <iterator>
#include <memory>
#include <string>

#include "platform/simulated/machine.h"
#include "platform/simulated/pictures.h"
#include "resources/ids.h"

namespace platform {
namespace {

constexpr std::uint64_t MostPixels = 64'000'000;

// Reads numbers from front to back; what lies beyond the end makes it fail for good.
class Reader {
 public:
  explicit Reader(std::string_view bytes) : rest_(bytes) {}

  bool Failed() const { return failed_; }

  std::uint32_t Byte() {
    if (rest_.empty()) return Fail();
    const auto byte = static_cast<unsigned char>(rest_.front());
    rest_.remove_prefix(1);
    return byte;
  }

  std::uint32_t Low16() {
    const std::uint32_t low = Byte();
    return low | Byte() << 8;
  }
  std::uint32_t Low32() {
    const std::uint32_t low = Low16();
    return low | Low16() << 16;
  }
  std::uint32_t High16() {
    const std::uint32_t high = Byte();
    return high << 8 | Byte();
  }

  void Skip(std::uint64_t count) {
    if (count > rest_.size()) {
      Fail();
    } else {
      rest_.remove_prefix(static_cast<std::size_t>(count));
    }
  }

 private:
  std::uint32_t Fail() {
    failed_ = true;
    rest_ = {};
    return 0;
  }

  std::string_view rest_;
  bool failed_ = false;
};

bool AreFine(std::uint64_t width, std::uint64_t height) {
  return width > 0 && height > 0 && width <= MostPixels && height <= MostPixels && width * height <= MostPixels;
}

std::uint64_t Magnitude(std::uint32_t number) { return number < 0x80000000u ? number : 0x100000000u - number; }

bool IsWholeBitmap(std::string_view content) {
  Reader reader(content);
  reader.Skip(10);
  const std::uint32_t pixels = reader.Low32(), headerSize = reader.Low32();
  const bool old = headerSize == 12;
  if (!old && headerSize < 40) return false;
  const std::uint64_t width = old ? reader.Low16() : reader.Low32();
  const std::uint64_t height = old ? reader.Low16() : Magnitude(reader.Low32());
  reader.Skip(2);
  const std::uint64_t bits = reader.Low16();
  const std::uint32_t compression = old ? 0 : reader.Low32();
  if (reader.Failed() || !AreFine(width, height) || bits == 0 || bits > 32 || pixels > content.size()) return false;
  if (compression == 1 || compression == 2) return pixels < content.size();
  return (width * bits + 31) / 32 * 4 * height <= content.size() - pixels;
}

void SkipColours(Reader& reader, std::uint32_t flags) {
  if ((flags & 0x80) != 0) reader.Skip(3u << ((flags & 7) + 1));
}

void SkipBlocks(Reader& reader) {
  while (const std::uint32_t length = reader.Byte()) reader.Skip(length);
}

bool HasWholeImage(Reader& reader) {
  reader.Skip(4);
  const std::uint32_t width = reader.Low16(), height = reader.Low16();
  SkipColours(reader, reader.Byte());
  reader.Skip(1);
  SkipBlocks(reader);
  return !reader.Failed() && AreFine(width, height);
}

// What follows the first image is never shown, and may be missing.
bool IsWholeGif(std::string_view content) {
  Reader reader(content);
  reader.Skip(10);
  const std::uint32_t flags = reader.Byte();
  reader.Skip(2);
  SkipColours(reader, flags);
  while (!reader.Failed()) {
    const std::uint32_t kind = reader.Byte();
    if (kind == 0x2C) return HasWholeImage(reader);
    if (kind != 0x21) return false;
    reader.Skip(1);
    SkipBlocks(reader);
  }
  return false;
}

bool IsFrameHeader(std::uint32_t marker) {
  return marker >= 0xC0 && marker <= 0xCF && marker != 0xC4 && marker != 0xC8 && marker != 0xCC;
}

// Whether the compressed data ends with the end marker.
bool EndsInTime(Reader& reader) {
  for (std::uint32_t before = 0; !reader.Failed();) {
    const std::uint32_t byte = reader.Byte();
    if (before == 0xFF && byte == 0xD9) return true;
    before = byte;
  }
  return false;
}

std::uint32_t Marker(Reader& reader) {
  if (reader.Byte() != 0xFF) return 0;
  std::uint32_t marker = 0xFF;
  while (marker == 0xFF) marker = reader.Byte();
  return marker;
}

bool IsWholeJpeg(std::string_view content) {
  Reader reader(content);
  reader.Skip(2);
  bool sized = false;
  while (const std::uint32_t marker = Marker(reader)) {
    const std::uint32_t length = reader.High16();
    std::uint32_t passed = 2;
    if (IsFrameHeader(marker)) {
      reader.Skip(1);
      const std::uint32_t height = reader.High16(), width = reader.High16();
      if (!AreFine(width, height)) return false;
      sized = true;
      passed += 5;
    }
    if (length < passed) return false;
    reader.Skip(length - passed);
    if (marker == 0xDA) return sized && EndsInTime(reader);
  }
  return false;
}

bool IsWhole(std::string_view content) {
  if (content.starts_with("BM")) return IsWholeBitmap(content);
  if (content.starts_with("GIF87a") || content.starts_with("GIF89a")) return IsWholeGif(content);
  return content.starts_with("\xFF\xD8") && IsWholeJpeg(content);
}

}  // namespace

Picture LoadPicture(std::string_view content) {
  if (simulated::Fails() || !IsWhole(content)) return {};
  return Picture(std::make_shared<const PictureData>(PictureData{0, std::string(content)}));
}

Picture LoadPictureResource(int id) {
  constexpr int pictures[] = {FIGURA_PREVIA, FIGURA_CONTROLE, FIGURA_EXCLUIR};
  if (std::find(std::begin(pictures), std::end(pictures), id) == std::end(pictures)) return {};
  return Picture(std::make_shared<const PictureData>(PictureData{id, ""}));
}

}  // namespace platform

namespace platform::simulated {

int ResourceOf(const Picture& picture) { return picture ? picture.Data()->Resource : 0; }

std::string ContentOf(const Picture& picture) { return picture ? picture.Data()->Content : ""; }

}  // namespace platform::simulated
