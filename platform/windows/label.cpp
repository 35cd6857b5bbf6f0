#include <windows.h>

#include "platform/windows/control.h"
#include "platform/windows/fonts.h"

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

struct LabelState : ControlState {
  explicit LabelState(Label::Ground ground) : Ground(ground) {}

  void LayOut() override {
    const SIZE size = SizeOfText(*this);
    ::SetWindowPos(Handle, nullptr, 0, 0, size.cx, size.cy,
                   SWP_NOMOVE | SWP_NOZORDER | SWP_NOACTIVATE | SWP_NOCOPYBITS);
  }

  HBRUSH TextGround(HDC context) override {
    if (Ground != Label::Ground::White) return nullptr;
    ::SetBkColor(context, RGB(255, 255, 255));
    ::SetTextColor(context, RGB(0, 0, 0));
    return static_cast<HBRUSH>(::GetStockObject(WHITE_BRUSH));
  }

  const Label::Ground Ground;
};

}  // namespace

Label::Label(const Container& container, int left, int top, const Font& font, Ground ground) {
  CreateControl(MakeState<LabelState>(state_, ground), container, {left, top, 0, 0},
                {"STATIC", SS_LEFTNOWORDWRAP | SS_NOPREFIX}, {}, font);
}

}  // namespace platform
