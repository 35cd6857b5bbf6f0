// The pixels of decoded pictures.
#include <vector>

#include "platform/windows/pictures.h"
#include "tests/contract/machine.h"
#include "tests/contract/small_pictures.h"

namespace {

using namespace contract;

using Colours = std::vector<std::uint32_t>;

Colours ColoursOf(const string& content) {
  const Picture picture = LoadPicture(content);
  const Pixels* const pixels = picture ? PixelsFor(picture, {100, 100}) : nullptr;
  return pixels != nullptr ? pixels->Colours : Colours();
}

TEST(PicturePixels, SmallPicturesAreDecodedOverWhite) {
  EXPECT_EQ(ColoursOf(SmallGif()), (Colours{0xFFFFFF, 0x0000FF, 0x0000FF, 0xFFFFFF}));
  EXPECT_EQ(ColoursOf(SmallPng()), (Colours{0xFFFFFF, 0x0000FF, 0x0000FF, 0xFFFFFF}));
  EXPECT_EQ(ColoursOf(SmallBmp()), Colours(3, 0x404040));
  EXPECT_EQ(ColoursOf(SmallJpeg()), Colours(64, 0x808080));
}

TEST(PicturePixels, BitmapThatEndsWithItsLastPixelIsDecoded) {
  const string content = SmallBmp();
  EXPECT_EQ(ColoursOf(content.substr(0, content.size() - 1)), Colours(3, 0x404040));
}

TEST(PicturePixels, GifIsItsFirstImageAlone) {
  const Colours colours = {0xFFFFFF, 0x0000FF, 0x0000FF, 0xFFFFFF};
  const string large = Bytes({0x40, 0x1F, 0x40, 0x1F});  // 8000 x 8000
  EXPECT_EQ(ColoursOf(SmallGif().replace(6, 4, large)), colours) << "on a larger screen";
  EXPECT_EQ(ColoursOf(SmallGif() + ",1234" + large + Bytes({0, 2, 0})), colours) << "before a damaged one";
  EXPECT_EQ(ColoursOf(SmallGif() + SmallGif().substr(SmallGif().find(',')) + ';'), colours) << "before a good one";
}

// The rows 0, 4, 2, 1, 3 are stored in this order, in the codes 4, 0, 0, 4, 1, 1, 4, 0, 5 of three bits.
TEST(PicturePixels, RowsOfAnInterlacedGifComeInTheirOrder) {
  string content = SmallGif({1, 5}, Bytes({0x04, 0x98, 0x10, 0x05}));
  content.replace(content.find(',') + 9, 1, "\x40");
  EXPECT_EQ(ColoursOf(content), (Colours{0xFFFFFF, 0x0000FF, 0x0000FF, 0xFFFFFF, 0xFFFFFF}));
}

// What is kept of a photograph takes no more memory than the place where it is shown.
TEST(PicturePixels, LargePictureIsReducedToItsPlace) {
  const string large = SmallBmp({1000, 1}) + string(1000, '\2');
  const Picture picture = LoadPicture(large);
  ASSERT_TRUE(picture);
  for (const int width : {100, 200}) {
    const Pixels* const pixels = PixelsFor(picture, {width, 100});
    ASSERT_NE(pixels, nullptr);
    EXPECT_EQ(pixels->Width, width + 1);
    EXPECT_EQ(pixels->Height, 1);
    EXPECT_EQ(pixels->Colours, Colours(static_cast<std::size_t>(width) + 1, 0x404040));
  }
}

}  // namespace
