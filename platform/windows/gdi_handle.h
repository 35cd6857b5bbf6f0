// What GDI makes, for as long as its owner lives.
#pragma once

#include <windows.h>

#include <memory>
#include <type_traits>

namespace platform {

struct GdiDeleter {
  void operator()(HGDIOBJ object) const { ::DeleteObject(object); }
};
template <typename Object>  // HFONT, HBITMAP, ...
using GdiHandle = std::unique_ptr<std::remove_pointer_t<Object>, GdiDeleter>;

}  // namespace platform
