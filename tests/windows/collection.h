// A collection of five games while the program runs: what import, export and delete change, and what they must not.
#pragma once

#include <optional>

#include "tests/windows/driver/file_dialog.h"
#include "tests/windows/installation.h"
#include "tests/windows/main_window.h"
#include "tests/windows/pictures.h"

class Collection : public testing::Test {
 protected:
  using Texts = std::vector<std::string>;
  enum Command { Import = 2, Export = 3, Delete = 4 };  // as MainWindow::Pictures has them

  Collection();

  // What is put into the installation before is there from the program's start.
  void Start();

  // Selects a game and waits until it can be used.
  void Select(const std::string& game) const;

  driver::FileDialog Press(Command command) const;

  // Names a file in the dialog that the command opens.
  void Choose(Command command, const std::string& path) const;

  // The command ends, with nothing shown, and the game commands wait for the next selection.
  void ExpectQuietEnd() const;

  // The game that the list shows selected; the empty text when there is none.
  std::string Selected() const;

  // Everything that the collection consists of: ROM files, pictures, catalogue; names relative to the installation.
  Files Kept() const;
  void ExpectKept(const Files& expected) const;

  Installation installation;
  const std::string Outside = installation.Directory + "Fora\\";  // a directory that is not the program's
  std::optional<driver::Program> program;
  std::optional<MainWindow> window;
};

// Runs pacote.py, which knows packages by itself, on the host, and gives what it printed. Paths among the arguments are
// host paths.
std::string Pacote(const std::string& arguments);
