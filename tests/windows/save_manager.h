// The save-file manager's window, with its controls where its layout puts them.
#pragma once

#include "tests/windows/driver/waiting.h"
#include "tests/windows/driver/window.h"

struct SaveManager {
  struct Pane {
    driver::Window List, Delete;
  };

  // Waits until the program has shown it.
  explicit SaveManager(const driver::Program& program) {
    EXPECT_SOON(Window = driver::FindVisible(program, "Salvamentos dos jogos")) << "\nthe save manager does not come";
    Floppy = {Window.ChildAt(240, 480), Window.ChildAt(3060, 2760)};
    Computer = {Window.ChildAt(4440, 480), Window.ChildAt(7260, 2760)};
    Copy = Window.ChildAt(3480, 1320);
    Close = Window.ChildAt(6240, 3240);
  }

  // Which of the picked entry's commands are shown: to delete it on the floppy, to copy it, to delete it on the
  // computer.
  std::vector<bool> Offered() const { return {Floppy.Delete.Visible(), Copy.Visible(), Computer.Delete.Visible()}; }

  driver::Window Window, Copy, Close;
  Pane Floppy, Computer;
};

inline const std::vector<bool> NothingOffered = {false, false, false};
inline const std::vector<bool> FloppyOffered = {true, true, false};
inline const std::vector<bool> ComputerOffered = {false, true, true};
