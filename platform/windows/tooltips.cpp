// clang-format off
#include <windows.h>
#include <commctrl.h>
// clang-format on

#include "platform/windows/tooltips.h"

#include <algorithm>

namespace platform {
namespace {

// The size that every version of the common controls knows.
TTTOOLINFOA Tool(const ControlState& control) {
  TTTOOLINFOA tool{};
  tool.cbSize = TTTOOLINFOA_V2_SIZE;
  tool.hwnd = control.Owner->Handle;
  tool.lpszText = const_cast<char*>(control.ToolTip.c_str());  // the structure serves for reading, too
  return tool;
}

// The control itself, which gets the mouse's messages while it is enabled.
TTTOOLINFOA ControlTool(const ControlState& control) {
  TTTOOLINFOA tool = Tool(control);
  tool.uFlags = TTF_SUBCLASS | TTF_IDISHWND;
  tool.uId = reinterpret_cast<UINT_PTR>(control.Handle);
  return tool;
}

// Its place in the window, which gets them while the control is disabled.
TTTOOLINFOA PlaceTool(const ControlState& control) {
  TTTOOLINFOA tool = Tool(control);
  tool.uFlags = TTF_SUBCLASS;
  tool.uId = static_cast<UINT_PTR>(::GetDlgCtrlID(control.Handle));
  ::GetWindowRect(control.Handle, &tool.rect);
  ::MapWindowPoints(nullptr, tool.hwnd, reinterpret_cast<POINT*>(&tool.rect), 2);
  return tool;
}

// Their class is registered by none but this call where the controls have no visual styles.
void RegisterToolTips() {
  const INITCOMMONCONTROLSEX wanted = {sizeof wanted, ICC_BAR_CLASSES};  // tool tips are among these
  static const BOOL registered = ::InitCommonControlsEx(&wanted);
  static_cast<void>(registered);
}

HWND CreateToolTips(HWND window) {
  RegisterToolTips();
  return ::CreateWindowExA(WS_EX_TOPMOST, TOOLTIPS_CLASSA, nullptr, WS_POPUP | TTS_NOPREFIX | TTS_ALWAYSTIP,
                           CW_USEDEFAULT, CW_USEDEFAULT, CW_USEDEFAULT, CW_USEDEFAULT, window, nullptr,
                           ::GetModuleHandleA(nullptr), nullptr);
}

void Replace(HWND tips, TTTOOLINFOA tool, bool wanted) {
  ::SendMessageA(tips, TTM_DELTOOLA, 0, reinterpret_cast<LPARAM>(&tool));
  if (wanted) ::SendMessageA(tips, TTM_ADDTOOLA, 0, reinterpret_cast<LPARAM>(&tool));
}

// The mouse's own messages go past a control that is disabled, and a frame lies over the controls in it.
bool MouseAsksForToolTip(const WindowState& window) {
  POINT mouse = {};
  ::GetCursorPos(&mouse);
  return std::any_of(window.Controls.begin(), window.Controls.end(), [&](const ControlState* control) {
    RECT place = {};
    return !control->ToolTip.empty() && ::GetWindowRect(control->Handle, &place) && ::PtInRect(&place, mouse);
  });
}

}  // namespace

void UpdateToolTip(const ControlState& control) {
  if (control.Handle == nullptr) return;
  const HWND tips = control.Owner->ToolTips;
  if (tips == nullptr) return;
  const bool wanted = !control.ToolTip.empty();
  Replace(tips, ControlTool(control), wanted);
  Replace(tips, PlaceTool(control), wanted && IsVisible(control) && !IsEnabled(control));
}

void OfferToolTips(WindowState& window) {
  if (window.ToolTips != nullptr || !MouseAsksForToolTip(window)) return;
  window.ToolTips = CreateToolTips(window.Handle);
  for (const ControlState* control : window.Controls) UpdateToolTip(*control);
}

}  // namespace platform
