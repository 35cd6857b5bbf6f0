// The program's main window, with its controls where its layout puts them.
#pragma once

#include "tests/windows/driver/waiting.h"
#include "tests/windows/driver/window.h"

struct MainWindow {
  // Waits until the program has shown it.
  explicit MainWindow(const driver::Program& program) {
    EXPECT_SOON(Window = driver::FindVisible(program, "Tolvaris")) << "\nthe main window does not come";
    List = Window.ChildAt(120, 240);
    Play = Window.ChildAt(3840, 3000);
    Floppy = Window.ChildAt(6960, 240);
    for (int i = 0; i < 5; ++i) Pictures.push_back(Window.ChildAt(6960, 840 + 600 * i));
  }

  // In the middle of the preview.
  COLORREF Preview() const { return Window.Colour(3840 + 1500, 240 + 1300); }

  bool FloppyChecked() const { return SendMessageA(Floppy.Handle(), BM_GETCHECK, 0, 0) == BST_CHECKED; }

  driver::Window Window, List, Play, Floppy;
  std::vector<driver::Window> Pictures;  // the picture buttons from saves to delete, from top to bottom
};
