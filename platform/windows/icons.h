// The icons of the program's resources.
#pragma once

#include <windows.h>

#include <memory>
#include <type_traits>

namespace platform {

struct IconDeleter {
  void operator()(HICON icon) const { ::DestroyIcon(icon); }
};
using IconHandle = std::unique_ptr<std::remove_pointer_t<HICON>, IconDeleter>;

// An icon as large as `side` pixels are at UsualDpi. Null when there is none.
IconHandle LoadIconFor(int id, int side, int dpi);

struct BitmapDeleter {
  void operator()(HBITMAP bitmap) const { ::DeleteObject(bitmap); }
};
using BitmapHandle = std::unique_ptr<std::remove_pointer_t<HBITMAP>, BitmapDeleter>;

// A square picture with an alpha channel.
struct ButtonImage {
  BitmapHandle Bitmap;  // its colours multiplied by its alpha, as GdiAlphaBlend takes them; null: there is none
  int Side = 0;         // pixels
};

// The icon in the stored size that is next to the wanted one. A button keeps and draws it much faster than the icon.
ButtonImage LoadButtonImage(int id, int side);

}  // namespace platform
