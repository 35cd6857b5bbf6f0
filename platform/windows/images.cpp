#include "platform/controls.h"
#include "platform/windows/drawing.h"
#include "platform/windows/state.h"

namespace platform {
namespace {

// The usual line of dots would be lost in a picture this small.
void DrawFocus(HDC context, RECT place) {
  for (LONG width = (place.right - place.left) / 6; width > 0; --width) {
    ::FrameRect(context, &place, ::GetSysColorBrush(COLOR_HIGHLIGHT));
    ::InflateRect(&place, -1, -1);
  }
}

void DrawImageButton(const DRAWITEMSTRUCT& item, const Picture& picture) {
  RECT place = item.rcItem;
  ::FillRect(item.hDC, &place, ::GetSysColorBrush(COLOR_BTNFACE));
  if ((item.itemState & ODS_SELECTED) != 0) ::OffsetRect(&place, 1, 1);
  DrawPicture(item.hDC, place, picture);
  if ((item.itemState & ODS_FOCUS) != 0) DrawFocus(item.hDC, item.rcItem);
}

}  // namespace

ImageBox::ImageBox(const Container& container, const Bounds& bounds) {
  CreateControl(*state_, container, bounds, {"STATIC", SS_OWNERDRAW});
  state_->Draw = [this](const DRAWITEMSTRUCT& item) {
    if (state_->Shown) {
      DrawPicture(item.hDC, item.rcItem, state_->Shown);
    } else {
      ::FillRect(item.hDC, &item.rcItem, ::GetSysColorBrush(COLOR_BTNFACE));
    }
  };
}

void ImageBox::SetPicture(const Picture& picture) {
  if (state_->Handle == nullptr) return;
  state_->Shown = picture;
  ::InvalidateRect(state_->Handle, nullptr, FALSE);
}

Picture ImageBox::ShownPicture() const { return state_->Shown; }

ImageButton::ImageButton(const Container& container, const Bounds& bounds, int picture, const std::string& toolTip) {
  CreateControl(*state_, container, bounds, {"BUTTON", WS_TABSTOP | BS_OWNERDRAW});
  state_->Shown = LoadPictureResource(picture);
  state_->Draw = [this](const DRAWITEMSTRUCT& item) { DrawImageButton(item, state_->Shown); };
  state_->NamedByToolTip = true;
  PressOnEnter(*state_);
  state_->OnNotification = RaiseWhenClicked(OnClick);
  SetToolTip(toolTip);
}

}  // namespace platform
