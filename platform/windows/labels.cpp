#include "platform/controls.h"
#include "platform/windows/state.h"

namespace platform {
namespace {

SIZE SizeOfText(const ControlState& label) {
  const HDC screen = ::GetDC(label.Handle);
  const HGDIOBJ before = ::SelectObject(screen, FontFor(label.Face, label.Owner->Dpi));
  RECT area = {};
  ::DrawTextA(screen, label.Caption.c_str(), -1, &area, DT_CALCRECT | DT_NOPREFIX);
  ::SelectObject(screen, before);
  ::ReleaseDC(label.Handle, screen);
  return {area.right, area.bottom};
}

}  // namespace

Label::Label(const Container& container, int left, int top, const Font& font) {
  CreateControl(*state_, container, {left, top, 0, 0}, {"STATIC", SS_LEFT | SS_NOPREFIX}, {}, font);
  state_->WhiteGround = true;
  state_->LayOut = [this] {
    const SIZE size = SizeOfText(*state_);
    ::SetWindowPos(state_->Handle, nullptr, 0, 0, size.cx, size.cy, SWP_NOMOVE | SWP_NOZORDER | SWP_NOACTIVATE);
  };
}

Frame::Frame(Window& window, const Bounds& bounds, const std::string& caption) : Parent(window), Place(bounds) {
  CreateControl(*state_, window, bounds, {"BUTTON", BS_GROUPBOX}, caption);
}

Container::Container(Frame& frame) : Parent(frame.Parent), Left(frame.Place.Left), Top(frame.Place.Top) {}

}  // namespace platform
