// What stands behind a control of any kind. What only one kind has is in the file of that kind.
#pragma once

#include <windows.h>

#include <memory>
#include <string>
#include <utility>

#include "platform/controls.h"
#include "platform/windows/window.h"

namespace platform {

struct ControlState {
  ControlState() = default;
  virtual ~ControlState() = default;
  ControlState(const ControlState&) = delete;
  ControlState& operator=(const ControlState&) = delete;

  WindowState* Owner = nullptr;  // null once the window object is gone
  HWND Handle = nullptr;         // null once the window is closed
  WNDPROC Native = nullptr;      // what the control's class does with a message
  Bounds Place = {};             // in the window's client area, twips
  Font Face;
  std::string Caption, ToolTip, AccessibleName;
  bool NameIsTold = false;                      // to screen readers, as it is now
  bool NamedByToolTip = false;                  // the native text is the tool tip
  bool EnterIsKey = false;                      // Enter goes to OnKey and not to the window
  bool DrawsItself = false;                     // all of its area
  bool ShowsText = true;                        // the native text
  bool LastEnabled = true, LastVisible = true;  // once the window is closed

  // What a kind of control does in its own way.
  virtual void LayOut() {}                      // after the resolution or the caption has changed
  virtual void OnNotification(int /*code*/) {}  // the high word of WM_COMMAND
  virtual bool OnKey(int /*key*/, bool /*repeated*/) { return false; }  // WM_KEYDOWN; true: that was all
  virtual void Draw(const DRAWITEMSTRUCT& /*item*/) {}
  virtual HBRUSH TextGround(HDC /*context*/) { return nullptr; }  // also sets the text's colours; null: the usual ones
  virtual void Remember() {}                                      // keeps what is asked for after the window is closed
};

// Makes the state of a kind and puts it into its control.
template <typename State, typename... Arguments>
State& MakeState(std::unique_ptr<ControlState>& place, Arguments&&... arguments) {
  auto made = std::make_unique<State>(std::forward<Arguments>(arguments)...);
  State& state = *made;
  place = std::move(made);
  return state;
}

// Creates the native control in its container and ties it to the state.
struct NativeControl {
  const char* Class;
  DWORD Style;
  DWORD ExtendedStyle = 0;
};
void CreateControl(ControlState& control, const Container& container, const Bounds& bounds, const NativeControl& native,
                   const std::string& text = {}, const Font& font = {});

// The one of the window's controls that has this native one, or null.
ControlState* FindControl(const WindowState& window, HWND handle);

// Puts the control where its bounds say at the window's resolution, in its font.
void LayOutControl(ControlState& control);

// What the native control is, and after its window is closed was: the control's own state, whether or not its window is
// enabled and shown.
bool IsEnabled(const ControlState& control);
bool IsVisible(const ControlState& control);

// Keeps the control's last answers, before its window is destroyed.
void RememberControl(ControlState& control);

}  // namespace platform
