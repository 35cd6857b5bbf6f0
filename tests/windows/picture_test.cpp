// Previews of pictures that take long to decode, and of files that only say so.
#include "tests/contract/small_pictures.h"
#include "tests/windows/installation.h"

namespace {

class Pictures : public Installation {};

const COLORREF Green = RGB(10, 200, 60);
const COLORREF Red = RGB(220, 20, 40);

// Nearly as large as a picture may be: it takes half a second to decode.
std::string LargeJpeg() {
  std::string content = contract::SmallJpeg({8000, 7992});
  return content.replace(content.size() - 3, 1, std::string(size_t{1000} * 999 / 4, '\0'));
}

std::string LargeBmp(COLORREF colour) {
  constexpr int side = 2000, start = 14 + 40 + 8;
  const std::string size = contract::Low(side, 4), zeros(24, '\0'), rows(size_t{252} * side, '\0');
  const int bgr = GetBValue(colour) | GetGValue(colour) << 8 | GetRValue(colour) << 16;
  return "BM" + contract::Low(start + rows.size(), 4) + contract::Low(0, 4) + contract::Low(start, 4) +
         contract::Low(40, 4) + size + size + contract::Low(1, 2) + contract::Low(1, 2) + zeros +
         contract::Low(static_cast<unsigned>(bgr), 4) + contract::Low(0, 4) + rows;
}

TEST_F(Pictures, ThatAreOnlyPassedByHoldNobodyUp) {
  constexpr int games = 100;
  Put("Imgs\\Zebra.gif", Gif(Red));
  for (int i = 1; i <= games; ++i) {
    const std::string name = "zz" + std::to_string(100 + i);
    Put("Roms\\" + name + ".smc", "jogo");
    Put("Imgs\\" + name + ".jpg", i < games ? LargeJpeg() : LargeBmp(Green));
  }
  Set("LRom", "Zebra");
  Start();
  EXPECT_SOON_EQ(Red, window->Preview());
  for (int i = 0; i < games; ++i) PostMessageA(window->List.Handle(), WM_KEYDOWN, VK_DOWN, 1);
  EXPECT_SOON_EQ("zz" + std::to_string(100 + games), Selected());
  EXPECT_SOON_EQ(Green, window->Preview());
}

TEST_F(Pictures, ThatSayTheyAreTooLargeLeaveTheOneBefore) {
  Put("Imgs\\Zebra.gif", Gif(Green));
  Put("Imgs\\Élan.jpg", contract::SmallJpeg({56540, 56540}));
  Put("Imgs\\Corrida das Nuvens.jpg", contract::SmallJpeg({8000, 8000}));
  Set("LRom", "Zebra");
  Start();
  EXPECT_SOON_EQ(Green, window->Preview());
  for (const char* game : {"Élan", "Corrida das Nuvens"}) {
    Select(game);
    window->Floppy.Click();  // handled behind the selection
    EXPECT_SOON(window->FloppyChecked());
    window->Floppy.Click();
    EXPECT_SOON(!window->FloppyChecked());
    window->FinishPainting();
    EXPECT_EQ(window->Preview(), Green) << game;
  }
}

}  // namespace
