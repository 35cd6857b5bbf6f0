// The program in a directory of its own with games, settings and an emulator, and its main window while it runs.
#pragma once

#include <optional>
#include <set>

#include "tests/windows/driver/file_dialog.h"
#include "tests/windows/driver/waiting.h"
#include "tests/windows/files.h"
#include "tests/windows/messages.h"
#include "tests/windows/program_windows.h"

using Texts = std::vector<std::string>;

const std::string Home = "C:\\Ensaio\\";
const std::string Emulator = Home + "Emulador\\zsnesw.exe";
const std::string Outside = "C:\\Fora\\";  // a directory that is not the program's

// The names of the games that are there at a test's beginning, as the list sorts them.
const Texts Games = {"abelha", "Água Viva", "Corrida das Nuvens", "Élan", "Zebra"};

// A test whose installation is as one that was just configured, with all one-time notices shown. What a test before
// left is removed first: a failure can be looked into.
class Installation : public testing::Test {
 protected:
  enum Command { ManageSaves, Download, Import, Export, Delete };  // as MainWindow::Pictures has them

  Installation();

  // Files are named relative to the installation.
  static void Put(const std::string& name, const std::string& content) { PutFile(Home + name, content); }
  static std::string Content(const std::string& name) { return ContentOf(Home + name); }
  static void Remove(const std::string& name) { DeleteFileA((Home + name).c_str()); }
  static void PutStandIn(const std::string& name);

  static void Set(const std::string& setting, const std::string& text);
  static void RemoveSettings();
  static std::map<std::string, std::string> Settings();  // those that are texts

  // Starts the program, after it was ended; what is put into the installation before is there from the beginning.
  void Run();
  void Start();  // and waits for its main window

  // Selects a game and waits until it can be used.
  void Select(const std::string& game) const;

  std::string Selected() const { return SelectedEntry(window->List); }

  void Click(Command command) const { window->Pictures[command].Click(); }

  // Names a file in the dialog that the command opens.
  void Choose(Command command, const std::string& path) const;

  Message Answer(int button) const { return ::Answer(*program, button); }

  // The command ends, with nothing shown, and the game commands wait for the next selection.
  void ExpectQuietEnd() const;

  // The emulator is started in its directory, with the short path of a file of the ROM directory.
  static void ExpectPlayed(const std::string& rom);

  std::optional<Program> program;
  std::optional<MainWindow> window;
};

// What the system's own tool tells of a registry key and those below it: "KEY", or "KEY    NAME    TYPE    VALUE".
std::set<std::string> Registry(const std::string& key);

// A disk in drive A:, which holds 1440 KiB where a file system could be mounted for it. The drive has no disk before
// and afterwards.
class FloppyDisk {
 public:
  FloppyDisk();
  ~FloppyDisk();
  FloppyDisk(const FloppyDisk&) = delete;
  FloppyDisk& operator=(const FloppyDisk&) = delete;

  static bool IsSmall();
};
