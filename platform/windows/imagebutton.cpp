#include "platform/windows/buttons.h"
#include "platform/windows/pictures.h"

namespace platform {
namespace {

// The usual line of dots would be lost in a picture this small.
void DrawFocus(HDC context, RECT place) {
  for (LONG width = (place.right - place.left) / 6; width > 0; --width) {
    ::FrameRect(context, &place, ::GetSysColorBrush(COLOR_HIGHLIGHT));
    ::InflateRect(&place, -1, -1);
  }
}

struct ImageButtonState : PushButtonState {
  explicit ImageButtonState(const std::function<void()>& handler) : PushButtonState(handler) {
    DrawsItself = true;
    NamedByToolTip = true;
  }

  void Draw(const DRAWITEMSTRUCT& item) override {
    RECT place = item.rcItem;
    ::FillRect(item.hDC, &place, ::GetSysColorBrush(COLOR_BTNFACE));
    if ((item.itemState & ODS_SELECTED) != 0) ::OffsetRect(&place, 1, 1);
    DrawPicture(item.hDC, place, Shown);
    if ((item.itemState & ODS_FOCUS) != 0) DrawFocus(item.hDC, item.rcItem);
  }

  Picture Shown;
};

}  // namespace

ImageButton::ImageButton(const Container& container, const Bounds& bounds, int picture, const std::string& toolTip) {
  auto& state = MakeState<ImageButtonState>(state_, OnClick);
  CreateControl(state, container, bounds, {"BUTTON", WS_TABSTOP | BS_OWNERDRAW});
  state.Shown = LoadPictureResource(picture);
  SetToolTip(toolTip);
}

}  // namespace platform
