#include "platform/picture_file.h"

#include <algorithm>
#include <cstdlib>
#include <iterator>

namespace platform {
namespace {

// Reads from front to back; what lies beyond the end makes it fail for good, and zero is read there.
class Reader {
 public:
  explicit Reader(std::string_view content) : content_(content) {}

  bool Failed() const { return failed_; }
  std::size_t Position() const { return position_; }

  std::string_view Take(std::size_t count) {
    if (count > content_.size() - position_) {
      failed_ = true;
      position_ = content_.size();
      return {};
    }
    position_ += count;
    return content_.substr(position_ - count, count);
  }

  std::uint32_t Byte() { return High(1); }

  std::uint32_t Low(std::size_t bytes) {  // the lowest byte comes first
    const std::string_view taken = Take(bytes);
    std::uint32_t value = 0;
    for (std::size_t i = taken.size(); i-- > 0;) value = value << 8 | static_cast<unsigned char>(taken[i]);
    return value;
  }

  std::uint32_t High(std::size_t bytes) {  // the highest byte comes first
    std::uint32_t value = 0;
    for (const char byte : Take(bytes)) value = value << 8 | static_cast<unsigned char>(byte);
    return value;
  }

  void SkipPast(char byte) {
    const std::size_t found = content_.find(byte, position_);
    Take(found == std::string_view::npos ? found : found - position_ + 1);
  }

