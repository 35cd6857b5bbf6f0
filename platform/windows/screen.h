// What depends on the screen's resolution: lengths, fonts and icons.
#pragma once

#include <windows.h>

#include <memory>
#include <type_traits>

#include "platform/controls.h"

namespace platform {

inline constexpr int TwipsPerInch = 1440;
inline constexpr int UsualDpi = 96;  // 15 twips a pixel

int DpiOfScreen();
int DpiOfWindow(HWND window);

inline int ToPixels(int twips, int dpi) { return ::MulDiv(twips, dpi, TwipsPerInch); }
inline int ToTwips(int pixels, int dpi) { return ::MulDiv(pixels, TwipsPerInch, dpi); }

DWORD NativeStyle(const WindowStyle& style);

// Size in pixels of the whole window when its client area is as large as the style asks.
SIZE WindowSize(const WindowStyle& style, int dpi);

// The font that the controls use; it lives as long as the program.
HFONT FontFor(const Font& font, int dpi);

struct IconDeleter {
  void operator()(HICON icon) const { ::DestroyIcon(icon); }
};
using IconHandle = std::unique_ptr<std::remove_pointer_t<HICON>, IconDeleter>;

// An icon of the program's resources, as large as `side` pixels are at UsualDpi. Null when there is none.
IconHandle LoadIconFor(int id, int side, int dpi);

}  // namespace platform
