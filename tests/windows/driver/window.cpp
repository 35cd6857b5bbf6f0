#include "tests/windows/driver/window.h"

#include <algorithm>
#include <array>
#include <functional>

#include "tests/windows/driver/waiting.h"

namespace {

constexpr char DialogClass[] = "#32770";
constexpr UINT AnswerLimit = 5000;  // milliseconds that a window may take to answer
constexpr DWORD PressLimit = 3000;  // and a control to go down under the mouse
constexpr int MostControls = 12;    // of one window

// A place of the client area, in twips, as pixels of the screen.
POINT OnScreen(HWND window, int left, int top) {
  const int dotsPerInch = static_cast<int>(GetDpiForSystem());
  POINT place{MulDiv(left, dotsPerInch, 1440), MulDiv(top, dotsPerInch, 1440)};
  ClientToScreen(window, &place);
  return place;
}

// Sent as Unicode: Wine hands texts of another process over unconverted otherwise.
LRESULT Ask(HWND window, UINT message, WPARAM number = 0, LPARAM data = 0) {
  DWORD_PTR result = 0;
  return SendMessageTimeoutW(window, message, number, data, SMTO_NORMAL, AnswerLimit, &result) != 0
             ? static_cast<LRESULT>(result)
             : -1;
}

std::string AskText(HWND window, UINT lengthMessage, UINT textMessage, WPARAM number) {
  const LRESULT length = Ask(window, lengthMessage, number);
  if (length <= 0) return {};
  std::wstring text(static_cast<size_t>(length) + 1, L'\0');
  const WPARAM argument = textMessage == WM_GETTEXT ? text.size() : number;
  const LRESULT got = Ask(window, textMessage, argument, reinterpret_cast<LPARAM>(text.data()));
  text.resize(static_cast<size_t>(std::clamp<LRESULT>(got, 0, length)));
  return FromWide(text);
}

BOOL CALLBACK AddTo(HWND window, LPARAM windows) {
  reinterpret_cast<std::vector<Window>*>(windows)->emplace_back(window);
  return TRUE;
}

using Condition = std::function<bool(const Window&)>;

// None is a window that is false.
Window First(const std::vector<Window>& windows, const Condition& wanted) {
  const auto found = std::find_if(windows.begin(), windows.end(), wanted);
  return found == windows.end() ? Window() : *found;
}

Window FirstTopWindow(const Program& program, const Condition& wanted) {
  std::vector<Window> windows;
  EnumWindows(AddTo, reinterpret_cast<LPARAM>(&windows));
  return First(windows, [&](const Window& window) {
    DWORD owner = 0;
    GetWindowThreadProcessId(window.Handle(), &owner);
    return owner == program.Id() && window.Visible() && wanted(window);
  });
}

GUITHREADINFO ThreadOf(HWND window) {
  GUITHREADINFO info{};
  info.cbSize = sizeof info;
  GetGUIThreadInfo(GetWindowThreadProcessId(window, nullptr), &info);
  return info;
}

// Presses or releases the mouse's button. Each event carries its own place, in 65536ths of the screen: a window that
// has just come under the pointer can set it back to where the display had it.
void UseMouse(POINT place, DWORD event) {
  const auto normalised = [](LONG pixel, int size) {
    return static_cast<DWORD>(MulDiv(pixel, 65536, size) + 32768 / size);
  };
  mouse_event(event | MOUSEEVENTF_MOVE | MOUSEEVENTF_ABSOLUTE, normalised(place.x, GetSystemMetrics(SM_CXSCREEN)),
              normalised(place.y, GetSystemMetrics(SM_CYSCREEN)), 0, 0);
}

// A person sees a control go down under the mouse before he lets go, and presses again when it did not: while the
// display still moves the focus to a window that has just come, a press can be lost.
void ClickOnce(HWND window, POINT place) {
  for (int tries = 0; tries < 3; ++tries) {
    UseMouse(place, MOUSEEVENTF_LEFTDOWN);
    const bool down = Eventually([&] { return ThreadOf(window).hwndCapture != nullptr; }, PressLimit);
    UseMouse(place, MOUSEEVENTF_LEFTUP);
    if (down) return;
  }
}

// A window that has just come takes what a person does only once it is in front.
void ClickMiddle(HWND window, RECT area, int times) {
  const POINT place = {(area.left + area.right) / 2, (area.top + area.bottom) / 2};
  const HWND top = GetAncestor(window, GA_ROOT);
  EXPECT_SOON(GetForegroundWindow() == top) << "\nthe window does not come to the front";
  SetCursorPos(place.x, place.y);
  if (times == 1) return ClickOnce(window, place);
  for (const DWORD event : {MOUSEEVENTF_LEFTDOWN, MOUSEEVENTF_LEFTUP, MOUSEEVENTF_LEFTDOWN, MOUSEEVENTF_LEFTUP}) {
    UseMouse(place, event);
  }
}

Message AnswerBy(const Program& program, const std::function<void(HWND)>& press) {
  Window dialog;
  if (!Eventually([&] { return static_cast<bool>(dialog = FindMessage(program)); })) return {};
  Message message{dialog.Text(), "", {}};
  for (const Window& child : dialog.Children()) {
    if (child.Class() == "Static" && !child.Text().empty()) message.Text = child.Text();
    if (child.Class() == "Button" && child.Visible()) message.Buttons.push_back(GetDlgCtrlID(child.Handle()));
  }
  press(dialog.Handle());
  return Eventually([&] { return !dialog.Visible(); }) ? message : Message{};
}

}  // namespace

