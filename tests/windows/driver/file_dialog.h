// The system's dialogs that ask for a file, seen and used as a person does.
#pragma once

#include "tests/windows/driver/window.h"

class FileDialog {
 public:
  // Waits until the program shows one.
  explicit FileDialog(const Program& program);

  std::string Title() const { return dialog_.Text(); }
  std::string FileName() const { return name_.Text(); }  // what stands in its box
  std::vector<std::string> FileTypes() const { return Entries(types_); }

  void ChooseNextType() const;
  void Type(const std::string& path) const;   // over what stands in the box
  void Enter(const std::string& path) const;  // types it, and presses Enter

  // Presses Enter or Escape, and waits until the dialog is gone.
  void Press(WORD key) const;

 private:
  Window dialog_, name_, types_;
};
