// What the native windows do beyond the promises of the platform's headers: the keyboard, the names that a screen
// reader finds, the screen's resolution, the file dialogs.
#include <windows.h>

#include <tuple>

#include "platform/messages.h"
#include "platform/windows/state.h"
#include "tests/contract/all_controls.h"

namespace {

using namespace contract;

bool HasFocus(const Control& control) { return ::GetFocus() == control.State().Handle; }

string NativeText(const Control& control) {
  char text[64] = "";
  ::GetWindowTextA(control.State().Handle, text, sizeof text);
  return text;
}

class NativeWindow : public AllControls {
 protected:
  // As the keyboard does it: to the window that has the focus.
  void Press(int key) {
    const HWND focus = ::GetFocus();
    ::PostMessageA(focus, WM_KEYDOWN, static_cast<WPARAM>(key), 1);
    ::PostMessageA(focus, WM_KEYUP, static_cast<WPARAM>(key), static_cast<LPARAM>(0xC0000001));
    RunPendingEvents();
  }
};

TEST_F(NativeWindow, KeysMovePressAndClose) {
  image.Enable(false);
  for (int tabs = 0; tabs < 3; ++tabs) Press(VK_TAB);
  EXPECT_TRUE(HasFocus(combo));
  image.Enable(true);
  list.SetFocus();
  Press(VK_RETURN);
  EXPECT_EQ(Seen(), "13 /-1/0/0");
  for (const int key : {VK_RETURN, VK_SPACE}) {
    for (Control* control : {inputs[1], inputs[2], inputs[3]}) {
      control->SetFocus();
      Press(key);
    }
    EXPECT_EQ(Seen(), key == VK_RETURN ? "button image /-1/1/0" : "button image /-1/0/0");
  }
  ::PostMessageA(::GetFocus(), WM_SYSCHAR, 'f', 1 << 29);
  RunPendingEvents();
  window.OnUnload = [this] { clicks += "unload "; };
  list.SetFocus();
  Press(VK_ESCAPE);
  EXPECT_TRUE(window.IsClosed() && Seen() == "close unload /-1/0/0");
}

TEST_F(NativeWindow, FocusComesBackToTheControlThatHadIt) {
  button.SetFocus();
  Window other({.Caption = "Outra", .ClientWidth = 3000, .ClientHeight = 3000});
  QueueModal([&] {
    EXPECT_FALSE(HasFocus(button));
    combo.SetFocus();  // takes effect when the window is active again
    EXPECT_FALSE(HasFocus(combo));
    other.Close();
  });
  other.ShowModal();
  EXPECT_TRUE(HasFocus(combo));
  for (const auto change : {&Control::Enable, &Control::Show}) {  // the window keeps the keyboard meanwhile
    (combo.*change)(false);
    EXPECT_EQ(::GetFocus(), window.State().Handle);
    combo.SetFocus();
    EXPECT_FALSE(HasFocus(combo));
    (combo.*change)(true);
    EXPECT_TRUE(HasFocus(combo));
  }
}

TEST_F(NativeWindow, ControlsWithoutTextAreNamedByTheirToolTips) {
  EXPECT_EQ(NativeText(check) + NativeText(image), "Usar disqueteExcluir");
  close.SetToolTip("Fecha");
  EXPECT_EQ(NativeText(close), "&Fechar");
  Button pictured(window, {1500, 100, 615, 600}, 102, "Dica");
  EXPECT_EQ(NativeText(pictured), "Dica");
  pictured.SetToolTip("Outra dica");
  EXPECT_EQ(NativeText(pictured) + pictured.Caption() + pictured.ToolTip(), "Outra dicaOutra dica");
}

TEST_F(NativeWindow, AnotherResolutionLaysEverythingOutAgain) {
  const HWND native = window.State().Handle;
  for (const auto& [dpi, fontHeight] : {std::pair(144, 17), std::pair(192, 22), std::pair(96, 11)}) {
    const RECT suggested = {40, 30, 50, 60};
    ::SendMessageA(native, WM_DPICHANGED, static_cast<WPARAM>(MAKELONG(dpi, dpi)),
                   reinterpret_cast<LPARAM>(&suggested));
    RECT client = {}, place = {}, whole = {};
    ::GetClientRect(native, &client);
    ::GetWindowRect(native, &whole);
    ::GetWindowRect(image.State().Handle, &place);
    ::MapWindowPoints(nullptr, native, reinterpret_cast<POINT*>(&place), 2);
    EXPECT_TRUE(client.right == 500 * dpi / 96 && client.bottom == 300 * dpi / 96) << dpi;
    EXPECT_TRUE(whole.left == 40 && place.left == 310 * dpi / 96) << dpi;
    EXPECT_NEAR(place.bottom, (30 + 13) * dpi / 96, 1);
    LOGFONTA font = {};
    ::GetObjectA(reinterpret_cast<HFONT>(::SendMessageA(close.State().Handle, WM_GETFONT, 0, 0)), sizeof font, &font);
    EXPECT_EQ(font.lfHeight, -fontHeight);
  }
}

TEST_F(NativeWindow, FileDialogsReturnThePathAndKeepTheCurrentDirectory) {
  const std::tuple<string, std::size_t, WPARAM, string> cases[] = {{"Jogo", 255, IDOK, here_ + "Jogo.tvk"},
                                                                   {"Jogo.zip", 255, IDOK, here_ + "Jogo.zip"},
                                                                   {"Jogo", 255, IDCANCEL, "Jogo"},
                                                                   {"Jogo", 6, IDOK, "Jogo"}};
  char before[MAX_PATH] = "", after[MAX_PATH] = "";
  ::GetCurrentDirectoryA(sizeof before, before);
  for (const auto& [file, room, pressed, result] : cases) {
    const std::function<void()> press = [&, button = pressed] {
      const HWND dialog = ::GetLastActivePopup(window.State().Handle);
      if (!::IsWindowVisible(dialog) || dialog == window.State().Handle) return QueueEvent(press);  // not up yet
      ::PostMessageA(dialog, WM_COMMAND, button, 0);
    };
    QueueEvent(press);
    OpenFileName request{&window, string("Tudo\0*.*\0", 9), file, room, here_, "Salvar como...", HideReadOnly, "tvk"};
    EXPECT_EQ(GetSaveFileNameA(request), result != file) << file;
    EXPECT_EQ(::lstrcmpiA(request.File.c_str(), result.c_str()), 0) << request.File;
    ::GetCurrentDirectoryA(sizeof after, after);
    EXPECT_STREQ(after, before);
  }
}

}  // namespace
