// What other programs send to the windows.
#include "tests/windows/installation.h"

namespace {

class Messages : public Installation {};

// Wine hands some of them over when they are sent, others when they are posted, and some it refuses itself.
TEST_F(Messages, WithoutWhatTheyShouldPointToDoNoHarm) {
  Set("LRom", "Zebra");
  Start();
  std::vector<Window> windows = window->Children();
  windows.push_back(*window);
  for (const Window& each : windows) {
    for (const UINT message : {WM_NCCREATE, WM_DRAWITEM, WM_NOTIFY, WM_DPICHANGED, WM_COMMAND, WM_SETTEXT}) {
      PostMessageW(each.Handle(), message, 0, 0);
      SendMessageTimeoutW(each.Handle(), message, 0, 0, SMTO_NORMAL, Limit, nullptr);
    }
  }
  EXPECT_SOON(window->List.Focused());
  PressKey(VK_HOME);
  EXPECT_SOON_EQ(std::string("abelha"), Selected());
  PressKey(VK_RETURN);
  ExpectPlayed("abelha.zip");
}

}  // namespace
