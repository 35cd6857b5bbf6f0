// Windows and their controls. Positions and sizes are in twips (1440 to the inch): of a control relative to the client
// area of its window or frame, of a window relative to the screen. A handler runs on the window thread; an exception
// that leaves it is dropped there. After its window is closed a control ignores what it is told and answers with its
// last state. Tab order is the order of creation.
#pragma once

#include <cstdint>
#include <functional>
#include <memory>
#include <string>
#include <vector>

#include "platform/pictures.h"

namespace platform {

struct WindowState;   // of the implementation
struct ControlState;  // of the implementation
struct TimerState;    // of the implementation

struct Bounds {
  int Left = 0, Top = 0, Width = 0, Height = 0;
  bool operator==(const Bounds&) const = default;
};

struct Font {
  int TenthsOfPoint = 83;  // height: 8.25 points are 83
  bool Bold = false;
};

struct WindowStyle {
  std::string Caption;
  int ClientWidth, ClientHeight;
  bool MinimizeBox = false;
  bool CloseOnEscape = false;
  int Background = 0;  // picture resource drawn from the client area's top left corner at 15 twips a pixel; 0: none
};

// A top-level window that cannot be resized. It is hidden until it is shown, and centred on the monitor of the
// program's first window; that one itself on the primary monitor.
// One that the platform cannot make is closed from the beginning.
class Window {
 public:
  explicit Window(const WindowStyle& style);
  ~Window();
  Window(const Window&) = delete;
  Window& operator=(const Window&) = delete;

  void Show();

  // Shows the window and handles events until it is closed; the program's other windows take no input meanwhile.
  void ShowModal();

  // Runs OnUnload and closes the window for good; nothing when it is closed already.
  void Close();
  bool IsClosed() const;

  std::string Caption() const;
  void SetCaption(const std::string& caption);

  // The whole window, its frame included, in twips of the screen (platform/screen.h) on whichever monitor it is.
  int Left() const;
  int Top() const;
  int Width() const;
  int Height() const;
  void SetLeft(int left);
  void SetTop(int top);

  // A window that is not enabled takes no input. Another program can change it through the handle.
  bool Enabled() const;
  void Enable(bool enabled);

  // The platform's handle as the 32-bit number that other programs are given.
  std::int32_t Handle() const;

  std::function<void()> OnUnload;
  std::function<void()> OnHelp;  // F1, whichever control has the keyboard

  WindowState& State() const { return *state_; }

 private:
  std::unique_ptr<WindowState> state_;
};

class Frame;

// Where a control lies: directly in a window, or in a frame.
class Container {
 public:
  Container(Window& window) : Parent(window) {}  // NOLINT(google-explicit-constructor)
  Container(Frame& frame);                       // NOLINT(google-explicit-constructor)

  Window& Parent;
  int Left = 0, Top = 0;  // of the container's corner in the window's client area, twips
};

// What all controls have in common.
class Control {
 public:
  Control(const Control&) = delete;
  Control& operator=(const Control&) = delete;

  bool Enabled() const;
  void Enable(bool enabled);
  bool Visible() const;  // its own state, whether or not its window is shown
  void Show(bool visible);

  // Gives the control the keyboard focus; nothing when it is disabled or hidden.
  void SetFocus();

  std::string Caption() const;
  void SetCaption(const std::string& caption);

  // Shown when the mouse rests on the control; where the control shows no text of its own it is also the name by which
  // a screen reader calls it.
  std::string ToolTip() const;
  void SetToolTip(const std::string& text);

  // The name by which a screen reader calls the control, where neither its text nor a tool tip says it; empty when none
  // was given. Nothing visible changes.
  std::string AccessibleName() const;
  void SetAccessibleName(const std::string& name);

  std::int32_t Handle() const;  // as Window::Handle

  ControlState& State() const { return *state_; }

 protected:
  Control();
  ~Control();
  std::unique_ptr<ControlState> state_;
};

// A list of texts. A selection made in code is silent, and so is clearing it.
class ListBox : public Control {
 public:
  enum class Order { AsAdded, Sorted };  // Sorted: as CompareStringA orders

  ListBox(const Container& container, const Bounds& bounds, Order order);

  void Add(const std::string& text);
  void Fill(const std::vector<std::string>& texts);  // in place of all entries; much faster than adding each
  void Clear();
  int Count() const;
  std::string Text(int index) const;  // positions start at 0; the empty text when there is no such entry

  int Selected() const;  // -1: none
  void Select(int index);

  // The first entry that equals the text without regard to letter case, or -1 (LB_FINDSTRINGEXACT from -1).
  int FindExact(const std::string& text) const;

  std::function<void()> OnClick;  // the user selected an entry, by mouse or keyboard
  std::function<void()> OnDoubleClick;
  // Before the list acts on the key (platform/keys.h). Once for a key that is held down, on which the list goes on
  // acting.
  std::function<void(int keyCode)> OnKeyDown;
};

// A push button that shows its caption, or an icon of the program's resources, whose size follows the screen's DPI; its
// tool tip is then its name.
class Button : public Control {
 public:
  Button(const Container& container, const Bounds& bounds, const std::string& caption, const Font& font = {});
  Button(const Container& container, const Bounds& bounds, int icon, const std::string& toolTip);

  void SetIcon(int id);  // another one; nothing for a button that shows its caption

  std::function<void()> OnClick;
};

// A check box that looks like a button with an icon and stays down while it is checked.
class CheckBox : public Control {
 public:
  CheckBox(const Container& container, const Bounds& bounds, int icon, const std::string& toolTip);

  int Value() const;  // 0 unchecked, 1 checked
  void SetValue(int value);
};

// A drop-down list of texts.
class ComboBox : public Control {
 public:
  ComboBox(const Container& container, const Bounds& bounds);

  void Add(const std::string& text);
  int Selected() const;    // -1: none
  void Select(int index);  // silent

  std::function<void()> OnClick;  // the user chose an entry
};

// A text on a white ground or on the window's own, as large as the text needs; bounds give only its top left corner.
class Label : public Control {
 public:
  enum class Ground { White, Window };

  Label(const Container& container, int left, int top, const Font& font, Ground ground = Ground::White);
};

// A box with a caption around other controls.
class Frame : public Control {
 public:
  Frame(Window& window, const Bounds& bounds, const std::string& caption);

  Window& Parent;
  const Bounds Place;
};

// Shows a picture stretched over its whole area.
class ImageBox : public Control {
 public:
  ImageBox(const Container& container, const Bounds& bounds);

  // Keys and clicks that wait come first: a picture that they replace is never decoded. One that its decoder refuses
  // leaves the picture before it.
  void SetPicture(const Picture& picture);
  Picture ShownPicture() const;  // the one set last, unless it was refused
};

// A small picture that acts as a button: it can be clicked, focused, and pressed with Space or Enter.
class ImageButton : public Control {
 public:
  ImageButton(const Container& container, const Bounds& bounds, int picture, const std::string& toolTip);

  std::function<void()> OnClick;
};

// Ticks while it is enabled. It is created disabled.
class Timer {
 public:
  Timer(Window& window, std::uint32_t intervalMilliseconds);
  ~Timer();
  Timer(const Timer&) = delete;
  Timer& operator=(const Timer&) = delete;

  bool Enabled() const;
  void Enable(bool enabled);

  std::function<void()> OnTick;

  TimerState& State() const { return *state_; }

 private:
  std::unique_ptr<TimerState> state_;
};

}  // namespace platform
