#include "platform/controls.h"
#include "platform/windows/state.h"

namespace platform {
namespace {

constexpr int IconSide = 32;

// The button draws the icon that it is given last, and its owner destroys it after that.
void ShowIcon(ControlState& control, int id) {
  control.LayOut = [&control, id] {
    IconHandle next = LoadIconFor(id, Scaled(IconSide, control.Owner->Dpi));
    ::SendMessageA(control.Handle, BM_SETIMAGE, IMAGE_ICON, reinterpret_cast<LPARAM>(next.get()));
    control.Image.swap(next);
  };
  control.LayOut();
}

// A button of the style that shows an icon in place of its text, which is the tool tip and serves as its name: with
// BS_ICON and an image Windows documents that the icon alone is drawn.
void CreateIconButton(ControlState& control, const Container& container, const Bounds& bounds, DWORD style, int icon,
                      const std::string& toolTip) {
  CreateControl(control, container, bounds, {"BUTTON", WS_TABSTOP | BS_ICON | style}, toolTip);
  control.Caption.clear();
  control.ToolTip = toolTip;
  control.NamedByToolTip = true;
  PressOnEnter(control);
  if (control.Handle != nullptr) ShowIcon(control, icon);
}

}  // namespace

void PressOnEnter(ControlState& control) {
  control.EnterIsKey = true;
  control.OnKey = [&control](int key, bool repeated) {
    if (key != VK_RETURN) return false;
    if (!repeated) ::SendMessageA(control.Handle, BM_CLICK, 0, 0);
    return true;
  };
}

Button::Button(const Container& container, const Bounds& bounds, const std::string& caption, const Font& font) {
  CreateControl(*state_, container, bounds, {"BUTTON", WS_TABSTOP | BS_PUSHBUTTON | BS_MULTILINE}, caption, font);
  PressOnEnter(*state_);
  state_->OnNotification = RaiseWhenClicked(OnClick);
}

Button::Button(const Container& container, const Bounds& bounds, int icon, const std::string& toolTip) {
  CreateIconButton(*state_, container, bounds, BS_PUSHBUTTON, icon, toolTip);
  state_->OnNotification = RaiseWhenClicked(OnClick);
}

void Button::SetIcon(int id) {
  if (state_->Handle != nullptr && state_->NamedByToolTip) ShowIcon(*state_, id);
}

CheckBox::CheckBox(const Container& container, const Bounds& bounds, int icon, const std::string& toolTip) {
  CreateIconButton(*state_, container, bounds, BS_AUTOCHECKBOX | BS_PUSHLIKE, icon, toolTip);
  state_->LastValue = 0;
  state_->Remember = [this] { state_->LastValue = Value(); };
}

int CheckBox::Value() const {
  if (state_->Handle == nullptr) return state_->LastValue;
  return ::SendMessageA(state_->Handle, BM_GETCHECK, 0, 0) == BST_CHECKED ? 1 : 0;
}

void CheckBox::SetValue(int value) {
  if (value == Value()) return;
  ::SendMessageA(state_->Handle, BM_SETCHECK, value == 1 ? BST_CHECKED : BST_UNCHECKED, 0);
}

}  // namespace platform
