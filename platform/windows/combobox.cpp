#include "platform/controls.h"
#include "platform/windows/state.h"

namespace platform {
namespace {

constexpr int DropHeight = 2400;  // twips; the native control's height includes its drop-down list

}  // namespace

ComboBox::ComboBox(const Container& container, const Bounds& bounds) {
  Bounds dropped = bounds;
  dropped.Height += DropHeight;
  CreateControl(*state_, container, dropped, {"COMBOBOX", WS_TABSTOP | WS_VSCROLL | CBS_DROPDOWNLIST});
  state_->OnNotification = [this](int code) {
    if (code == CBN_SELCHANGE) Raise(OnClick);
  };
  state_->Remember = [this] { state_->LastValue = Selected(); };
}

void ComboBox::Add(const std::string& text) {
  ::SendMessageA(state_->Handle, CB_ADDSTRING, 0, reinterpret_cast<LPARAM>(text.c_str()));
}

int ComboBox::Selected() const {
  if (state_->Handle == nullptr) return state_->LastValue;
  return static_cast<int>(::SendMessageA(state_->Handle, CB_GETCURSEL, 0, 0));
}

void ComboBox::Select(int index) { ::SendMessageA(state_->Handle, CB_SETCURSEL, static_cast<WPARAM>(index), 0); }

}  // namespace platform
