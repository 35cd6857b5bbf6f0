#include "platform/windows/buttons.h"

#include "platform/windows/events.h"

namespace platform {
namespace {

constexpr int IconSide = 32;

struct CheckBoxState : ButtonState {
  explicit CheckBoxState(const CheckBox& object) : Object(object) {}

  void Remember() override { LastValue = Object.Value(); }

  const CheckBox& Object;
  int LastValue = 0;
};

// A button of the style that shows an icon in place of its text, which is the tool tip and serves as its name. With
// BS_ICON and an image Windows draws the icon alone, themed or not.
void CreateIconButton(ButtonState& button, const Container& container, const Bounds& bounds, DWORD style, int icon,
                      const std::string& toolTip) {
  CreateControl(button, container, bounds, {"BUTTON", WS_TABSTOP | BS_ICON | style}, toolTip);
  button.Caption.clear();
  button.ToolTip = toolTip;
  button.NamedByToolTip = true;
  button.IconId = icon;
  if (button.Handle != nullptr) button.LayOut();
}

}  // namespace

bool ButtonState::OnKey(int key, bool repeated) {
  if (key != VK_RETURN) return false;
  if (!repeated) ::SendMessageA(Handle, BM_CLICK, 0, 0);
  return true;
}

void ButtonState::LayOut() {
  if (IconId == 0) return;
  IconHandle next = LoadIconFor(IconId, Scaled(IconSide, Owner->Dpi));
  ::SendMessageA(Handle, BM_SETIMAGE, IMAGE_ICON, reinterpret_cast<LPARAM>(next.get()));
  Icon.swap(next);
}

void PushButtonState::OnNotification(int code) {
  if (code == BN_CLICKED || code == BN_DOUBLECLICKED) Raise(Handler);
}

Button::Button(const Container& container, const Bounds& bounds, const std::string& caption, const Font& font) {
  auto& state = MakeState<PushButtonState>(state_, OnClick);
  CreateControl(state, container, bounds, {"BUTTON", WS_TABSTOP | BS_PUSHBUTTON | BS_MULTILINE}, caption, font);
}

Button::Button(const Container& container, const Bounds& bounds, int icon, const std::string& toolTip) {
  CreateIconButton(MakeState<PushButtonState>(state_, OnClick), container, bounds, BS_PUSHBUTTON, icon, toolTip);
}

void Button::SetIcon(int id) {
  auto& button = static_cast<ButtonState&>(*state_);
  if (button.Handle == nullptr || button.IconId == 0) return;
  button.IconId = id;
  button.LayOut();
}

CheckBox::CheckBox(const Container& container, const Bounds& bounds, int icon, const std::string& toolTip) {
  auto& state = MakeState<CheckBoxState>(state_, *this);
  CreateIconButton(state, container, bounds, BS_AUTOCHECKBOX | BS_PUSHLIKE, icon, toolTip);
}

int CheckBox::Value() const {
  if (state_->Handle == nullptr) return static_cast<const CheckBoxState&>(*state_).LastValue;
  return ::SendMessageA(state_->Handle, BM_GETCHECK, 0, 0) == BST_CHECKED ? 1 : 0;
}

void CheckBox::SetValue(int value) {
  if (value == Value()) return;
  ::SendMessageA(state_->Handle, BM_SETCHECK, value == 1 ? BST_CHECKED : BST_UNCHECKED, 0);
}

}  // namespace platform
