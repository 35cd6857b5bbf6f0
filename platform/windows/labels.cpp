#include "platform/controls.h"
#include "platform/windows/state.h"

namespace platform {
namespace {

constexpr int Reserve = 30;  // twips: a long text can be drawn a pixel or two wider than it measures

SIZE SizeOfText(const ControlState& label) {
  const HDC screen = ::GetDC(label.Handle);
  const HGDIOBJ before = ::SelectObject(screen, FontFor(label.Face, label.Owner->Dpi));
  RECT area = {};
  ::DrawTextA(screen, label.Caption.c_str(), -1, &area, DT_CALCRECT | DT_NOPREFIX);
  ::SelectObject(screen, before);
  ::ReleaseDC(label.Handle, screen);
  return {area.right + ToPixels(Reserve, label.Owner->Dpi), area.bottom};
}

}  // namespace

Label::Label(const Container& container, int left, int top, const Font& font, Ground ground) {
  CreateControl(*state_, container, {left, top, 0, 0}, {"STATIC", SS_LEFTNOWORDWRAP | SS_NOPREFIX}, {}, font);
  state_->WhiteGround = ground == Ground::White;
  state_->LayOut = [this] {
    const SIZE size = SizeOfText(*state_);
    ::SetWindowPos(state_->Handle, nullptr, 0, 0, size.cx, size.cy,
                   SWP_NOMOVE | SWP_NOZORDER | SWP_NOACTIVATE | SWP_NOCOPYBITS);
  };
}

Frame::Frame(Window& window, const Bounds& bounds, const std::string& caption) : Parent(window), Place(bounds) {
  // Transparent: the window paints the ground on which the frame and the controls in it lie.
  CreateControl(*state_, window, bounds, {"BUTTON", BS_GROUPBOX, WS_EX_TRANSPARENT}, caption);
}

Container::Container(Frame& frame) : Parent(frame.Parent), Left(frame.Place.Left), Top(frame.Place.Top) {}

}  // namespace platform
