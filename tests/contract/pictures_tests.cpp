#include <gtest/gtest.h>

#include <string>

#include "platform/controls.h"
#include "platform/pictures.h"
#include "tests/contract/hand.h"
#include "tests/contract/small_pictures.h"

namespace contract {
namespace {

using platform::LoadPicture;
using platform::Picture;

TEST(Pictures, FormatIsToldByContent) {
  for (const std::string& content : {SmallBmp(), SmallGif(), SmallJpeg()}) {
    EXPECT_TRUE(LoadPicture(content)) << content.substr(0, 3);
    EXPECT_TRUE(LoadPicture(content + "more")) << content.substr(0, 3);
    EXPECT_FALSE(LoadPicture("\x01" + content.substr(1)));
    EXPECT_FALSE(LoadPicture("x" + content));
  }
  EXPECT_FALSE(LoadPicture("\x89PNG\r\n\x1A\n"));
  EXPECT_TRUE(LoadPicture(SmallBmp({3, 0xFFFFFFFF}))) << "one row, from the top";
}

TEST(Pictures, TruncatedFileGivesNoPicture) {
  for (const std::string& content : {SmallBmp(), SmallGif(), SmallJpeg()}) {
    for (std::size_t length = 0; length < content.size(); ++length) {
      EXPECT_FALSE(LoadPicture(content.substr(0, length))) << content.substr(0, 3) << " cut to " << length;
    }
  }
}

TEST(Pictures, SizesThatCannotBeAreRefused) {
  for (const PictureSize size :
       {PictureSize{0, 1}, PictureSize{1, 0}, PictureSize{8001, 8000}, PictureSize{65535, 65535},
        PictureSize{0x7FFFFFFF, 2}, PictureSize{0x80000000, 1}, PictureSize{2, 0x80000000}}) {
    EXPECT_FALSE(LoadPicture(SmallBmp(size))) << size.Width << " x " << size.Height;
    if (size.Width > 65535 || size.Height > 65535) continue;  // the other formats have no room for more
    EXPECT_FALSE(LoadPicture(SmallGif(size))) << size.Width << " x " << size.Height;
    EXPECT_FALSE(LoadPicture(SmallJpeg(size))) << size.Width << " x " << size.Height;
  }
}

TEST(Pictures, CopiesShareTheirPixels) {
  const Desk desk;
  const Picture first = LoadPicture(SmallGif()), copy = first, second = LoadPicture(SmallGif());
  EXPECT_EQ(first, copy);
  EXPECT_NE(first, second);
  EXPECT_EQ(Picture(), LoadPicture(""));

  platform::Window window({.Caption = "Teste", .ClientWidth = 3000, .ClientHeight = 3000});
  platform::ImageBox box(window, {100, 100, 3000, 2595});
  EXPECT_FALSE(box.ShownPicture());
  for (const Picture& picture : {first, second, Picture(), copy}) {
    box.SetPicture(picture);
    EXPECT_EQ(box.ShownPicture(), picture);
  }
  window.Close();
  box.SetPicture(second);
  EXPECT_EQ(box.ShownPicture(), first);
}

}  // namespace
}  // namespace contract
