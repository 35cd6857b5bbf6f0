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

// An icon with sides of so many pixels. Null when there is none.
IconHandle LoadIconFor(int id, int side);

// The program's own.
inline constexpr int LargeIconSide = 32, SmallIconSide = 16;  // pixels at UsualDpi
IconHandle LoadProgramIcon(int side, int dpi);

}  // namespace platform
