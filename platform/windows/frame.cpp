#include <windows.h>

#include "platform/windows/control.h"

namespace platform {

Frame::Frame(Window& window, const Bounds& bounds, const std::string& caption) : Parent(window), Place(bounds) {
  // Transparent: the window paints the ground on which the frame and the controls in it lie.
  CreateControl(MakeState<ControlState>(state_), window, bounds, {"BUTTON", BS_GROUPBOX, WS_EX_TRANSPARENT}, caption);
}

Container::Container(Frame& frame) : Parent(frame.Parent), Left(frame.Place.Left), Top(frame.Place.Top) {}

}  // namespace platform
