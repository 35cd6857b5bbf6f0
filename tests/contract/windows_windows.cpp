// What the native windows do beyond the promises of the platform's headers.
#include <windows.h>

#include "platform/messages.h"
#include "platform/screen.h"
#include "platform/windows/control.h"
#include "tests/contract/hand.h"
#include "tests/contract/replaced_import.h"
#include "tests/contract/small_pictures.h"

extern void* importOfGetMonitorInfoA asm("__imp_GetMonitorInfoA");

namespace {

using namespace contract;

class NativeWindow : public AllControls {};

TEST_F(NativeWindow, KeepsTheKeyboardForAControlThatIsSwitchedOff) {
  combo.SetFocus();
  for (const auto change : {&Control::Enable, &Control::Show}) {
    (combo.*change)(false);
    EXPECT_EQ(::GetFocus(), window.State().Handle);
    (combo.*change)(true);
    EXPECT_EQ(::GetFocus(), combo.State().Handle);
  }
}

string NativeText(const Control& control) {
  char text[100] = "";
  ::GetWindowTextA(control.State().Handle, text, sizeof text);
  return text;
}

// Wine's service for names refuses them: the control is as before, and only a text that is not shown says its name.
TEST_F(NativeWindow, KeepsAControlsNameForReadersAlsoWhereWindowsTakesNone) {
  const std::pair<Control*, const char*> texts[] = {{&list, "Nome"}, {&button, "&Jogar"}, {&check, "Usar disquete"}};
  for (const auto& [control, text] : texts) {
    control->SetAccessibleName("Nome");
    ::SendMessageA(control->State().Handle, WM_GETOBJECT, 0, OBJID_CLIENT);
    EXPECT_EQ(control->AccessibleName(), "Nome") << text;
    EXPECT_EQ(NativeText(*control), text);
  }
  Choose(list, 1);
  EXPECT_EQ(Seen(), "list | row 1, unchecked, choice 0");
}

TEST_F(NativeWindow, GivesEachControlItsFontFromTheBeginning) {
  const auto heightOf = [](const Control& control) {
    LOGFONTA font = {};
    const auto handle = reinterpret_cast<HGDIOBJ>(::SendMessageA(control.State().Handle, WM_GETFONT, 0, 0));
    return ::GetObjectA(handle, sizeof font, &font) != 0 ? font.lfHeight : 0;
  };
  EXPECT_EQ(heightOf(list), -::MulDiv(83, static_cast<int>(GetDpiForSystem()), 720));
  EXPECT_EQ(heightOf(button), -::MulDiv(180, static_cast<int>(GetDpiForSystem()), 720));
}

// As beside a taskbar at the left and at the top.
TEST_F(NativeWindow, StandsWhereItWouldWithoutATaskbar) {
  RECT before = {};
  ::SystemParametersInfoA(SPI_GETWORKAREA, 0, &before, 0);
  RECT area = {before.left + 300, before.top + 200, before.right, before.bottom};
  ::SystemParametersInfoA(SPI_SETWORKAREA, 0, &area, 0);
  const Window other(window.State().Style);
  EXPECT_EQ(std::pair(other.Left(), other.Top()), std::pair(window.Left(), window.Top()));
  EXPECT_EQ(ScreenWidth() / 15 * GetDpiForSystem() / 96, static_cast<unsigned>(::GetSystemMetrics(SM_CXSCREEN)));
  ::SystemParametersInfoA(SPI_SETWORKAREA, 0, &before, 0);
}

// As if the main window stood on a monitor at the right.
BOOL WINAPI AtTheRight(HMONITOR, LPMONITORINFO monitor) {
  monitor->rcMonitor = {2000, 100, 3000, 900};
  monitor->rcWork = {2000, 100, 3000, 850};
  return TRUE;
}

TEST_F(NativeWindow, OpensOnTheMonitorOfTheMainWindow) {
  RECT place = {};
  {
    const ReplacedImport monitors(importOfGetMonitorInfoA, AtTheRight);
    const Window other(window.State().Style);
    ::GetWindowRect(other.State().Handle, &place);
  }
  EXPECT_NEAR((place.left + place.right) / 2, 2500, 1);
  EXPECT_NEAR((place.top + place.bottom) / 2, 500, 1);
}

TEST_F(NativeWindow, IsLaidOutAgainAtAnotherResolutionAndStaysWhereItWasPut) {
  const HWND native = window.State().Handle;
  for (const auto& [dpi, fontHeight] : {std::pair(144, 36), std::pair(192, 48), std::pair(96, 24)}) {
    const RECT suggested = {40, 30, 50, 60};
    ::SendMessageA(native, WM_DPICHANGED, static_cast<WPARAM>(MAKELONG(dpi, dpi)),
                   reinterpret_cast<LPARAM>(&suggested));
    RECT client = {}, place = {}, whole = {};
    ::GetClientRect(native, &client);
    ::GetWindowRect(native, &whole);
    ::GetWindowRect(image.State().Handle, &place);
    ::MapWindowPoints(nullptr, native, reinterpret_cast<POINT*>(&place), 2);
    EXPECT_EQ(client.right, 500 * dpi / 96) << dpi;
    EXPECT_EQ(client.bottom, 300 * dpi / 96) << dpi;
    EXPECT_EQ(window.Left(), 600) << dpi;
    EXPECT_EQ(whole.left, 40) << dpi;
    EXPECT_EQ(place.left, 310 * dpi / 96) << dpi;
    EXPECT_NEAR(place.bottom, (30 + 13) * dpi / 96, 1);
    LOGFONTA font = {};
    ::GetObjectA(reinterpret_cast<HFONT>(::SendMessageA(button.State().Handle, WM_GETFONT, 0, 0)), sizeof font, &font);
    EXPECT_EQ(font.lfHeight, -fontHeight);
  }
}

TEST_F(NativeWindow, PictureButtonGivesWindowsItsIconInTheWindowsResolutionAndKeepsItsName) {
  const HWND box = check.State().Handle;
  for (const int dpi : {144, 192, 96}) {
    const RECT suggested = {};
    ::SendMessageA(window.State().Handle, WM_DPICHANGED, static_cast<WPARAM>(MAKELONG(dpi, dpi)),
                   reinterpret_cast<LPARAM>(&suggested));
    ICONINFO icon = {};
    BITMAP bitmap = {};
    EXPECT_TRUE(::GetIconInfo(reinterpret_cast<HICON>(::SendMessageA(box, BM_GETIMAGE, IMAGE_ICON, 0)), &icon)) << dpi;
    ::GetObjectA(icon.hbmColor, sizeof bitmap, &bitmap);
    EXPECT_EQ(bitmap.bmWidth, 32 * dpi / 96);
    ::DeleteObject(icon.hbmColor);
    ::DeleteObject(icon.hbmMask);
  }
  EXPECT_TRUE((::GetWindowLongA(box, GWL_STYLE) & BS_ICON) != 0) << "else it would show both";
  char name[64] = "";
  ::GetWindowTextA(box, name, sizeof name);
  EXPECT_STREQ(name, "Usar disquete");
}

// The frame lies over the image.
TEST_F(NativeWindow, HasToolTipsOnceTheMouseComesToAControlWithOne) {
  const auto tips = [this](const Control& control) {
    RECT place = {};
    ::GetWindowRect(control.State().Handle, &place);
    ::SetCursorPos((place.left + place.right) / 2, (place.top + place.bottom) / 2);
    ::SendMessageA(window.State().Handle, WM_SETCURSOR, reinterpret_cast<WPARAM>(window.State().Handle), HTCLIENT);
    return window.State().ToolTips;
  };
  EXPECT_EQ(tips(list), nullptr);
  EXPECT_NE(tips(image), nullptr);
  ::SetCursorPos(0, 0);  // the next window comes to the same place
}

TEST_F(NativeWindow, PictureIsDecodedOnceNoInputWaits) {
  ImageBox shown(window, {1800, 2400, 1500, 900});
  const HWND box = shown.State().Handle;
  const auto colour = [&] {
    const HDC context = ::GetDC(box);
    const COLORREF pixel = ::GetPixel(context, 1, 1);
    ::ReleaseDC(box, context);
    return pixel;
  };
  const auto becomes = [&](COLORREF expected) {
    for (int i = 0; i < 200 && colour() != expected; ++i, ::Sleep(10)) RunPendingEvents();
    return colour();
  };
  constexpr COLORREF grey = RGB(0x80, 0x80, 0x80), darker = RGB(0x40, 0x40, 0x40);
  shown.SetPicture(LoadPicture(SmallJpeg()));
  EXPECT_EQ(becomes(grey), grey);

  const Picture next = LoadPicture(SmallBmp());
  bool handled = false;
  QueueEvent([&] { handled = true; });
  shown.SetPicture(next);
  EXPECT_EQ(shown.ShownPicture(), next);
  ::RedrawWindow(window.State().Handle, nullptr, nullptr, RDW_INVALIDATE | RDW_UPDATENOW | RDW_ALLCHILDREN);
  EXPECT_EQ(colour(), grey) << "while something waits";
  EXPECT_FALSE(handled);
  EXPECT_EQ(becomes(darker), darker);

  shown.SetPicture(LoadPicture(SmallPng().replace(SmallPng().find("IDAT"), 4, "nada")));  // no decoder takes it
  for (int i = 0; i < 200 && shown.ShownPicture() != next; ++i, ::Sleep(10)) RunPendingEvents();
  EXPECT_EQ(shown.ShownPicture(), next);
  EXPECT_EQ(colour(), darker);
}

// Another program's message; in this process also those arrive that Wine does not carry between two.
TEST_F(NativeWindow, TakesAMessageWithoutWhatItShouldPointTo) {
  const Bounds before = {window.Left(), window.Top(), window.Width(), window.Height()};
  for (const UINT message : {WM_NCCREATE, WM_DRAWITEM, WM_NOTIFY, WM_DPICHANGED}) {
    ::SendMessageA(window.State().Handle, message, 0, 0);
  }
  CREATESTRUCTA another{};
  ::SendMessageA(window.State().Handle, WM_NCCREATE, 0, reinterpret_cast<LPARAM>(&another));
  EXPECT_EQ((Bounds{window.Left(), window.Top(), window.Width(), window.Height()}), before);
  Click(button);
  EXPECT_EQ(Seen(), "button | row -1, unchecked, choice 0");
}

TEST_F(NativeWindow, IsDrawnAlsoWhereEventsBringNoOthers) {
  bool drawn = false;
  QueueEvent([&] {
    ::InvalidateRect(list.State().Handle, nullptr, TRUE);
    RunPendingEvents();
    drawn = ::GetUpdateRect(list.State().Handle, nullptr, FALSE) == FALSE;
  });
  RunPendingEvents();
  EXPECT_TRUE(drawn);
}

TEST_F(NativeWindow, FileDialogsReturnThePathAndKeepTheCurrentDirectory) {
  const std::function<void()> press = [&] {
    const HWND dialog = ::GetLastActivePopup(window.State().Handle);
    if (!::IsWindowVisible(dialog) || dialog == window.State().Handle) return QueueEvent(press);  // not up yet
    ::PostMessageA(dialog, WM_COMMAND, IDOK, 0);
  };
  char before[MAX_PATH] = "", after[MAX_PATH] = "";
  ::GetCurrentDirectoryA(sizeof before, before);
  QueueEvent(press);
  OpenFileName request{&window, string("Tudo\0*.*\0", 9), "Jogo", 255, here_, "Salvar como...", HideReadOnly, "tvk"};
  EXPECT_TRUE(GetSaveFileNameA(request));
  EXPECT_EQ(::lstrcmpiA(request.File.c_str(), (here_ + "Jogo.tvk").c_str()), 0) << request.File;
  ::GetCurrentDirectoryA(sizeof after, after);
  EXPECT_STREQ(after, before);
}

}  // namespace
