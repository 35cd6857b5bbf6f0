// A configured installation on the machine in memory, and the main window on it.
#pragma once

#include <gtest/gtest.h>

#include <memory>
#include <string>
#include <vector>

#include "catalog/cls_DAT.h"
#include "mainwindow/Form1.h"
#include "platform/simulated/simulated.h"
#include "platform/text.h"

namespace menu {

using namespace platform::simulated;  // NOLINT(google-build-using-namespace)
using platform::Answer;
using platform::Buttons;
using platform::Icon;

inline const std::string Key = "Software\\Roms\\Tolvaris";
inline const std::string Home = "C:\\Tolvaris\\";
inline const std::string Emulator = "C:\\Emu\\zsnesw.exe";
inline const std::string EmulatorConfig = "C:\\Emu\\zsnesw.cfg";

// A bitmap of one pixel.
inline std::string Bitmap(char shade) {
  std::string bytes(58, '\0');
  const auto put = [&bytes](std::size_t at, unsigned value) {
    for (std::size_t i = 0; i < 4; ++i) bytes[at + i] = static_cast<char>(value >> (8 * i));
  };
  bytes[0] = 'B', bytes[1] = 'M';
  put(2, 58), put(10, 54), put(14, 40), put(18, 1), put(22, 1), put(34, 4);
  bytes[26] = 1, bytes[28] = 24;
  bytes[54] = bytes[55] = bytes[56] = shade;
  return bytes;
}

class Menu : public testing::Test {
 protected:
  Menu() { SetUpMachine(); }
  ~Menu() override { End(); }

  static void SetUpMachine() {
    Reset();
    PutText(Key, "EmuExe", Emulator);
    PutText(Key, "EmuCFG", EmulatorConfig);
    PutText(Key, "AvisoControle", "1");
    PutText(Key, "AvisoALTF4", "1");
    PutFile(Emulator, "MZ");
  }
  void End() {
    form.reset();
    Catalogo().Fechar();
  }

  // Starts the program; false when it ended before its window was to be shown.
  bool Start() {
    form = std::make_unique<Form1>();
    const bool goesOn = form->Form_Load();
    if (goesOn) form->Show();
    return goesOn;
  }

  static void PutRom(const std::string& file, const std::string& content = "rom") {
    PutFile(Home + "Roms\\" + file, content);
  }
  static void PutCatalogue(const std::string& content) { PutFile(Home + "tolvaris.dat", content); }
  static std::string Catalogue() { return Content(Home + "tolvaris.dat").value_or(""); }

  // Selects a game as the user would.
  void Pick(const std::string& name) const {
    const int index = form->List1.FindExact(name);
    ASSERT_GE(index, 0) << name;
    Choose(form->List1, index);
  }

  std::vector<std::string> Names() const {
    std::vector<std::string> names;
    for (int i = 0; i < form->List1.Count(); ++i) names.push_back(form->List1.Text(i));
    return names;
  }

  // The commands that are enabled, in the order of their numbers, then "k" for Check1, "l" for the list and "i" for a
  // shown picture: "234kli" is a window with nothing selected.
  std::string States() const {
    std::string states;
    const platform::Button* commands[] = {&form->Command1, &form->Command2, &form->Command3,
                                          &form->Command4, &form->Command5, &form->Command6};
    for (int i = 0; i < 6; ++i) {
      if (commands[i]->Enabled()) states += static_cast<char>('1' + i);
    }
    if (form->Check1.Enabled()) states += 'k';
    if (form->List1.Enabled()) states += 'l';
    if (form->Image1.Visible()) states += 'i';
    return states;
  }

  // The messages shown since the last call, as "title: text".
  static std::vector<std::string> Messages() {
    std::vector<std::string> texts;
    for (const ShownMessage& each : ShownMessages()) texts.push_back(each.Title + ": " + each.Text);
    ForgetMessages();
    return texts;
  }

  std::unique_ptr<Form1> form;
};

using Texts = std::vector<std::string>;

inline constexpr char NothingSelected[] = "234kli";
inline constexpr char GameSelected[] = "123456kli";

}  // namespace menu
