// A fresh installation of the program with its games, on a machine whose user never ran it before.
#pragma once

#include <map>
#include <optional>
#include <string>

#include "tests/windows/driver/program.h"

// The directory "C:\Ensaio\" with a copy of the program, and none of the program's settings. Both are removed at the
// beginning only, so that a failure can be looked into.
class Installation {
 public:
  Installation();

  const std::string Directory = "C:\\Ensaio\\";
  const std::string Emulator = Directory + "Emulador\\zsnesw.exe";
  const std::string Configuration = Directory + "Emulador\\zsnesw.cfg";
  const std::string Autoconfiguration = Directory + "tolvariscfg.exe";

  // Files are named relative to the directory; directories on their way are created.
  void Put(const std::string& name, const std::string& content) const;
  std::string Content(const std::string& name) const;
  void Remove(const std::string& name) const;

  void Set(const std::string& setting, const std::string& text) const;

  // Puts the stand-in of the emulator, points the settings at it, and has all one-time notices shown already.
  void Configure() const;

  // A game without and one with an entry in a catalogue of accented names, and two more.
  void PutGames() const;

  // All settings that are texts, as the system's own tool tells them.
  std::map<std::string, std::string> Settings() const;

  std::string CommandLine() const { return Directory + "tolvaris.exe"; }
};

// How a stand-in was started.
struct Call {
  std::string CommandLine, Directory;
  bool operator==(const Call&) const = default;
};
void PrintTo(const Call& call, std::ostream* out);

// Waits for the call that the program at this path recorded and forgets it, so that the next one can be waited for.
// Empty when there is none in time.
Call NextCall(const std::string& program);

// All bytes of a file; the empty text when it is missing.
std::string ContentOf(const std::string& path);

// Contents by name.
using Files = std::map<std::string, std::string>;

// The files in a directory, whose path ends with a backslash.
Files FilesIn(const std::string& directory);

// Every byte there is, and no two contents of different kinds alike by chance.
std::string Bytes(unsigned kind, size_t size);

// The host's name for a path of ours; empty without a host.
std::string HostPath(const std::string& path);

// The path with each part in its short form, as the system makes it.
std::string ShortPath(const std::string& path);

// A disk in drive A:, which is a directory of the host. The drive has no disk before and afterwards.
class FloppyDisk {
 public:
  explicit FloppyDisk(const std::string& directory);
  ~FloppyDisk();
  FloppyDisk(const FloppyDisk&) = delete;
  FloppyDisk& operator=(const FloppyDisk&) = delete;

  static bool IsReady();

  // Where a file system as large as a real disk is mounted, on machines that let us.
  static constexpr char SmallDirectory[] = "C:\\Disquete1440";
  static bool IsSmall();  // whether such a disk is in the drive
};