std::string FromWide(const std::wstring& wide) {
  std::string text;
  for (const wchar_t letter : wide) text += static_cast<char>(letter);
  return text;
}

std::string Window::Text() const { return AskText(handle_, WM_GETTEXTLENGTH, WM_GETTEXT, 0); }

std::string Window::Class() const {
  std::array<char, 64> name{};
  GetClassNameA(handle_, name.data(), static_cast<int>(name.size()));
  return name.data();
}

bool Window::Focused() const { return handle_ != nullptr && ThreadOf(handle_).hwndFocus == handle_; }

RECT Window::Place() const {
  RECT place{};
  GetWindowRect(handle_, &place);
  return place;
}

std::vector<Window> Window::Children() const {
  std::vector<Window> children;
  EnumChildWindows(handle_, AddTo, reinterpret_cast<LPARAM>(&children));
  return children;
}

Window Window::ChildAt(int left, int top) const {
  const POINT place = OnScreen(handle_, left, top);
  return First(Children(), [&](const Window& child) {
    const RECT area = child.Place();
    return area.left == place.x && area.top == place.y;
  });
}

Window Window::Child(const std::string& text) const {
  return First(Children(), [&](const Window& child) { return child.Text() == text; });
}

std::string Window::Picture() const {
  const RECT place = Place();
  BITMAPINFO format{};
  BITMAPINFOHEADER& header = format.bmiHeader;
  header = {sizeof header, place.right - place.left, place.bottom - place.top, 1, 32, BI_RGB, 0, 0, 0, 0, 0};
  const size_t size = static_cast<size_t>(4 * header.biWidth * header.biHeight);
  void* pixels = nullptr;
  const HDC screen = GetDC(nullptr);
  const HDC copy = CreateCompatibleDC(screen);
  const HBITMAP bitmap = CreateDIBSection(screen, &format, DIB_RGB_COLORS, &pixels, nullptr, 0);
  const HGDIOBJ before = SelectObject(copy, bitmap);
  BitBlt(copy, 0, 0, header.biWidth, header.biHeight, screen, place.left, place.top, SRCCOPY);
  GdiFlush();
  const auto bytes = [](const void* data, size_t length) {
    return std::string(static_cast<const char*>(data), length);
  };
  const DWORD start = sizeof(BITMAPFILEHEADER) + sizeof header;
  const BITMAPFILEHEADER file{0x4D42, start + static_cast<DWORD>(size), 0, 0, start};  // "BM"
  std::string picture = bytes(&file, sizeof file) + bytes(&header, sizeof header) + bytes(pixels, size);
  SelectObject(copy, before);
  DeleteObject(bitmap);
  DeleteDC(copy);
  ReleaseDC(nullptr, screen);
  return picture;
}

COLORREF Window::Colour(int left, int top) const {
  const POINT place = OnScreen(handle_, left, top);
  const HDC screen = GetDC(nullptr);
  const COLORREF colour = GetPixel(screen, place.x, place.y);
  ReleaseDC(nullptr, screen);
  return colour;
}

