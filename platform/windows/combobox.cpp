#include <windows.h>

#include "platform/windows/control.h"
#include "platform/windows/events.h"

namespace platform {
namespace {

constexpr int DropHeight = 2400;  // twips; the native control's height includes its drop-down list

struct ComboBoxState : ControlState {
  explicit ComboBoxState(const ComboBox& object) : Object(object) {}

  void OnNotification(int code) override {
    if (code == CBN_SELCHANGE) Raise(Object.OnClick);
  }

  void Remember() override { LastSelected = Object.Selected(); }

  const ComboBox& Object;
  int LastSelected = -1;
};

}  // namespace

ComboBox::ComboBox(const Container& container, const Bounds& bounds) {
  Bounds dropped = bounds;
  dropped.Height += DropHeight;
  CreateControl(MakeState<ComboBoxState>(state_, *this), container, dropped,
                {"COMBOBOX", WS_TABSTOP | WS_VSCROLL | CBS_DROPDOWNLIST});
}

void ComboBox::Add(const std::string& text) {
  ::SendMessageA(state_->Handle, CB_ADDSTRING, 0, reinterpret_cast<LPARAM>(text.c_str()));
}

int ComboBox::Selected() const {
  if (state_->Handle == nullptr) return static_cast<const ComboBoxState&>(*state_).LastSelected;
  return static_cast<int>(::SendMessageA(state_->Handle, CB_GETCURSEL, 0, 0));
}

void ComboBox::Select(int index) { ::SendMessageA(state_->Handle, CB_SETCURSEL, static_cast<WPARAM>(index), 0); }

}  // namespace platform