 private:
  std::string_view content_;
  std::size_t position_ = 0;
  bool failed_ = false;
};

struct Frame {
  std::int64_t Width = 0, Height = 0;  // pixels
  std::size_t Length = 0;              // as PictureFile has it
};

bool IsSane(const Frame& frame) {
  return frame.Width > 0 && frame.Height > 0 && frame.Width <= MostSide && frame.Height <= MostSide &&
         frame.Width * frame.Height <= MostPixels;
}

void SkipColours(Reader& reader, std::uint32_t flags) {
  if ((flags & 0x80) != 0) reader.Take(std::size_t{3} << ((flags & 7) + 1));
}

// Pieces of up to 255 bytes, each behind its length, up to the empty one.
void SkipPieces(Reader& reader) {
  while (const std::uint32_t length = reader.Byte()) reader.Take(length);
}

std::optional<Frame> ReadGifImage(Reader& reader) {
  reader.Take(4);  // its place on the screen
  Frame frame;
  frame.Width = reader.Low(2);
  frame.Height = reader.Low(2);
  SkipColours(reader, reader.Byte());
  reader.Take(1);
  SkipPieces(reader);
  frame.Length = reader.Position();
  return frame;
}

std::optional<Frame> ReadGif(Reader& reader) {
  constexpr std::uint32_t image = 0x2C, extension = 0x21;
  const std::string_view version = reader.Take(6);
  if (version != "GIF87a" && version != "GIF89a") return std::nullopt;
  Frame screen;  // some programs leave it empty
  screen.Width = std::max(reader.Low(2), 1U);
  screen.Height = std::max(reader.Low(2), 1U);
  if (!IsSane(screen)) return std::nullopt;
  const std::uint32_t flags = reader.Byte();
  reader.Take(2);
  SkipColours(reader, flags);
  while (!reader.Failed()) {
    const std::uint32_t block = reader.Byte();
    if (block == image) return ReadGifImage(reader);
    if (block != extension) break;
    reader.Take(1);
    SkipPieces(reader);
  }
  return std::nullopt;
}

std::int64_t Signed(std::uint32_t value) { return static_cast<std::int32_t>(value); }

std::optional<Frame> ReadBmp(Reader& reader) {
  constexpr std::uint32_t oldHeader = 12, runLengths8 = 1, runLengths4 = 2, mostBits = 64;
  reader.Take(10);
  const std::uint32_t start = reader.Low(4);
  const bool old = reader.Low(4) == oldHeader;
  Frame frame;
  frame.Width = old ? reader.Low(2) : Signed(reader.Low(4));
  frame.Height = old ? reader.Low(2) : std::llabs(Signed(reader.Low(4)));  // below zero: rows from the top
  reader.Take(2);
  const std::uint32_t bits = reader.Low(2);
  const std::uint32_t compression = old ? 0 : reader.Low(4), stated = old ? 0 : reader.Low(4);
  if (reader.Failed() || bits == 0 || bits > mostBits || !IsSane(frame)) return std::nullopt;

  const bool runs = compression == runLengths8 || compression == runLengths4;
  const std::int64_t row = (frame.Width * bits + 7) / 8, filled = (row + 3) / 4 * 4;
  const std::int64_t length = runs ? stated : filled * frame.Height, needed = runs ? stated : length - (filled - row);
  const auto header = static_cast<std::int64_t>(reader.Position());
  reader.Take(static_cast<std::size_t>(std::max(start + needed - header, std::int64_t{0})));
  frame.Length = static_cast<std::size_t>(std::max(start + length, header));
  return frame;
}

bool IsFrameHeader(std::uint32_t marker) {
  return marker >= 0xC0 && marker <= 0xCF && marker != 0xC4 && marker != 0xC8 && marker != 0xCC;
}

std::uint32_t MarkerBehindFF(Reader& reader) {
  std::uint32_t marker = 0xFF;  // more of them only fill up
  while (marker == 0xFF) marker = reader.Byte();
  return marker;
}

std::uint32_t Marker(Reader& reader) { return reader.Byte() == 0xFF ? MarkerBehindFF(reader) : 0; }

// In a scan's data an FF is part of the data before a zero, and before the markers between their pieces.
std::uint32_t MarkerBehindScan(Reader& reader) {
  constexpr std::uint32_t firstRestart = 0xD0, lastRestart = 0xD7;
  while (!reader.Failed()) {
    reader.SkipPast('\xFF');
    const std::uint32_t marker = MarkerBehindFF(reader);
    if (marker != 0 && (marker < firstRestart || marker > lastRestart)) return marker;
  }
  return 0;
}

Frame ReadFrameHeader(Reader segment) {
  segment.Take(1);
  Frame frame;
  frame.Height = segment.High(2);
  frame.Width = segment.High(2);
  return frame;
}

// A decoder goes over all pixels once a scan, and a scan can be a few bytes long.
bool ScansArePlausible(const Frame& frame, std::int64_t scans) {
  constexpr std::int64_t mostScansOfLargest = 16;  // progressive pictures usually have about ten
  return scans > 0 && scans * frame.Width * frame.Height <= mostScansOfLargest * MostPixels;
}

// From marker to marker up to the one that ends the picture. A small picture in a segment's data is passed over.
std::optional<Frame> ReadJpeg(Reader& reader) {
  constexpr std::uint32_t endOfImage = 0xD9, startOfScan = 0xDA;
  Frame first;
  std::int64_t scans = 0;
  reader.Take(2);
  std::uint32_t marker = Marker(reader);
  while (marker != 0 && marker != endOfImage) {
    const std::uint32_t length = reader.High(2);
    const Reader segment(reader.Take(length < 2 ? std::string_view::npos : length - 2));
    if (IsFrameHeader(marker)) {
      const Frame frame = ReadFrameHeader(segment);
      if (!IsSane(frame)) return std::nullopt;
      if (first.Width == 0) first = frame;
    }
    if (marker == startOfScan) ++scans;
    marker = marker == startOfScan ? MarkerBehindScan(reader) : Marker(reader);
  }
  if (marker != endOfImage || !ScansArePlausible(first, scans)) return std::nullopt;
  first.Length = reader.Position();
  return first;
}

std::optional<Frame> ReadPng(Reader& reader) {
  constexpr std::size_t signature = 8, checksum = 4;
  Frame frame;
  reader.Take(signature);
  while (!reader.Failed()) {
    const std::uint32_t length = reader.High(4);
    const std::string_view kind = reader.Take(4);
    Reader data(reader.Take(length));
    reader.Take(checksum);
    if (kind == "IHDR") {
      frame.Width = data.High(4);
      frame.Height = data.High(4);
    }
    if (!IsSane(frame)) break;  // IHDR comes first
    frame.Length = reader.Position();
    if (kind == "IEND") return frame;
  }
  return std::nullopt;
}

struct Row {
  PictureFormat Format;
  std::string_view Beginning;
  std::int64_t MostPixelsPerByte;
  std::optional<Frame> (*Read)(Reader& reader);
};

constexpr std::int64_t LongestGifCode = 4096;  // pixels, at the most, that a code of two bits or more says
constexpr std::int64_t DeflatesTo = 1032;      // bytes, at the most, that one byte becomes

constexpr Row Formats[] = {
    {PictureFormat::Gif, "GIF8", 4 * LongestGifCode, ReadGif},
    {PictureFormat::Bmp, "BM", MostPixels, ReadBmp},       // its rows are there, or it may leave out what it likes
    {PictureFormat::Jpeg, "\xFF\xD8\xFF", 512, ReadJpeg},  // a block of 64 pixels takes a bit or more
    {PictureFormat::Png, "\x89PNG\r\n\x1A\n", 8 * DeflatesTo, ReadPng},
};

}  // namespace

std::optional<PictureFile> ReadPictureFile(std::string_view content) {
  const Row* const row = std::find_if(std::begin(Formats), std::end(Formats),
                                      [&](const Row& each) { return content.starts_with(each.Beginning); });
  if (row == std::end(Formats)) return std::nullopt;
  Reader reader(content);
  const std::optional<Frame> frame = row->Read(reader);
  if (reader.Failed() || !frame || !IsSane(*frame)) return std::nullopt;
  if (frame->Width * frame->Height > row->MostPixelsPerByte * static_cast<std::int64_t>(content.size())) {
    return std::nullopt;
  }
  return PictureFile{row->Format, static_cast<int>(frame->Width), static_cast<int>(frame->Height), frame->Length};
}

}  // namespace platform
