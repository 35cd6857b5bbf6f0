#include "platform/pictures.h"
#include "tests/contract/machine.h"
#include "tests/contract/small_pictures.h"

namespace {

using namespace contract;

TEST(Pictures, FormatIsToldByContentWhichMustBeWhole) {
  for (const string& content : {SmallBmp(), SmallGif(), SmallJpeg()}) {
    EXPECT_TRUE(LoadPicture(content) && LoadPicture(content + "more")) << content.substr(0, 3);
    EXPECT_FALSE(LoadPicture("\x01" + content.substr(1)) || LoadPicture("x" + content)) << content.substr(0, 3);
    for (std::size_t length = 0; length < content.size(); ++length) {
      EXPECT_FALSE(LoadPicture(content.substr(0, length))) << content.substr(0, 3) << " cut to " << length;
    }
  }
  EXPECT_FALSE(LoadPicture("\x89PNG\r\n\x1A\n"));
  EXPECT_TRUE(LoadPicture(SmallBmp({3, 0xFFFFFFFF}))) << "one row, from the top";
}

TEST(Pictures, SizesThatCannotBeAreRefused) {
  const PictureSize sizes[] = {{0, 1},          {1, 0},          {8001, 8000},   {65535, 65535},
                               {0x7FFFFFFF, 2}, {0x80000000, 1}, {2, 0x80000000}};
  for (const PictureSize size : sizes) {
    EXPECT_FALSE(LoadPicture(SmallBmp(size))) << size.Width << " x " << size.Height;
    if (size.Width > 65535 || size.Height > 65535) continue;  // the other formats have no room for more
    EXPECT_FALSE(LoadPicture(SmallGif(size)) || LoadPicture(SmallJpeg(size))) << size.Width << " x " << size.Height;
  }
}

}  // namespace
