// What stands behind a window.
#pragma once

#include <windows.h>

#include <vector>

#include "platform/controls.h"
#include "platform/windows/icons.h"
#include "platform/windows/screen.h"

namespace platform {

struct WindowState {
  WindowState(Window& object, const WindowStyle& style) : Object(object), Style(style) {}

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

// All window objects of the program; the first is the main window.
std::vector<WindowState*>& AllWindows();
WindowState* FindWindowState(HWND handle);

// The window that a message or a modal window belongs to: the active one, else the last one shown that takes input.
HWND OwnerForModal();

inline constexpr char WindowClass[] = "TolvarisWindow";
void RegisterWindowClass();

// Everything that depends on the window's resolution, its own size excepted.
void LayOutWindow(WindowState& window);

// What comes before the native window is destroyed, once: OnUnload, unless the object is going already, and the last
// answers.
void PrepareToClose(WindowState& window, bool unload);

}  // namespace platform
