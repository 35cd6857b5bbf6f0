// The icons of the program's resources.
#pragma once

#include <windows.h>

#include <memory>
#include <type_traits>

#include "platform/windows/gdi_handle.h"

namespace platform {

struct IconDeleter {
  void operator()(HICON icon) const { ::DestroyIcon(icon); }
};
using IconHandle = std::unique_ptr<std::remove_pointer_t<HICON>, IconDeleter>;

// An icon with sides of so many pixels. Null when there is none.
IconHandle LoadIconFor(int id, int side);

// A square picture with an alpha channel.
struct ButtonImage {
  GdiHandle<HBITMAP> Bitmap;  // its colours multiplied by its alpha, as GdiAlphaBlend takes them; null: there is none
  int Side = 0;               // pixels
};

// The icon in the stored size that is next to the wanted one. A button keeps and draws it much faster than the icon.
ButtonImage LoadButtonImage(int id, int side);

}  // namespace platform
