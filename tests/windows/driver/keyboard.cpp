#include "tests/windows/driver/keyboard.h"

#include <array>

#include "tests/windows/driver/file_dialog.h"
#include "tests/windows/driver/waiting.h"

namespace driver {

namespace {

constexpr int MostControls = 12;
constexpr DWORD TabLimit = 2000;  // milliseconds for the keyboard to go from one control to the next

HWND FocusOf(const Window& window) {
  GUITHREADINFO info{};
  info.cbSize = sizeof info;
  GetGUIThreadInfo(GetWindowThreadProcessId(window.Handle(), nullptr), &info);
  return info.hwndFocus;
}

}  // namespace

void PressWith(WORD modifier, WORD key) {
  std::array<INPUT, 4> inputs{};
  const std::array<WORD, 4> keys = {modifier, key, key, modifier};
  for (size_t i = 0; i < inputs.size(); ++i) {
    inputs[i].type = INPUT_KEYBOARD;
    inputs[i].ki.wVk = keys[i];
    inputs[i].ki.dwFlags = i < 2 ? 0 : KEYEVENTF_KEYUP;
  }
  SendInput(UINT{inputs.size()}, inputs.data(), sizeof(INPUT));
}

bool TabTo(const Window& control) {
  for (int i = 0; i < MostControls && !control.Focused(); ++i) {
    const HWND before = FocusOf(control);
    PressKey(VK_TAB);
    if (!Eventually([&] { return FocusOf(control) != before; }, TabLimit)) return false;
  }
  return control.Focused();
}

std::vector<COLORREF> Appearance(const Window& control) {
  const RECT place = control.Place();
  const int width = place.right - place.left;
  const int height = place.bottom - place.top;
  BITMAPINFO format{};
  format.bmiHeader = {sizeof format.bmiHeader, width, height, 1, 32, BI_RGB, 0, 0, 0, 0, 0};
  std::vector<COLORREF> colours(static_cast<size_t>(width * height));
  const HDC screen = GetDC(nullptr);
  const HDC copy = CreateCompatibleDC(screen);
  const HBITMAP bitmap = CreateCompatibleBitmap(screen, width, height);
  const HGDIOBJ before = SelectObject(copy, bitmap);
  BitBlt(copy, 0, 0, width, height, screen, place.left, place.top, SRCCOPY);
  SelectObject(copy, before);
  GetDIBits(copy, bitmap, 0, static_cast<UINT>(height), colours.data(), &format, DIB_RGB_COLORS);
  DeleteObject(bitmap);
  DeleteDC(copy);
  ReleaseDC(nullptr, screen);
  return colours;
}

Message AnswerWithKey(const Program& program, WORD key) {
  Window dialog;
  if (!Eventually([&] { return static_cast<bool>(dialog = FindMessage(program)); })) return {};
  const Message message = ReadMessage(dialog);
  EXPECT_SOON(GetForegroundWindow() == dialog.Handle() && GetAncestor(FocusOf(dialog), GA_ROOT) == dialog.Handle());
  PressKey(key);
  return Eventually([&] { return !dialog.Visible(); }) ? message : Message{};
}

void EnterPath(const Program& program, const std::string& path) {
  const FileDialog dialog(program);
  const Window window = FindMessage(program);
  PressWith(VK_CONTROL, 'A');
  TypeText(path);
  EXPECT_SOON_EQ(path, dialog.FileName());
  PressKey(VK_RETURN);
  EXPECT_SOON(!window);
}

}  // namespace driver
