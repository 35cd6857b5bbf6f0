// What the native windows do beyond the promises of the platform's headers: the keyboard, the names that a screen
// reader finds, the screen's resolution, the file dialogs.
#include <gtest/gtest.h>
#include <windows.h>

#include <string>
#include <utility>

#include "platform/controls.h"
#include "platform/events.h"
#include "platform/messages.h"
#include "platform/windows/state.h"
#include "tests/contract/hand.h"
#include "tests/contract/machine.h"

namespace contract {
namespace {

using platform::Control;

class NativeWindow : public testing::Test {
 protected:
  NativeWindow() {
    const auto note = [this](const char* name) { return [this, name] { clicks += name; }; };
    list.OnKeyDown = [this](int key) { clicks += std::to_string(key) + " "; };
    play.OnClick = note("play ");
    image.OnClick = note("image ");
    close.OnClick = note("close ");
    window.OnUnload = note("unload ");
    window.Show();
    platform::RunPendingEvents();
  }

  // As the keyboard does it: to the window that has the focus.
  void Press(int key, UINT down = WM_KEYDOWN) {
    const HWND focus = ::GetFocus();
    ::PostMessageA(focus, down, static_cast<WPARAM>(key), 1);
    ::PostMessageA(focus, down + 1, static_cast<WPARAM>(key), static_cast<LPARAM>(0xC0000001));
    platform::RunPendingEvents();
  }

  // Where Tab leads from the first control on, as often as there are controls.
  std::string TabOrder() {
    const std::pair<const Control*, char> names[] = {{&list, 'l'},  {&play, 'p'},  {&check, 'c'},
                                                     {&image, 'i'}, {&combo, 'b'}, {&close, 'x'}};
    std::string order;
    for (std::size_t i = 0; i < std::size(names); ++i, Press(VK_TAB)) {
      for (const auto& [control, name] : names) {
        if (control->State().Handle == ::GetFocus()) order += name;
      }
    }
    return order;
  }

  bool HasFocus(const Control& control) { return ::GetFocus() == control.State().Handle; }
  std::string Clicks() { return std::exchange(clicks, ""); }

  static std::string NativeText(const Control& control) {
    char text[64] = "";
    ::GetWindowTextA(control.State().Handle, text, sizeof text);
    return text;
  }

