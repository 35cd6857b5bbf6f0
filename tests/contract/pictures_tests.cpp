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
  EXPECT_TRUE(LoadPicture(SmallBmp({3, 0xFFFFFFFF}))) << "one row, from the top";
}

TEST(Pictures, SizesThatCannotBeAreRefused) {
  const string contents[] = {SmallBmp({0, 1}),          SmallBmp({1, 0}),          SmallBmp({8001, 8000}),
                             SmallBmp({0x7FFFFFFF, 2}), SmallBmp({0x80000000, 1}), SmallBmp({2, 0x80000000}),
                             SmallGif({0, 1}),          SmallGif({65535, 65535}),  SmallJpeg({65535, 65535})};
  for (const string& content : contents) EXPECT_FALSE(LoadPicture(content)) << &content - contents;
}

}  // namespace
