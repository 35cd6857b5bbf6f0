#include "platform/windows/icons.h"

#include "platform/windows/screen.h"
#include "resources/ids.h"

namespace platform {

IconHandle LoadIconFor(int id, int side) {
  return IconHandle(static_cast<HICON>(
      ::LoadImageA(::GetModuleHandleA(nullptr), MAKEINTRESOURCEA(id), IMAGE_ICON, side, side, LR_DEFAULTCOLOR)));
}

IconHandle LoadProgramIcon(int side, int dpi) { return LoadIconFor(ICONE_PROGRAMA, Scaled(side, dpi)); }

}  // namespace platform
