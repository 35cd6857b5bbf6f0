// What stands behind the windows and controls of the program.
#pragma once

#include <windows.h>

#include <functional>
#include <string>
#include <vector>

#include "platform/controls.h"
#include "platform/windows/icons.h"
#include "platform/windows/screen.h"

namespace platform {

struct WindowState {
  Window& Object;
  WindowStyle Style;      // its caption is the last one
  HWND Handle = nullptr;  // null once the window is closed
  int Dpi = UsualDpi;
  bool Closing = false;
  Picture Background;
  std::vector<ControlState*> Controls;  // in the order of creation
  std::vector<TimerState*> Timers;
  HWND Focus = nullptr;             // the control that has the keyboard while the window is active
  HWND ToolTips = nullptr;          // made when the mouse first comes
  std::vector<HWND> Disabled;       // the windows that this modal one has disabled
  IconHandle LargeIcon, SmallIcon;  // once its resolution is not the one that its class has an icon for
  RECT LastPlace = {};              // once closed
  bool LastEnabled = true;
};

struct ControlState {
  WindowState* Owner = nullptr;  // null once the window object is gone
  HWND Handle = nullptr;         // null once the window is closed
  WNDPROC Native = nullptr;      // what the control's class does with a message
  Bounds Place = {};             // in the window's client area, twips
  Font Face;
  std::string Caption, ToolTip;
  bool NamedByToolTip = false;  // the native text is the tool tip
  bool WhiteGround = false;
  IconHandle Image;
  Picture Shown, Next;      // Next: set, and not drawn yet
  bool EnterIsKey = false;  // Enter goes to OnKey and not to the window

  // Once the window is closed.
  bool LastEnabled = true, LastVisible = true;
  std::vector<std::string> LastTexts;
  int LastValue = -1;  // the selection, or the check mark

  // What a kind of control does in its own way; each may be empty.
  std::function<void()> LayOut;                       // after the resolution or the caption has changed
  std::function<void(int code)> OnNotification;       // the high word of WM_COMMAND
  std::function<bool(int key, bool repeated)> OnKey;  // WM_KEYDOWN; true: that was all
  std::function<void(const DRAWITEMSTRUCT&)> Draw;
  std::function<void()> Remember;  // keeps what is asked for after the window is closed
};

struct TimerState {
  Timer& Object;
  WindowState* Owner;
  UINT Interval;
  bool Enabled = false;
};

// All window objects of the program; the first is the main window.
std::vector<WindowState*>& AllWindows();
WindowState* FindWindowState(HWND handle);

// The window that a message or a modal window belongs to: the active one, else the last one shown that takes input.
HWND OwnerForModal();

inline constexpr char WindowClass[] = "TolvarisWindow";
void RegisterWindowClass();

// Moves the window (pixels of the screen) and makes its client area as large as its style asks.
void PlaceWindow(WindowState& window, int left, int top);

// Everything that depends on the window's resolution, its own size excepted.
void LayOutWindow(WindowState& window);

// While it lives events are handled by a loop of their own, whose handlers may let pending ones run.
class OwnEventLoop {
 public:
  OwnEventLoop();
  ~OwnEventLoop();
  OwnEventLoop(const OwnEventLoop&) = delete;
  OwnEventLoop& operator=(const OwnEventLoop&) = delete;

 private:
  const bool outer_;
};

// Handles one event, the keyboard's rules for a window with controls included.
void HandleEvent(MSG& event);

// What comes before the native window is destroyed, once: OnUnload, unless the object is going already, and the last
// answers.
void PrepareToClose(WindowState& window, bool unload);

// Creates the native control in its container and ties it to the state.
struct NativeControl {
  const char* Class;
  DWORD Style;
  DWORD ExtendedStyle = 0;
};
void CreateControl(ControlState& control, const Container& container, const Bounds& bounds, const NativeControl& native,
                   const std::string& text = {}, const Font& font = {});

// Puts the control where its bounds say at the window's resolution, in its font.
void LayOutControl(ControlState& control);

// What the native control is, and after its window is closed was: the control's own state, whether or not its window is
// enabled and shown.
bool IsEnabled(const ControlState& control);
bool IsVisible(const ControlState& control);

// Keeps the control's last answers, before its window is destroyed.
void RememberControl(ControlState& control);

void SetNativeText(const ControlState& control, const std::string& text);

// Tells the tool tips what the control's tip is, and where the control lies while it is disabled.
void UpdateToolTip(const ControlState& control);

// From now on the window has tool tips. They cost the start of the program more than its controls, so they wait until
// the mouse comes to a control that has one.
void StartToolTips(WindowState& window);

// Enter presses the button that has the keyboard; a key that is held down does so once.
void PressOnEnter(ControlState& button);

// Calls a handler of the program's logic. What it throws ends here.
template <typename Handler, typename... Arguments>
void Raise(const Handler& handler, Arguments... arguments) noexcept {
  try {
    const Handler kept = handler;  // it may be replaced while it runs
    if (kept) kept(arguments...);
  } catch (...) {
  }
}

// What a button does when it is notified. A second click that follows at once is a click like any other.
inline auto RaiseWhenClicked(const std::function<void()>& handler) {
  return [&handler](int code) {
    if (code == BN_CLICKED || code == BN_DOUBLECLICKED) Raise(handler);
  };
}

}  // namespace platform
