#include <windows.h>

#include "platform/windows/control.h"
#include "platform/windows/pictures.h"

namespace platform {
namespace {

// Keys or clicks, which may soon ask for another picture.
bool InputWaits() { return HIWORD(::GetQueueStatus(QS_KEY | QS_MOUSEBUTTON | QS_POSTMESSAGE)) != 0; }

// Timers come once no input waits. The box is not just left invalid: who repaints windows until none is would not end.
void DrawLater(HWND box) {
  constexpr UINT_PTR number = 1;
  ::SetTimer(box, number, USER_TIMER_MINIMUM, [](HWND handle, UINT, UINT_PTR timer, DWORD) {
    ::KillTimer(handle, timer);
    ::InvalidateRect(handle, nullptr, FALSE);
  });
}

struct ImageBoxState : ControlState {
  ImageBoxState() {
    DrawsItself = true;
    ShowsText = false;
  }

  void Draw(const DRAWITEMSTRUCT& item) override {
    const SIZE place = {item.rcItem.right - item.rcItem.left, item.rcItem.bottom - item.rcItem.top};
    if (Next && Shown && InputWaits()) {
      DrawLater(Handle);
    } else if (Next) {
      if (PixelsFor(Next, place) != nullptr) Shown = Next;
      Next = {};
    }
    if (!DrawPicture(item.hDC, item.rcItem, Shown)) {
      ::FillRect(item.hDC, &item.rcItem, ::GetSysColorBrush(COLOR_BTNFACE));
    }
  }

  Picture Shown, Next;  // Next: set, and not drawn yet
};

}  // namespace

ImageBox::ImageBox(const Container& container, const Bounds& bounds) {
  CreateControl(MakeState<ImageBoxState>(state_), container, bounds, {"STATIC", SS_OWNERDRAW});
}

void ImageBox::SetPicture(const Picture& picture) {
  auto& box = static_cast<ImageBoxState&>(*state_);
  if (box.Handle == nullptr) return;
  box.Next = picture;
  if (!picture) box.Shown = {};
  ::InvalidateRect(box.Handle, nullptr, FALSE);
}

Picture ImageBox::ShownPicture() const {
  const auto& box = static_cast<const ImageBoxState&>(*state_);
  return box.Next ? box.Next : box.Shown;
}

}  // namespace platform
