#include "tests/windows/driver/window.h"

#include <algorithm>
#include <array>
#include <functional>
#include <utility>

#include "tests/windows/driver/waiting.h"

namespace driver {

namespace {

constexpr char DialogClass[] = "#32770";
constexpr UINT AnswerLimit = 5000;  // milliseconds that a window may take to answer
constexpr DWORD PressLimit = 3000;  // and a control to go down under the mouse

int Pixels(int twips) {
  const HDC screen = GetDC(nullptr);
  const int pixels = MulDiv(twips, GetDeviceCaps(screen, LOGPIXELSX), 1440);
  ReleaseDC(nullptr, screen);
  return pixels;
}

// Sent as Unicode: Wine hands texts of another process over unconverted otherwise.
LRESULT Ask(HWND window, UINT message, WPARAM number = 0, LPARAM data = 0) {
  DWORD_PTR result = 0;
  return SendMessageTimeoutW(window, message, number, data, SMTO_NORMAL, AnswerLimit, &result) != 0
             ? static_cast<LRESULT>(result)
             : -1;
}

std::string FromWide(const std::wstring& wide) {
  std::string text(wide.size(), '\0');
  WideCharToMultiByte(CP_ACP, 0, wide.data(), static_cast<int>(wide.size()), text.data(), static_cast<int>(text.size()),
                      nullptr, nullptr);
  return text;
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

std::vector<std::string> AskTexts(HWND window, UINT countMessage, UINT lengthMessage, UINT textMessage) {
  std::vector<std::string> texts;
  const LRESULT count = Ask(window, countMessage);
  for (LRESULT i = 0; i < count; ++i) {
    texts.push_back(AskText(window, lengthMessage, textMessage, static_cast<WPARAM>(i)));
  }
  return texts;
}

using Visitor = std::function<bool(HWND)>;  // false ends the visit

BOOL CALLBACK Visit(HWND window, LPARAM visitor) { return (*reinterpret_cast<Visitor*>(visitor))(window); }

Window FirstTopWindow(const Program& program, const std::function<bool(const Window&)>& wanted) {
  Window found;
  Visitor visitor = [&](HWND handle) {
    DWORD owner = 0;
    GetWindowThreadProcessId(handle, &owner);
    const Window window(handle);
    if (owner == program.Id() && window.Visible() && wanted(window)) found = window;
    return !found;
  };
  EnumWindows(Visit, reinterpret_cast<LPARAM>(&visitor));
  return found;
}

// A window that has just come takes what a person does only once it is in front.
void WaitUntilInFront(HWND window) {
  const HWND top = GetAncestor(window, GA_ROOT);
  EXPECT_SOON(GetForegroundWindow() == top) << "\nthe window does not come to the front";
}

// A coordinate as SendInput wants it: the screen's size is 65536.
LONG Normalised(LONG pixel, int size) { return MulDiv(pixel, 65536, size) + 32768 / size; }

// Presses or releases the mouse's button so many times. Each event carries its own place: a window that has just come
// under the pointer can set it back to where the display had it.
void SendMouse(POINT place, const std::vector<DWORD>& events) {
  std::vector<INPUT> inputs;
  for (const DWORD event : events) {
    INPUT input{};
    input.type = INPUT_MOUSE;
    input.mi.dwFlags = event | MOUSEEVENTF_MOVE | MOUSEEVENTF_ABSOLUTE;
    input.mi.dx = Normalised(place.x, GetSystemMetrics(SM_CXSCREEN));
    input.mi.dy = Normalised(place.y, GetSystemMetrics(SM_CYSCREEN));
    inputs.push_back(input);
  }
  SendInput(static_cast<UINT>(inputs.size()), inputs.data(), sizeof(INPUT));
}

GUITHREADINFO ThreadOf(HWND window) {
  GUITHREADINFO info{};
  info.cbSize = sizeof info;
  GetGUIThreadInfo(GetWindowThreadProcessId(window, nullptr), &info);
  return info;
}

// A person sees a control go down under the mouse before he lets go, and presses again when it did not: while the
// display still moves the focus to a window that has just come, a press can be lost.
void ClickOnce(HWND window, POINT place) {
  for (int tries = 0; tries < 3; ++tries) {
    SendMouse(place, {MOUSEEVENTF_LEFTDOWN});
    const bool down = Eventually([&] { return ThreadOf(window).hwndCapture != nullptr; }, PressLimit);
    SendMouse(place, {MOUSEEVENTF_LEFTUP});
    if (down) return;
  }
}

void ClickPlace(HWND window, POINT place, int times) {
  WaitUntilInFront(window);
  SetCursorPos(place.x, place.y);
  if (times == 1) return ClickOnce(window, place);
  SendMouse(place, {MOUSEEVENTF_LEFTDOWN, MOUSEEVENTF_LEFTUP, MOUSEEVENTF_LEFTDOWN, MOUSEEVENTF_LEFTUP});
}

}  // namespace

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
  Visitor visitor = [&](HWND handle) {
    children.emplace_back(handle);
    return true;
  };
  EnumChildWindows(handle_, Visit, reinterpret_cast<LPARAM>(&visitor));
  return children;
}

Window Window::ChildAt(int left, int top) const {
  POINT place{Pixels(left), Pixels(top)};
  ClientToScreen(handle_, &place);
  for (const Window& child : Children()) {
    const RECT area = child.Place();
    if (area.left == place.x && area.top == place.y) return child;
  }
  return {};
}

Window Window::Child(const std::string& text) const {
  for (const Window& child : Children()) {
    if (child.Text() == text) return child;
  }
  return {};
}

COLORREF Window::Colour(int left, int top) const {
  POINT place{Pixels(left), Pixels(top)};
  ClientToScreen(handle_, &place);
  const HDC screen = GetDC(nullptr);
  const COLORREF colour = GetPixel(screen, place.x, place.y);
  ReleaseDC(nullptr, screen);
  return colour;
}

void Window::FinishPainting() const {
  RedrawWindow(handle_, nullptr, nullptr, RDW_UPDATENOW | RDW_ALLCHILDREN);
  Ask(handle_, WM_NULL);
}

void Window::Click() const {
  const RECT place = Place();
  ClickPlace(handle_, {(place.left + place.right) / 2, (place.top + place.bottom) / 2}, 1);
}

void Window::ClickAt(int left, int top, int times) const {
  POINT place{Pixels(left), Pixels(top)};
  ClientToScreen(handle_, &place);
  ClickPlace(handle_, place, times);
}

void Window::CloseByUser() const { PostMessageW(handle_, WM_SYSCOMMAND, SC_CLOSE, 0); }

Window FindVisible(const Program& program, const std::string& title) {
  return FirstTopWindow(program,
                        [&](const Window& window) { return window.Class() != DialogClass && window.Text() == title; });
}

Window FindMessage(const Program& program) {
  return FirstTopWindow(program, [](const Window& window) { return window.Class() == DialogClass; });
}

void PressKey(WORD key) {
  std::array<INPUT, 2> inputs{};
  for (INPUT& input : inputs) {
    input.type = INPUT_KEYBOARD;
    input.ki.wVk = key;
  }
  inputs[1].ki.dwFlags = KEYEVENTF_KEYUP;
  SendInput(UINT{inputs.size()}, inputs.data(), sizeof(INPUT));
}

void TypeText(const std::string& text) {
  std::wstring wide(text.size(), L'\0');
  MultiByteToWideChar(CP_ACP, 0, text.data(), static_cast<int>(text.size()), wide.data(),
                      static_cast<int>(wide.size()));
  std::vector<INPUT> inputs;
  for (const wchar_t letter : wide) {
    for (const DWORD release : {DWORD{0}, DWORD{KEYEVENTF_KEYUP}}) {
      INPUT input{};
      input.type = INPUT_KEYBOARD;
      input.ki.wScan = letter;
      input.ki.dwFlags = KEYEVENTF_UNICODE | release;
      inputs.push_back(input);
    }
  }
  SendInput(static_cast<UINT>(inputs.size()), inputs.data(), sizeof(INPUT));
}

std::vector<std::string> Entries(const Window& list) {
  return AskTexts(list.Handle(), LB_GETCOUNT, LB_GETTEXTLEN, LB_GETTEXT);
}

std::vector<std::string> Choices(const Window& comboBox) {
  return AskTexts(comboBox.Handle(), CB_GETCOUNT, CB_GETLBTEXTLEN, CB_GETLBTEXT);
}

int SelectedEntry(const Window& list) { return static_cast<int>(Ask(list.Handle(), LB_GETCURSEL)); }

void ClickEntry(const Window& list, const std::string& text, int times) {
  const std::vector<std::string> entries = Entries(list);
  const auto entry = std::find(entries.begin(), entries.end(), text);
  if (entry == entries.end()) {
    ADD_FAILURE() << "the list has no entry " << text;
    return;
  }
  RECT area{};
  Ask(list.Handle(), LB_GETITEMRECT, static_cast<WPARAM>(entry - entries.begin()), reinterpret_cast<LPARAM>(&area));
  POINT middle{(area.left + area.right) / 2, (area.top + area.bottom) / 2};
  ClientToScreen(list.Handle(), &middle);
  ClickPlace(list.Handle(), middle, times);
}

void PrintTo(const Message& message, std::ostream* out) {
  *out << "message \"" << message.Text << "\" titled \"" << message.Title << "\", buttons";
  for (const int button : message.Buttons) *out << ' ' << button;
}

Message ReadMessage(const Window& dialog) {
  Message message{dialog.Text(), "", {}};
  for (const Window& child : dialog.Children()) {
    if (child.Class() == "Static" && !child.Text().empty()) message.Text = child.Text();
    if (child.Class() == "Button" && child.Visible()) message.Buttons.push_back(GetDlgCtrlID(child.Handle()));
  }
  return message;
}

Message Answer(const Program& program, int button) {
  Window dialog;
  if (!Eventually([&] { return static_cast<bool>(dialog = FindMessage(program)); })) return {};
  const Message message = ReadMessage(dialog);
  const Window pressed(GetDlgItem(dialog.Handle(), button));
  if (!pressed) return {};
  pressed.Click();
  return Eventually([&] { return !dialog.Visible(); }) ? message : Message{};
}

}  // namespace driver