void Window::FinishPainting() const {
  RedrawWindow(handle_, nullptr, nullptr, RDW_UPDATENOW | RDW_ALLCHILDREN);
  Ask(handle_, WM_NULL);
}

void Window::Click() const { ClickMiddle(handle_, Place(), 1); }

void Window::CloseByUser() const { PostMessageW(handle_, WM_SYSCOMMAND, SC_CLOSE, 0); }

Window FindVisible(const Program& program, const std::string& title) {
  return FirstTopWindow(program,
                        [&](const Window& window) { return window.Class() != DialogClass && window.Text() == title; });
}

Window FindMessage(const Program& program) {
  return FirstTopWindow(program, [](const Window& window) { return window.Class() == DialogClass; });
}

std::vector<std::string> Entries(const Window& control) {
  const bool isList = control.Class() == "ListBox";
  const LRESULT count = Ask(control.Handle(), isList ? LB_GETCOUNT : CB_GETCOUNT);
  std::vector<std::string> entries;
  for (LRESULT i = 0; i < count; ++i) {
    entries.push_back(AskText(control.Handle(), isList ? LB_GETTEXTLEN : CB_GETLBTEXTLEN,
                              isList ? LB_GETTEXT : CB_GETLBTEXT, static_cast<WPARAM>(i)));
  }
  return entries;
}

std::string SelectedEntry(const Window& list) {
  const LRESULT selected = Ask(list.Handle(), LB_GETCURSEL);
  return selected < 0 ? "" : AskText(list.Handle(), LB_GETTEXTLEN, LB_GETTEXT, static_cast<WPARAM>(selected));
}

void ClickEntry(const Window& list, const std::string& text, int times) {
  const std::vector<std::string> entries = Entries(list);
  const auto entry = std::find(entries.begin(), entries.end(), text);
  ASSERT_TRUE(entry != entries.end()) << "the list has no entry " << text;
  RECT area{};
  Ask(list.Handle(), LB_GETITEMRECT, static_cast<WPARAM>(entry - entries.begin()), reinterpret_cast<LPARAM>(&area));
  MapWindowPoints(list.Handle(), nullptr, reinterpret_cast<POINT*>(&area), 2);
  ClickMiddle(list.Handle(), area, times);
}

void PressKey(WORD key) { HoldKey(key, 0); }

void HoldKey(WORD key, int repeats) {
  for (int i = 0; i <= repeats; ++i) keybd_event(static_cast<BYTE>(key), 0, 0, 0);
  keybd_event(static_cast<BYTE>(key), 0, KEYEVENTF_KEYUP, 0);
}

void PressWith(WORD modifier, WORD key) {
  keybd_event(static_cast<BYTE>(modifier), 0, 0, 0);
  PressKey(key);
  keybd_event(static_cast<BYTE>(modifier), 0, KEYEVENTF_KEYUP, 0);
}

void TypeText(const std::string& text) {
  for (const char letter : text) {
    for (const DWORD event : {DWORD{0}, DWORD{KEYEVENTF_KEYUP}}) {
      INPUT input{};
      input.type = INPUT_KEYBOARD;
      input.ki.wScan = static_cast<unsigned char>(letter);
      input.ki.dwFlags = KEYEVENTF_UNICODE | event;
      SendInput(1, &input, sizeof input);
    }
  }
}

bool TabTo(const Window& control) {
  for (int i = 0; i < MostControls && !control.Focused(); ++i) {
    const HWND before = ThreadOf(control.Handle()).hwndFocus;
    PressKey(VK_TAB);
    if (!Eventually([&] { return ThreadOf(control.Handle()).hwndFocus != before; })) return false;
  }
  return control.Focused();
}

void PrintTo(const Message& message, std::ostream* out) {
  *out << "message \"" << message.Text << "\" titled \"" << message.Title << "\", buttons";
  for (const int button : message.Buttons) *out << ' ' << button;
}

Message Answer(const Program& program, int button) {
  return AnswerBy(program, [&](HWND dialog) { Window(GetDlgItem(dialog, button)).Click(); });
}

Message AnswerWithKey(const Program& program, WORD key) {
  return AnswerBy(program, [&](HWND dialog) {
    EXPECT_SOON(GetForegroundWindow() == dialog && GetAncestor(ThreadOf(dialog).hwndFocus, GA_ROOT) == dialog);
    PressKey(key);
  });
}
