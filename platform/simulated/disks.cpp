#include "platform/simulated/disks.h"

#include <algorithm>
#include <utility>
#include <vector>

#include "platform/files.h"
#include "platform/simulated/machine.h"
#include "platform/simulated/short_names.h"
#include "platform/text.h"

namespace platform::simulated {
namespace {

constexpr std::size_t LongestPath = 259, LongestName = 255;
constexpr std::uint64_t LargestFile = std::uint64_t{512} << 20;  // the memory that one file may take here

struct ParsedPath {
  std::shared_ptr<Disk> Where;
  std::vector<std::string> Parts;
  bool EndsWithBackslash = false;
};

bool IsSeparator(char character) { return character == '\\' || character == '/'; }

// The next separator, or the path's end. The later bytes of a character separate nothing.
std::size_t EndOfPart(std::string_view path) {
  std::size_t end = path.find_first_of("\\/");
  while (!CharacterBeginsAt(path, end)) end = path.find_first_of("\\/", end + 1);
  return std::min(end, path.size());
}

bool EndsWithSeparator(std::string_view path) {
  return !path.empty() && IsSeparator(path.back()) && CharacterBeginsAt(path, path.size() - 1);
}

// Such names stand for a device in every directory and with any extension.
bool IsDevice(const std::string& name) {
  std::string base = CharUpperBuffA(name.substr(0, name.find('.')));
  base.erase(base.find_last_not_of(' ') + 1);
  if (base == "CON" || base == "PRN" || base == "AUX" || base == "NUL") return true;
  const bool port = base.starts_with("COM") || base.starts_with("LPT");
  return port && base.size() == 4 && base[3] >= '1' && base[3] <= '9';
}

bool IsName(const std::string& name) {
  constexpr std::string_view forbidden = "<>:\"|?*";
  if (name.size() > LongestName || IsDevice(name)) return false;
  for (std::size_t i = 0; i < name.size(); ++i) {
    const bool refused =
        static_cast<unsigned char>(name[i]) < 0x20 || forbidden.find(name[i]) != std::string_view::npos;
    if (refused && CharacterBeginsAt(name, i)) return false;
  }
  return true;
}

// Adds the parts of a path; "." and ".." are followed, and dots and blanks at a part's end do not count.
void AddParts(std::vector<std::string>& parts, std::string_view path) {
  while (!path.empty()) {
    const std::size_t end = EndOfPart(path);
    std::string part(path.substr(0, end));
    path.remove_prefix(std::min(path.size(), end + 1));
    if (part == "..") {
      if (!parts.empty()) parts.pop_back();
      continue;
    }
    part.erase(part.find_last_not_of(". ") + 1);
    if (!part.empty()) parts.push_back(std::move(part));
  }
}

std::shared_ptr<Disk> DiskOf(char letter) {
  const auto found = TheMachine().Disks.find(CharUpperBuffA(std::string(1, letter))[0]);
  return found == TheMachine().Disks.end() ? nullptr : found->second;
}

// A path without a drive starts in the program's directory, one with a drive but no root in the drive's own.
ParsedPath Parse(std::string_view path) {
  const std::string& home = TheMachine().ProgramDirectory;
  ParsedPath parsed;
  parsed.EndsWithBackslash = EndsWithSeparator(path);
  const bool drive = path.size() >= 2 && path[1] == ':';
  const std::string_view rest = drive ? path.substr(2) : path;
  parsed.Where = DiskOf(drive ? path[0] : home[0]);
  if (!parsed.Where) return parsed;
  if (rest.empty() || !IsSeparator(rest.front())) {
    AddParts(parsed.Parts, drive ? parsed.Where->Directory : home.substr(2));
  }
  AddParts(parsed.Parts, rest);
  return parsed;
}

std::shared_ptr<Entry> Find(const Entry& folder, const std::string& name) {
  std::string key = CharUpperBuffA(name);
  const auto alias = folder.ShortNames.find(key);
  if (alias != folder.ShortNames.end()) key = alias->second;
  const auto found = folder.Entries.find(key);
  return found == folder.Entries.end() ? nullptr : found->second;
}

void Append(std::string& path, const std::string& name) {
  if (!EndsWithSeparator(path)) path += '\\';
  path += name;
}

// Goes one part further; false when there is no such directory to go into.
bool Descend(Place& place, const std::string& part) {
  if (!place.Found || !place.Found->IsDirectory() || !IsName(part)) return false;
  place.Folder = place.Found;
  place.Found = Find(*place.Folder, part);
  place.Name = part;
  Append(place.Path, place.Found ? place.Found->Name : part);
  return true;
}

// Before the content changes.
void Remember(Entry& file) {
  if (!file.NeverFlushed && !file.Before) file.Before = file.Content;
  file.Attributes |= AttributeArchive;
  file.Changed = TheMachine().Clock;
}

}  // namespace

bool Entry::IsDirectory() const { return (Attributes & AttributeDirectory) != 0; }

std::optional<Place> Locate(const std::string& path) {
  const bool network = path.size() >= 2 && IsSeparator(path[0]) && IsSeparator(path[1]);
  if (path.empty() || path.size() > LongestPath || network) return std::nullopt;
  const ParsedPath parsed = Parse(path);
  if (!parsed.Where) return std::nullopt;
  Place place{parsed.Where,
              nullptr,
              parsed.Where->Root,
              "",
              std::string(1, parsed.Where->Letter) + ":\\",
              parsed.EndsWithBackslash};
  for (const std::string& part : parsed.Parts) {
    if (!Descend(place, part)) return std::nullopt;
  }
  if (place.EndsWithBackslash && place.Found && !place.Found->IsDirectory()) return std::nullopt;
  return place;
}

void Attach(Place& place, std::shared_ptr<Entry> entry) {
  Entry& folder = *place.Folder;
  const std::string key = CharUpperBuffA(place.Name);
  entry->Name = place.Name;
  entry->ShortName.clear();
  if (TheMachine().ShortNames && !IsShortName(place.Name)) {
    entry->ShortName = MakeShortName(place.Name, [&](const std::string& name) {
      return folder.ShortNames.contains(name) || folder.Entries.contains(name);
    });
    folder.ShortNames[entry->ShortName] = key;
  }
  place.Where->Used += entry->Content.size();
  folder.Entries[key] = entry;
  place.Found = std::move(entry);
}

void Detach(Place& place) {
  place.Where->Used -= place.Found->Content.size();
  place.Folder->ShortNames.erase(place.Found->ShortName);
  place.Folder->Entries.erase(CharUpperBuffA(place.Found->Name));
  place.Found.reset();
}

std::shared_ptr<Entry> CreateEntry(Place& place, std::uint32_t attributes) {
  auto entry = std::make_shared<Entry>();
  entry->Attributes = attributes;
  entry->NeverFlushed = true;
  entry->Changed = TheMachine().Clock;
  Attach(place, entry);
  return entry;
}

std::uint64_t FreeBytes(const Disk& disk) { return disk.Capacity > disk.Used ? disk.Capacity - disk.Used : 0; }

std::size_t Store(Disk& disk, Entry& file, std::uint64_t position, std::string_view bytes) {
  const std::uint64_t room = std::min(file.Content.size() + FreeBytes(disk), LargestFile);
  if (position >= room || bytes.empty()) return 0;
  const auto fitting = static_cast<std::size_t>(std::min<std::uint64_t>(bytes.size(), room - position));
  Remember(file);
  if (position + fitting > file.Content.size()) {
    disk.Used += position + fitting - file.Content.size();
    file.Content.resize(static_cast<std::size_t>(position) + fitting);
  }
  file.Content.replace(static_cast<std::size_t>(position), fitting, bytes.substr(0, fitting));
  return fitting;
}

bool Resize(Disk& disk, Entry& file, std::uint64_t length) {
  const std::uint64_t room = std::min(file.Content.size() + FreeBytes(disk), LargestFile);
  if (length > file.Content.size() && length > room) return false;
  Remember(file);
  disk.Used = disk.Used - file.Content.size() + length;
  file.Content.resize(static_cast<std::size_t>(length));
  return true;
}

void MarkFlushed(Entry& file) {
  file.Before.reset();
  file.NeverFlushed = false;
}

void CountWrite(const std::string& path) {
  ++TheMachine().Writes[CharUpperBuffA(path)];
  ++TheMachine().WritesEver;
}

}  // namespace platform::simulated
