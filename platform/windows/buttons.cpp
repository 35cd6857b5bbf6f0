#include "platform/controls.h"
#include "platform/windows/state.h"

namespace platform {
namespace {

constexpr int IconSide = 32;
constexpr BYTE Whole = 255, Faded = 85;  // how strong the icon is; faded on a button that is switched off
constexpr int FocusInset = 3;

void Blend(HDC context, const RECT& place, const ButtonImage& image, BYTE strength) {
  const HDC source = ::CreateCompatibleDC(context);
  const HGDIOBJ before = ::SelectObject(source, image.Bitmap.get());
  ::GdiAlphaBlend(context, place.left, place.top, place.right - place.left, place.bottom - place.top, source, 0, 0,
                  image.Side, image.Side, {AC_SRC_OVER, 0, strength, AC_SRC_ALPHA});
  ::SelectObject(source, before);
  ::DeleteDC(source);
}

int SideOf(const ControlState& control) { return Scaled(IconSide, control.Owner->Dpi); }

bool ShowsFocus(const NMCUSTOMDRAW& face) {
  return (face.uItemState & CDIS_FOCUS) != 0 &&
         (::SendMessageA(face.hdr.hwndFrom, WM_QUERYUISTATE, 0, 0) & UISF_HIDEFOCUS) == 0;
}

void DrawFace(const ControlState& control, const NMCUSTOMDRAW& face) {
  RECT place = face.rc;
  const int side = SideOf(control);
  const int left = (place.left + place.right - side) / 2, top = (place.top + place.bottom - side) / 2;
  Blend(face.hdc, {left, top, left + side, top + side}, control.Image, control.Enabled ? Whole : Faded);
  if (!ShowsFocus(face)) return;
  ::InflateRect(&place, -FocusInset, -FocusInset);
  ::DrawFocusRect(face.hdc, &place);
}

void ShowIcon(ControlState& control, int id) {
  control.LayOut = [&control, id] {
    control.Image = LoadButtonImage(id, SideOf(control));
    if (::IsWindowVisible(control.Handle)) ::InvalidateRect(control.Handle, nullptr, TRUE);
  };
  control.LayOut();
}

// A button of the style that shows an icon in place of its text, which is the tool tip and serves as its name.
void CreateIconButton(ControlState& control, const Container& container, const Bounds& bounds, DWORD style, int icon,
                      const std::string& toolTip) {
  CreateControl(control, container, bounds, {"BUTTON", WS_TABSTOP | style}, toolTip);
  control.Caption.clear();
  control.ToolTip = toolTip;
  control.NamedByToolTip = true;
  PressOnEnter(control);
  control.DrawFace = [&control](const NMCUSTOMDRAW& face) { DrawFace(control, face); };
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
