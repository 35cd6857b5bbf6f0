// Windows and controls of another program, seen and used as a person does: by their place, class and text, with the
// mouse and the keyboard. Places are in twips relative to the window's client area, as the program's layouts have them.
#pragma once

#include <windows.h>

#include <string>
#include <vector>

#include "tests/windows/driver/program.h"

// A text in code page 1252; each of its letters must be one of Latin-1, whose codes are those of Unicode.
std::string FromWide(const std::wstring& wide);

class Window {
 public:
  Window() = default;
  explicit Window(HWND handle) : handle_(handle) {}

  explicit operator bool() const { return IsWindow(handle_) != FALSE; }
  HWND Handle() const { return handle_; }

  std::string Text() const;
  std::string Class() const;
  bool Enabled() const { return IsWindowEnabled(handle_) != FALSE; }
  bool Visible() const { return IsWindowVisible(handle_) != FALSE; }
  bool Focused() const;
  RECT Place() const;  // on the screen, pixels

  std::vector<Window> Children() const;  // of all depths, in the order of their creation
  Window ChildAt(int left, int top) const;
  Window Child(const std::string& text) const;

  // What is on the screen there: all of it as a BMP file, or the colour at a place of the client area.
  std::string Picture() const;
  COLORREF Colour(int left, int top) const;
  void FinishPainting() const;  // returns when everything that waits to be drawn is on the screen

  void Click() const;        // in its middle
  void CloseByUser() const;  // as its close box does

 private:
  HWND handle_ = nullptr;
};

// The program's visible window with this title; the dialogs of messages excepted. None is a window that is false.
Window FindVisible(const Program& program, const std::string& title);

// The visible message of the program, or none.
Window FindMessage(const Program& program);

// Entries of a list box, or of a combo box.
std::vector<std::string> Entries(const Window& control);
std::string SelectedEntry(const Window& list);  // the empty text when there is none
void ClickEntry(const Window& list, const std::string& text, int times = 1);

void PressKey(WORD key);
void HoldKey(WORD key, int repeats);  // pressed, and repeated so many times at once before it is released
void PressWith(WORD modifier, WORD key);
void TypeText(const std::string& text);

// Presses Tab until the control has the keyboard; false when it does not get it.
bool TabTo(const Window& control);

// What a message shows.
struct Message {
  std::string Title, Text;
  std::vector<int> Buttons;  // IDOK, IDYES, ...
  bool operator==(const Message&) const = default;
};
void PrintTo(const Message& message, std::ostream* out);

// Waits for a message of the program, presses one of its buttons or a key, waits until it is gone, and tells what it
// showed. Without a message everything of the result is empty.
Message Answer(const Program& program, int button);
Message AnswerWithKey(const Program& program, WORD key);
