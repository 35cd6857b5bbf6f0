// The disks of the machine in memory: a tree of files and directories on each.
#pragma once

#include <cstddef>
#include <cstdint>
#include <map>
#include <memory>
#include <optional>
#include <string>
#include <string_view>

namespace platform::simulated {

// A file or directory.
struct Entry {
  std::string Name, ShortName;  // as written; the short name is empty where the name itself is a short one
  std::uint32_t Attributes = 0;
  std::string Content;
  std::optional<std::string> Before;  // what stands on the disk itself, where it differs from the content
  bool NeverFlushed = false;          // nothing of the content is sure to stand on the disk itself
  bool Locked = false;
  bool TakesNoFiles = false;  // a directory in which nothing can be created
  std::uint64_t Changed = 0;  // when the content was, in seconds of the machine's clock
  int TimesOpen = 0;
  std::map<std::string, std::shared_ptr<Entry>> Entries;  // of a directory, by name in upper case
  std::map<std::string, std::string> ShortNames;          // of its entries, to the names in upper case

  bool IsDirectory() const;
};

struct Disk {
  char Letter = 0;
  std::uint64_t Capacity = 0, Used = 0;  // bytes; directories take none
  std::string Directory;                 // the drive's current directory, without backslashes at its ends
  bool InDrive = true;
  std::shared_ptr<Entry> Root;
};

struct OpenFile {
  std::shared_ptr<Disk> Where;
  std::shared_ptr<Entry> Target;
  std::string Path;
  bool Writable = false, Alone = false;
};

// Where a path leads: into a directory that exists.
struct Place {
  std::shared_ptr<Disk> Where;
  std::shared_ptr<Entry> Folder;  // null for a disk's root
  std::shared_ptr<Entry> Found;   // null when nothing of that name is there
  std::string Name;               // the last part as the path has it
  std::string Path;               // the full path, with the names that are on the disk
  bool EndsWithBackslash = false;
};

// Nothing when the disk or the directory is missing, or a name is none that a disk can hold.
std::optional<Place> Locate(const std::string& path);

// Puts an entry where the place says, under the place's name, and gives it a short name; takes it away.
void Attach(Place& place, std::shared_ptr<Entry> entry);
void Detach(Place& place);
std::shared_ptr<Entry> CreateEntry(Place& place, std::uint32_t attributes);

std::uint64_t FreeBytes(const Disk& disk);

// Overwrites or extends the content, as far as the disk has room. How many bytes were stored.
std::size_t Store(Disk& disk, Entry& file, std::uint64_t position, std::string_view bytes);

// Cuts or extends with zero bytes; false, and nothing changed, without the room.
bool Resize(Disk& disk, Entry& file, std::uint64_t length);

// What is in the file now counts as written to the disk itself.
void MarkFlushed(Entry& file);

// Counts a change of the content of the file at this full path.
void CountWrite(const std::string& path);

}  // namespace platform::simulated
