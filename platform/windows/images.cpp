#include "platform/controls.h"
#include "platform/windows/pictures.h"
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

// Keys or clicks, which may soon ask for another picture.
bool InputWaits() { return HIWORD(::GetQueueStatus(QS_KEY | QS_MOUSEBUTTON | QS_POSTMESSAGE)) != 0; }

// Timers come once no input waits. The box is not just left invalid: who repaints windows until none is would not end.
void DrawLater(HWND box) {
  constexpr UINT_PTR Timer = 1;
  ::SetTimer(box, Timer, USER_TIMER_MINIMUM, [](HWND handle, UINT, UINT_PTR timer, DWORD) {
    ::KillTimer(handle, timer);
    ::InvalidateRect(handle, nullptr, FALSE);
  });
}

void DrawBox(ControlState& box, const DRAWITEMSTRUCT& item) {
  const SIZE place = {item.rcItem.right - item.rcItem.left, item.rcItem.bottom - item.rcItem.top};
  if (box.Next && box.Shown && InputWaits()) {
    DrawLater(box.Handle);
  } else if (box.Next) {
    if (PixelsFor(box.Next, place) != nullptr) box.Shown = box.Next;
    box.Next = {};
  }
  if (!DrawPicture(item.hDC, item.rcItem, box.Shown)) {
    ::FillRect(item.hDC, &item.rcItem, ::GetSysColorBrush(COLOR_BTNFACE));
  }
}

}  // namespace

ImageBox::ImageBox(const Container& container, const Bounds& bounds) {
  CreateControl(*state_, container, bounds, {"STATIC", SS_OWNERDRAW});
  state_->Draw = [this](const DRAWITEMSTRUCT& item) { DrawBox(*state_, item); };
}

void ImageBox::SetPicture(const Picture& picture) {
  if (state_->Handle == nullptr) return;
  state_->Next = picture;
  if (!picture) state_->Shown = {};
  ::InvalidateRect(state_->Handle, nullptr, FALSE);
}

Picture ImageBox::ShownPicture() const { return state_->Next ? state_->Next : state_->Shown; }

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
