#include "platform/windows/icons.h"

namespace platform {

IconHandle LoadIconFor(int id, int side) {
  return IconHandle(static_cast<HICON>(
      ::LoadImageA(::GetModuleHandleA(nullptr), MAKEINTRESOURCEA(id), IMAGE_ICON, side, side, LR_DEFAULTCOLOR)));
}

}  // namespace platform