  Desk desk;
  platform::Window window{{.Caption = "Teste", .ClientWidth = 7500, .ClientHeight = 4500, .CloseOnEscape = true}};
  platform::ListBox list{window, {150, 150, 1500, 1500}, platform::ListBox::Order::Sorted};
  platform::Button play{window, {1800, 150, 1500, 600}, "Jogar"};
  platform::CheckBox check{window, {1800, 900, 600, 600}, 101, "Usar disquete"};
  platform::Frame frame{window, {4500, 150, 3000, 3000}, " Disquete "};
  platform::ImageButton image{frame, {150, 300, 180, 195}, 203, "Excluir"};
  platform::ComboBox combo{window, {150, 2100, 1500, 315}};
  platform::Button close{window, {6000, 3900, 1335, 495}, "&Fechar"};
  std::string clicks;
};

TEST_F(NativeWindow, TabFollowsTheOrderOfCreationAndPassesOverWhatIsOff) {
  EXPECT_TRUE(HasFocus(list));
  EXPECT_EQ(TabOrder(), "lpcibx");
  image.Enable(false);
  combo.Show(false);
  EXPECT_EQ(TabOrder(), "lpcxlp");
}

TEST_F(NativeWindow, KeysPressButtonsAndEscapeCloses) {
  Press(VK_RETURN);
  EXPECT_EQ(Clicks(), "13 ");
  for (const int key : {VK_RETURN, VK_SPACE}) {
    play.SetFocus();
    Press(key);
    image.SetFocus();
    Press(key);
    check.SetFocus();
    Press(key);
    EXPECT_EQ(Clicks(), "play image ") << key;
    EXPECT_EQ(check.Value(), key == VK_RETURN ? 1 : 0);
  }
  ::PostMessageA(::GetFocus(), WM_SYSCHAR, 'f', 1 << 29);
  platform::RunPendingEvents();
  EXPECT_EQ(Clicks(), "close ");
  list.SetFocus();
  Press(VK_ESCAPE);
  EXPECT_EQ(Clicks(), "unload ");
  EXPECT_TRUE(window.IsClosed());
}

TEST_F(NativeWindow, FocusComesBackToTheControlThatHadIt) {
  play.SetFocus();
  {
    platform::Window other({.Caption = "Outra", .ClientWidth = 3000, .ClientHeight = 3000});
    QueueModal([&] {
      EXPECT_FALSE(HasFocus(play));
      combo.SetFocus();  // takes effect when the window is active again
      EXPECT_FALSE(HasFocus(combo));
      other.Close();
    });
    other.ShowModal();
  }
  EXPECT_TRUE(HasFocus(combo));
  for (const bool hide : {false, true}) {  // the window keeps the keyboard meanwhile
    hide ? combo.Show(false) : combo.Enable(false);
    EXPECT_EQ(::GetFocus(), window.State().Handle);
    combo.SetFocus();
    EXPECT_FALSE(HasFocus(combo));
    hide ? combo.Show(true) : combo.Enable(true);
    EXPECT_TRUE(HasFocus(combo));
  }
}

TEST_F(NativeWindow, ControlsWithoutTextAreNamedByTheirToolTips) {
  EXPECT_EQ(NativeText(check) + NativeText(image), "Usar disqueteExcluir");
  play.SetToolTip("Jogar agora");
  EXPECT_EQ(NativeText(play), "Jogar");
  play.SetIcon(102);
  EXPECT_EQ(NativeText(play), "Jogar agora");
  play.SetToolTip("Outra dica");
  EXPECT_EQ(NativeText(play), "Outra dica");
}

TEST_F(NativeWindow, AnotherResolutionLaysEverythingOutAgain) {
  const HWND native = window.State().Handle;
  for (const auto& [dpi, fontHeight] : {std::pair(144, 17), std::pair(192, 22), std::pair(96, 11)}) {
    const RECT suggested = {40, 30, 50, 60};
    ::SendMessageA(native, WM_DPICHANGED, static_cast<WPARAM>(MAKELONG(dpi, dpi)),
                   reinterpret_cast<LPARAM>(&suggested));
    RECT client = {}, place = {}, whole = {};
    ::GetClientRect(native, &client);
    EXPECT_EQ(client.right, 500 * dpi / 96);
    EXPECT_EQ(client.bottom, 300 * dpi / 96);
    ::GetWindowRect(native, &whole);
    EXPECT_EQ(whole.left, 40);
    ::GetWindowRect(image.State().Handle, &place);
    ::MapWindowPoints(nullptr, native, reinterpret_cast<POINT*>(&place), 2);
    EXPECT_EQ(place.left, 310 * dpi / 96);
    EXPECT_NEAR(place.bottom, (30 + 13) * dpi / 96, 1);
    LOGFONTA font = {};
    ::GetObjectA(reinterpret_cast<HFONT>(::SendMessageA(close.State().Handle, WM_GETFONT, 0, 0)), sizeof font, &font);
    EXPECT_EQ(font.lfHeight, -fontHeight);
  }
}

TEST(FileDialogs, ReturnThePathAndKeepTheCurrentDirectory) {
  using platform::Answer;
  const Desk desk;
  const FreshDirectory directory;
  struct Case {
    std::string File;
    std::size_t Size;
    Answer Pressed;
    std::string Chosen;  // empty: none
  };
  const Case cases[] = {{"Jogo", 255, Answer::Ok, directory / "Jogo.tvk"},
                        {"Jogo.zip", 255, Answer::Ok, directory / "Jogo.zip"},
                        {"Jogo", 255, Answer::Cancel, ""},
                        {"Jogo", 6, Answer::Ok, ""}};
  char before[MAX_PATH] = "", after[MAX_PATH] = "";
  ::GetCurrentDirectoryA(sizeof before, before);
  for (const Case& one : cases) {
    platform::OpenFileName request;
    request.Filter = std::string("Tudo\0*.*\0", 9);
    request.File = one.File;
    request.FileSize = one.Size;
    request.InitialDirectory = directory.Path();
    request.Title = "Salvar como...";
    request.Flags = platform::HideReadOnly;
    request.DefaultExtension = "tvk";
    QueueAnswer(one.Pressed);
    EXPECT_EQ(platform::GetSaveFileNameA(request), !one.Chosen.empty()) << one.File;
    const std::string& expected = one.Chosen.empty() ? one.File : one.Chosen;
    EXPECT_EQ(::lstrcmpiA(request.File.c_str(), expected.c_str()), 0) << request.File;
    ::GetCurrentDirectoryA(sizeof after, after);
    EXPECT_STREQ(after, before);
  }
}

}  // namespace
}  // namespace contract
