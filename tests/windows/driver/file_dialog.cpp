#include "tests/windows/driver/file_dialog.h"

#include "tests/windows/driver/waiting.h"

namespace {

// The identifiers of the dialog's controls, which the system's header dlgs.h gives to those who extend it.
constexpr int FileTypeList = 0x470;
constexpr int FileNameBox = 0x47C;

Window Part(const Window& dialog, const char* className, int id) {
  for (const Window& child : dialog.Children()) {
    if (child.Class() == className && GetDlgCtrlID(child.Handle()) == id) return child;
  }
  return {};
}

}  // namespace

FileDialog::FileDialog(const Program& program) {
  EXPECT_SOON((dialog_ = FindMessage(program), name_ = Part(dialog_, "Edit", FileNameBox))) << "\nno file dialog comes";
  types_ = Part(dialog_, "ComboBox", FileTypeList);
  EXPECT_SOON(name_.Focused());
}

void FileDialog::ChooseNextType() const {
  const std::string before = types_.Text();
  types_.Click();
  PressKey(VK_DOWN);
  PressKey(VK_RETURN);
  EXPECT_SOON(types_.Text() != before);
}

void FileDialog::Type(const std::string& path) const {
  if (!name_.Focused()) name_.Click();
  EXPECT_SOON(name_.Focused());
  PressWith(VK_CONTROL, 'A');
  TypeText(path);
  EXPECT_SOON_EQ(path, name_.Text());
}

void FileDialog::Enter(const std::string& path) const {
  Type(path);
  Press(VK_RETURN);
}

void FileDialog::Press(WORD key) const {
  PressKey(key);
  EXPECT_SOON(!dialog_.Visible()) << "\nthe dialog stays";
}
