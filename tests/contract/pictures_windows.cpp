// The pixels of decoded pictures.
#include <gtest/gtest.h>

#include <map>
#include <random>
#include <string>
#include <vector>

#include "platform/pictures.h"
#include "platform/windows/drawing.h"
#include "platform/windows/whole_file.h"
#include "tests/contract/small_pictures.h"

namespace contract {
namespace {

using platform::LoadPicture;
using Colours = std::vector<std::uint32_t>;

constexpr std::uint32_t White = 0xFFFFFF, Blue = 0x0000FF;

Colours ColoursOf(const std::string& content) {
  const platform::Picture picture = LoadPicture(content);
  return picture ? picture.Data()->Image.Colours : Colours();
}

TEST(PicturePixels, SmallPicturesAreDecodedOverWhite) {
  EXPECT_EQ(ColoursOf(SmallGif()), (Colours{White, Blue, Blue, White}));
  EXPECT_EQ(ColoursOf(SmallBmp()), Colours(3, 0x404040));
  EXPECT_EQ(ColoursOf(SmallJpeg()), Colours(64, 0x808080));
}

// Windows' decoders show the beginning of such files; Wine's refuse them, so that only this tells.
TEST(PicturePixels, TruncationIsSeenBeforeDecoding) {
  const std::string bmp = SmallBmp(), jpeg = SmallJpeg();
  std::string runs = bmp;  // run-length coded: the header says how many bytes
  runs[30] = 1;
  runs[34] = 5;
  EXPECT_TRUE(platform::BmpIsWhole(bmp));
  EXPECT_TRUE(platform::JpegIsWhole(jpeg));
  EXPECT_FALSE(platform::BmpIsWhole(runs));
  EXPECT_TRUE(platform::BmpIsWhole(runs + "+"));
  for (std::size_t length = 2; length < bmp.size(); ++length) EXPECT_FALSE(platform::BmpIsWhole(bmp.substr(0, length)));
  for (std::size_t length = 2; length < jpeg.size(); ++length) {
    EXPECT_FALSE(platform::JpegIsWhole(jpeg.substr(0, length))) << length;
  }
}

TEST(PicturePixels, DamagedGifIsRefused) {
  struct Case {
    const char* Damage;
    std::string Codes;
  };
  const Case cases[] = {
      {"a code that is not given away yet", Bytes({0xC4, 0x02, 0x05})},  // 4, 0, 3: no colour 3
      {"a first code that stands for nothing", Bytes({0x74, 0x02, 0x05})},
      {"fewer pixels than the size says", Bytes({0x44, 0x0A})},
      {"no codes", ""},
  };
  for (const Case& one : cases) EXPECT_FALSE(LoadPicture(SmallGif({2, 2}, one.Codes))) << one.Damage;
  std::string noColours = SmallGif();
  noColours[10] = 0;
  EXPECT_FALSE(LoadPicture(noColours));
}

// Codes in the order of writing, each with its number of bits.
class CodeWriter {
 public:
  void Write(unsigned code, int bits) {
    held_ |= code << count_;
    for (count_ += bits; count_ >= 8; count_ -= 8, held_ >>= 8) bytes_ += static_cast<char>(held_ & 0xFF);
  }
  std::string Finish() {
    if (count_ > 0) bytes_ += static_cast<char>(held_ & 0xFF);
    return bytes_;
  }

 private:
  std::string bytes_;
  unsigned held_ = 0;
  int count_ = 0;
};

// The longest known string each time. The dictionary is given up when it is full, or, with `deferred`, kept.
std::string Compress(const std::string& indices, int indexBits, bool deferred) {
  const unsigned clear = 1U << indexBits;
  std::map<std::string, unsigned> known;
  unsigned next = 0;
  int width = 0;
  CodeWriter writer;
  const auto restart = [&] {
    known.clear();
    for (unsigned i = 0; i < clear; ++i) known[std::string(1, static_cast<char>(i))] = i;
    next = clear + 2;
    width = indexBits + 1;
  };
  restart();
  writer.Write(clear, width);
  for (std::size_t at = 0; at < indices.size();) {
    std::string longest(1, indices[at]);
    while (at + longest.size() < indices.size() && known.contains(longest + indices[at + longest.size()])) {
      longest += indices[at + longest.size()];
    }
    writer.Write(known[longest], width);
    at += longest.size();
    if (at == indices.size()) break;
    if (next < 4096) {
      known[longest + indices[at]] = next++;
      if (next > 1U << width && width < 12) ++width;
    } else if (!deferred) {
      writer.Write(clear, width);
      restart();
    }
  }
  writer.Write(clear + 1, width);
  return writer.Finish();
}

std::string InPieces(const std::string& data) {
  std::string pieces;
  for (std::size_t at = 0; at < data.size(); at += 255) {
    const std::string piece = data.substr(at, 255);
    pieces += Low(piece.size(), 1) + piece;
  }
  return pieces + '\0';
}

// The rows as an interlaced file stores them.
std::string Interlaced(const std::string& indices, std::size_t width) {
  constexpr struct { std::size_t First, Step; } passes[] = {{0, 8}, {4, 8}, {2, 4}, {1, 2}};
  std::string stored;
  for (const auto& [first, step] : passes) {
    for (std::size_t row = first; row * width < indices.size(); row += step)
      stored += indices.substr(row * width, width);
  }
  return stored;
}

std::uint32_t ColourOf(std::uint32_t index) { return index * 0x010203U & 0xFFFFFF; }

// With a colour table of the image's own.
std::string Gif(PictureSize size, const std::string& indices, bool interlaced, bool deferred) {
  std::string table;
  for (std::uint32_t index = 0; index < 256; ++index) {
    for (const int shift : {16, 8, 0}) table += Low(ColourOf(index) >> shift, 1);
  }
  return "GIF87a" + Low(1, 2) + Low(1, 2) + Bytes({0, 0, 0, 0x2C, 0, 0, 0, 0}) + Low(size.Width, 2) +
         Low(size.Height, 2) + Bytes({interlaced ? 0xC7 : 0x87}) + table + Bytes({8}) +
         InPieces(Compress(interlaced ? Interlaced(indices, size.Width) : indices, 8, deferred)) + ";";
}

TEST(PicturePixels, CompressedGifComesBackPixelForPixel) {
  std::mt19937 random(1);
  for (const unsigned spread : {2U, 5U, 256U}) {  // colours in use; few make long strings
    for (const PictureSize size : {PictureSize{1, 1}, PictureSize{5, 3}, PictureSize{200, 174}}) {
      std::string indices;
      Colours expected;
      for (unsigned i = 0; i < size.Width * size.Height; ++i) {
        const auto index = static_cast<std::uint32_t>(random() % spread);
        indices += static_cast<char>(index);
        expected.push_back(ColourOf(index));
      }
      for (const bool interlaced : {false, true}) {
        for (const bool deferred : {false, true}) {
          EXPECT_EQ(ColoursOf(Gif(size, indices, interlaced, deferred)), expected)
              << spread << " colours, " << size.Width << " wide, " << interlaced << deferred;
        }
      }
    }
  }
}

}  // namespace
}  // namespace contract
