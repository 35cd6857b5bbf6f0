// The pixels of decoded pictures.
#include <algorithm>
#include <random>
#include <vector>

#include "platform/windows/drawing.h"
#include "tests/contract/machine.h"
#include "tests/contract/small_pictures.h"

namespace {

using namespace contract;

using Colours = std::vector<std::uint32_t>;

Colours ColoursOf(const string& content) {
  const Picture picture = LoadPicture(content);
  return picture ? picture.Data()->Image.Colours : Colours();
}

TEST(PicturePixels, SmallPicturesAreDecodedOverWhite) {
  EXPECT_EQ(ColoursOf(SmallGif()), (Colours{0xFFFFFF, 0x0000FF, 0x0000FF, 0xFFFFFF}));
  EXPECT_EQ(ColoursOf(SmallBmp()), Colours(3, 0x404040));
  EXPECT_EQ(ColoursOf(SmallJpeg()), Colours(64, 0x808080));
}

TEST(PicturePixels, BitmapThatEndsWithItsLastPixelIsDecoded) {
  const string content = SmallBmp();
  EXPECT_EQ(ColoursOf(content.substr(0, content.size() - 1)), Colours(3, 0x404040));
}

TEST(PicturePixels, DamagedGifIsRefused) {
  // A code that is not given away yet (4, 0, 3), a first code that stands for nothing, too few pixels, no codes.
  for (const string& codes : {Bytes({0xC4, 2, 5}), Bytes({0x74, 2, 5}), Bytes({0x44, 0x0A}), string()}) {
    EXPECT_FALSE(LoadPicture(SmallGif({2, 2}, codes)));
  }
  EXPECT_FALSE(LoadPicture(SmallGif().replace(10, 1, Zero))) << "without colours";
}

// Codes that a decoder has to understand, and the indices that they stand for. The dictionary is given up now and then,
// or stays when it is full.
string RandomCodes(unsigned seed, string& indices) {
  std::mt19937 random(seed);
  std::vector<string> known;
  string bytes, last;
  std::size_t held = 0, count = 0, bits = 9;
  const auto write = [&](std::size_t code) {
    held |= code << count;
    for (count += bits; count >= 8; count -= 8, held >>= 8) bytes += static_cast<char>(held & 0xFF);
  };
  while (indices.size() < 30'000) {
    if (known.empty() || random() % 6000 == 0) {
      write(256);
      known.assign(258, "");  // the last two have another meaning
      for (std::size_t i = 0; i < 256; ++i) known[i] = static_cast<char>(i);
      last.clear(), bits = 9;
    }
    const bool grows = !last.empty() && known.size() < 4096;
    const std::size_t code = random() % (known.size() + (grows ? 1 : 0));
    const string text = code < known.size() ? known[code] : last + last[0];
    if (text.empty()) continue;
    write(code);
    indices += text;
    if (grows) known.push_back(last + text[0]);
    if (known.size() >= std::size_t{1} << bits && bits < 12) ++bits;
    last = text;
  }
  write(257);
  return bytes + static_cast<char>(held);
}

// Each picture is one pixel wide.
TEST(PicturePixels, GifComesBackPixelForPixel) {
  using Passes = std::vector<std::pair<std::size_t, std::size_t>>;  // first row and step
  string greys, indices;
  for (int grey = 0; grey < 256; ++grey) greys += string(3, static_cast<char>(grey));
  for (unsigned seed = 1; seed <= 16; ++seed, indices.clear()) {
    const string data = RandomCodes(seed, indices);
    const bool interlaced = seed % 3 == 0;
    string file = "GIF87a" + Bytes({1, 0, 1, 0, 0, 0, 0, 0x2C, 0, 0, 0, 0, 1, 0}) + Low(indices.size(), 2) +
                  Bytes({interlaced ? 0xC7 : 0x87}) + greys + '\x08';
    for (std::size_t at = 0; at < data.size(); at += 255) {
      file += Low(std::min<std::size_t>(255, data.size() - at), 1) + data.substr(at, 255);
    }
    const Colours seen = ColoursOf(file + Zero);
    ASSERT_EQ(seen.size(), indices.size());
    auto index = indices.begin();
    for (const auto& [first, step] : interlaced ? Passes{{0, 8}, {4, 8}, {2, 4}, {1, 2}} : Passes{{0, 1}}) {
      for (std::size_t row = first; row < seen.size(); row += step, ++index) {
        ASSERT_EQ(seen[row], static_cast<unsigned char>(*index) * 0x010101U) << seed << " at " << row;
      }
    }
  }
}

}  // namespace
