#include "platform/pictures.h"
#include "tests/contract/machine.h"
#include "tests/contract/small_pictures.h"

namespace {

using namespace contract;

struct Case {
  const char* Name;
  string Content;
};

TEST(Pictures, FormatIsToldByContentWhichMustBeWhole) {
  for (const auto& [name, content] : std::initializer_list<Case>{
           {"GIF", SmallGif()}, {"bitmap", SmallBmp({4, 1})}, {"JPEG", SmallJpeg()}, {"PNG", SmallPng()}}) {
    EXPECT_TRUE(LoadPicture(content)) << name;
    EXPECT_TRUE(LoadPicture(content + "more")) << name;
    EXPECT_FALSE(LoadPicture("\x01" + content.substr(1))) << name;
    EXPECT_FALSE(LoadPicture("x" + content)) << name;
    for (std::size_t length = 0; length < content.size(); ++length) {
      EXPECT_FALSE(LoadPicture(content.substr(0, length))) << name << " cut to " << length;
    }
  }
}

TEST(Pictures, BitmapMayEndWithItsLastPixel) {
  for (std::uint32_t width = 1; width <= 4; ++width) {
    const string content = SmallBmp({width, 0xFFFFFFFF});  // one row, from the top; it takes four bytes
    EXPECT_TRUE(LoadPicture(content.substr(0, content.size() - (4 - width)))) << width;
    EXPECT_FALSE(LoadPicture(content.substr(0, content.size() - (5 - width)))) << width;
  }
  const string runs = SmallBmp({4, 1}).replace(30, 1, "\1").replace(34, 1, "\4");  // run-length coded: 4 bytes
  EXPECT_TRUE(LoadPicture(runs));
  EXPECT_FALSE(LoadPicture(runs.substr(0, runs.size() - 1)));
}

// A segment of a JPEG file.
string Segment(int kind, const string& data) {
  return Bytes({0xFF, kind, 0, static_cast<int>(data.size()) + 2}) + data;
}

TEST(Pictures, SizesInTheFileDecide) {
  const string largestFrame = Bytes({8, 0xFF, 0xFF, 0xFF, 0xFF, 1, 1, 0x11, 0}),
               largest = Bytes({0xFF, 0xFF, 0xFF, 0xFF});
  const Case refused[] = {
      {"bitmap without width", SmallBmp({0, 1})},
      {"bitmap without height", SmallBmp({1, 0})},
      {"bitmap of too many pixels", SmallBmp({8001, 8000}) + string(8004 * 8000, '\0')},
      {"bitmap of too many rows", SmallBmp({1, 65536}) + string(4 * 65536, '\0')},
      {"bitmap of a width below zero", SmallBmp({0x80000000, 1})},
      {"bitmap of the lowest height", SmallBmp({1, 0x80000000})},
      {"bitmap whose rows would take more than 32 bits can say", SmallBmp({0x7FFFFFFF, 2})},
      {"GIF without width", SmallGif({0, 1})},
      {"GIF of too many pixels", SmallGif({65535, 65535})},
      {"GIF of more pixels than its codes can say", SmallGif({8000, 8000})},
      {"GIF whose screen is too large", SmallGif().replace(6, 4, largest)},
      {"JPEG without height", SmallJpeg({8, 0})},
      {"JPEG of too many pixels", SmallJpeg({56540, 56540})},
      {"JPEG of more pixels than its blocks can say", SmallJpeg({8000, 8000})},
      {"JPEG with a second, larger frame",
       SmallJpeg().insert(SmallJpeg().find("\xFF\xDA"), Segment(0xC2, largestFrame))},
      {"JPEG without a frame", SmallJpeg().replace(SmallJpeg().find("\xFF\xC0") + 1, 1, "\xEF")},
      {"PNG without width", SmallPng({0, 1})},
      {"PNG of too many pixels", SmallPng({8001, 8000})},
      {"PNG of too many columns", SmallPng({65536, 1})},
      {"PNG of more pixels than its data can say", SmallPng({8000, 8000})},
  };
  for (const auto& [name, content] : refused) EXPECT_FALSE(LoadPicture(content)) << name;
  const Case good[] = {
      {"GIF with an empty screen", SmallGif().replace(6, 4, 4, '\0')},
      {"GIF with a second, larger image", SmallGif() + ",1234" + largest + Bytes({0, 2, 0})},
      {"JPEG with a small picture inside", SmallJpeg().insert(2, Segment(0xE1, Segment(0xC0, largestFrame)))},
  };
  for (const auto& [name, content] : good) EXPECT_TRUE(LoadPicture(content)) << name;
}

}  // namespace
