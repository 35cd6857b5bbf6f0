// What a picture file says of itself. Each input is used twice: as a file, and as a size with three pieces of data, of
// which a file of each format is built.
#include <algorithm>
#include <array>
#include <string>

#include "platform/picture_file.h"
#include "tests/fuzz/target.h"

namespace {

using platform::PictureFile;
using platform::PictureFormat;
using platform::ReadPictureFile;

// A number's bytes, the lowest first; the highest first.
std::string Low(std::uint32_t value, int bytes) {
  std::string text;
  for (; bytes > 0; --bytes, value >>= 8) text += static_cast<char>(value & 0xFF);
  return text;
}

std::string High(std::uint32_t value, int bytes) {
  std::string text = Low(value, bytes);
  std::ranges::reverse(text);
  return text;
}

bool Same(const std::optional<PictureFile>& read, const PictureFile& expected) {
  return read && read->Format == expected.Format && read->Width == expected.Width && read->Height == expected.Height &&
         read->Length == expected.Length;
}

// A bitmap may lack the bytes that fill up its last row.
std::size_t MayLack(const PictureFile& picture) { return picture.Format == PictureFormat::Bmp ? 3 : 0; }

void ReadAsFile(std::string_view content) {
  const auto read = ReadPictureFile(content);
  if (!read) return;
  Require(read->Width > 0 && read->Height > 0 && read->Width <= platform::MostSide &&
          read->Height <= platform::MostSide && std::int64_t{read->Width} * read->Height <= platform::MostPixels);
  Require(read->Length <= content.size() + MayLack(*read));
  // As long as the file stays as long, since that decides how many pixels it can hold.
  std::string behind(content);
  std::fill(behind.begin() + static_cast<std::ptrdiff_t>(std::min(read->Length, behind.size())), behind.end(), '\xFF');
  Require(Same(ReadPictureFile(behind), *read));
  Require(Same(ReadPictureFile(behind + "BM"), *read));
  const std::size_t end = read->Length - MayLack(*read);
  for (const std::size_t length : {end - 1, end / 2, end - end / 4 - 1}) {
    Require(!ReadPictureFile(content.substr(0, length)));
  }
}

struct Pieces {
  std::uint32_t Width, Height;
  std::array<std::string_view, 3> Data;
};

// The data in pieces of at most 255 bytes, as a GIF file has it.
std::string GifData(std::string_view data) {
  std::string pieces;
  for (; !data.empty(); data.remove_prefix(std::min<std::size_t>(data.size(), 255))) {
    pieces += Low(static_cast<std::uint32_t>(std::min<std::size_t>(data.size(), 255)), 1);
    pieces += data.substr(0, 255);
  }
  return pieces + '\0';
}

std::string Gif(const Pieces& pieces) {
  const std::string size = Low(pieces.Width, 2) + Low(pieces.Height, 2);
  return "GIF89a" + std::string("\1\0\1\0\x80\0\0", 7) + "colour" + "!\xFE" + GifData(pieces.Data[0]) + "!\xF9" +
         GifData(pieces.Data[1]) + "," + std::string(4, '\xFF') + size + std::string("\0\2", 2) +
         GifData(pieces.Data[2]);
}

std::string Segment(int marker, std::string_view data) {
  return "\xFF" + Low(static_cast<std::uint32_t>(marker), 1) +
         High(static_cast<std::uint32_t>(data.size()) + 2, 2).append(data);
}

std::string Jpeg(const Pieces& pieces) {
  std::string scan;
  for (const char byte : pieces.Data[2])
    scan += byte == '\xFF' ? std::string("\xFF\0\xFF\xD7", 4) : std::string(1, byte);
  return "\xFF\xD8" + Segment(0xE0, pieces.Data[0]) + "\xFF" + Segment(0xC4, pieces.Data[1]) +
         Segment(0xC2, "\x8" + High(pieces.Height, 2) + High(pieces.Width, 2) + "\1\1\x11") + Segment(0xDA, "\1") +
         scan + "\xFF\xD9";
}

std::string Chunk(const char* kind, std::string_view data) {
  return High(static_cast<std::uint32_t>(data.size()), 4) + kind + std::string(data) + "CRC.";
}

std::string Png(const Pieces& pieces) {
  return "\x89PNG\r\n\x1A\n" +
         Chunk("IHDR", High(pieces.Width, 4) + High(pieces.Height, 4) + std::string("\x8\2\0\0\0", 5)) +
         Chunk("tEXt", pieces.Data[0]) + Chunk("IDAT", pieces.Data[1]) + Chunk("IDAT", pieces.Data[2]) +
         Chunk("IEND", "");
}

// Its rows are all there, so it has few pixels; the first piece lies between header and rows.
std::string Bmp(const Pieces& pieces) {
  const std::size_t start = 26 + pieces.Data[0].size(), row = (3 * std::size_t{pieces.Width} + 3) / 4 * 4;
  return "BM" + Low(0, 8) + Low(static_cast<std::uint32_t>(start), 4) + Low(12, 4) + Low(pieces.Width, 2) +
         Low(pieces.Height, 2) + Low(1, 2) + Low(24, 2) + std::string(pieces.Data[0]) +
         std::string(row * pieces.Height, '\x55');
}

// A file of this size and length must be read so, when its size may be and its bytes can hold that many pixels in any
// format; it must be refused when its size may not be.
void ReadBuilt(PictureFormat format, const std::string& content, const Pieces& pieces) {
  constexpr std::int64_t PixelsAByte = 500;
  const std::int64_t pixels = std::int64_t{pieces.Width} * pieces.Height;
  const PictureFile expected = {format, static_cast<int>(pieces.Width), static_cast<int>(pieces.Height),
                                content.size()};
  if (pixels == 0 || pixels > platform::MostPixels) {
    Require(!ReadPictureFile(content));
  } else if (pixels <= PixelsAByte * static_cast<std::int64_t>(content.size())) {
    Require(Same(ReadPictureFile(content), expected) && Same(ReadPictureFile(content + "\xFF\xD8"), expected));
  }
}

std::uint32_t TakeSide(std::string_view& input) {
  std::uint32_t side = 0;
  for (const char byte : input.substr(0, 2)) side = side << 8 | static_cast<unsigned char>(byte);
  input.remove_prefix(std::min<std::size_t>(input.size(), 2));
  return side;
}

}  // namespace

void Test(std::string_view input) {
  ReadAsFile(input);
  Pieces pieces{};
  pieces.Width = TakeSide(input);
  pieces.Height = TakeSide(input);
  pieces.Data = {TakeLine(input), TakeLine(input), input};
  ReadBuilt(PictureFormat::Gif, Gif(pieces), pieces);
  ReadBuilt(PictureFormat::Jpeg, Jpeg(pieces), pieces);
  ReadBuilt(PictureFormat::Png, Png(pieces), pieces);
  pieces.Width %= 64;
  pieces.Height %= 64;
  ReadBuilt(PictureFormat::Bmp, Bmp(pieces), pieces);
}
