// The program's windows, with their controls where their layouts put them.
#pragma once

#include "tests/windows/driver/waiting.h"
#include "tests/windows/driver/window.h"

// Waits until the program has shown it.
inline Window Shown(const Program& program, const std::string& title) {
  Window window;
  EXPECT_SOON(window = FindVisible(program, title)) << "\nno window comes that is titled " << title;
  return window;
}

struct MainWindow : Window {
  explicit MainWindow(const Program& program) : Window(Shown(program, "Tolvaris")) {
    for (int i = 0; i < 5; ++i) Pictures.push_back(ChildAt(6960, 840 + 600 * i));
  }

  // In the middle of the preview.
  COLORREF Preview() const { return Colour(3840 + 1500, 240 + 1300); }

  bool FloppyChecked() const { return SendMessageA(Floppy.Handle(), BM_GETCHECK, 0, 0) == BST_CHECKED; }

  const Window List = ChildAt(120, 240), Play = ChildAt(3840, 3000), Floppy = ChildAt(6960, 240);
  std::vector<Window> Pictures;  // the picture buttons from saves to delete, from top to bottom
};

struct SaveManager : Window {
  struct Pane {
    Window List, Delete;
  };

  explicit SaveManager(const Program& program) : Window(Shown(program, "Salvamentos dos jogos")) {}

  // Which of the picked entry's commands are shown: to delete it on the floppy, to copy it, to delete it on the
  // computer.
  std::vector<bool> Offered() const { return {Floppy.Delete.Visible(), Copy.Visible(), Computer.Delete.Visible()}; }

  const Window Copy = ChildAt(3480, 1320), Close = ChildAt(6240, 3240);
  const Pane Floppy = {ChildAt(240, 480), ChildAt(3060, 2760)}, Computer = {ChildAt(4440, 480), ChildAt(7260, 2760)};
};

inline const std::vector<bool> FloppyOffered = {true, true, false};
inline const std::vector<bool> ComputerOffered = {false, true, true};
