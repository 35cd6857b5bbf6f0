#include "platform/picture_file.h"
#include "platform/picture_maker.h"
#include "tests/contract/machine.h"
#include "tests/contract/small_pictures.h"

namespace {

using namespace contract;

// The size of a JPEG file, or zero.
PixelSize SizeOf(const std::optional<string>& content) {
  const auto file = content ? ReadPictureFile(*content) : std::nullopt;
  return file && file->Format == PictureFormat::Jpeg ? PixelSize{file->Width, file->Height} : PixelSize{0, 0};
}

TEST(PictureMaker, FitsAPictureAndKeepsItsShape) {
  const std::tuple<const char*, string, PixelSize> cases[] = {
      {"a GIF, which is small enough", SmallGif(), {2, 2}},
      {"a PNG", SmallPng(), {2, 2}},
      {"a bitmap", SmallBmp(), {3, 1}},
      {"a JPEG, which is too large", SmallJpeg({8, 8}), {6, 6}},
      {"no picture", "figura", {0, 0}},
      {"a picture that is cut", SmallPng().substr(0, 40), {0, 0}},
  };
  for (const auto& [name, content, size] : cases) EXPECT_EQ(SizeOf(MakeJpeg(content, {9, 6})), size) << name;
}

TEST(PictureMaker, SidesAreRoundedAndNeverNothing) {
  const std::pair<PixelSize, PixelSize> cases[] = {
      {{400, 346}, {400, 346}}, {{401, 346}, {400, 345}},  {{1, 1}, {1, 1}},
      {{800, 100}, {400, 50}},  {{100, 10'000}, {3, 346}}, {{60'000, 2}, {400, 1}},
  };
  for (const auto& [picture, fitted] : cases) {
    EXPECT_EQ(Fitted(picture, {400, 346}), fitted) << picture.Width << " x " << picture.Height;
  }
}

TEST(PictureMaker, DrawsATextTheSameEachTime) {
  const auto drawn = DrawJpeg("Super Jogo", {400, 346});
  EXPECT_EQ(SizeOf(drawn), (PixelSize{400, 346}));
  EXPECT_EQ(DrawJpeg("Super Jogo", {400, 346}), drawn);
  EXPECT_NE(DrawJpeg("Super Joga", {400, 346}), drawn);
  EXPECT_EQ(SizeOf(DrawJpeg(string(100, 'W'), {400, 346})), (PixelSize{400, 346}));
}

}  // namespace
