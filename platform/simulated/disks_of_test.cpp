// The test's side of the disks.
#include <algorithm>
#include <stdexcept>
#include <utility>

#include "platform/simulated/machine.h"
#include "platform/text.h"

namespace platform::simulated {
namespace {

char Upper(char letter) { return CharUpperBuffA(std::string(1, letter))[0]; }

// A test that names a place that cannot be is wrong itself.
Place Demand(const std::string& path) {
  if (std::optional<Place> place = Locate(path)) return *place;
  throw std::logic_error("no such place on the disks: " + path);
}

void PutParents(const std::string& path) {
  std::size_t end = path.find_last_of('\\', path.size() - 2);
  while (!CharacterBeginsAt(path, end)) end = path.find_last_of('\\', end - 1);
  if (end != std::string::npos && end > 2) PutDirectory(path.substr(0, end));
}

void Collect(const Entry& folder, const std::string& path, std::vector<std::string>& files) {
  for (const auto& [key, entry] : folder.Entries) {
    const std::string full = path + "\\" + entry->Name;
    if (entry->IsDirectory()) {
      Collect(*entry, full, files);
    } else {
      files.push_back(full);
    }
  }
}

// What is left of a tree after a power cut; its bytes.
std::uint64_t Settle(Entry& entry) {
  std::uint64_t bytes = 0;
  for (const auto& [key, child] : entry.Entries) bytes += Settle(*child);
  if (entry.NeverFlushed) entry.Content.resize(entry.Content.size() / 2);
  if (entry.Before) entry.Content = *entry.Before;
  entry.TimesOpen = 0;
  MarkFlushed(entry);
  return bytes + entry.Content.size();
}

}  // namespace

void AddDisk(char letter, std::uint64_t freeBytes) {
  auto disk = std::make_shared<Disk>();
  disk->Letter = Upper(letter);
  disk->Capacity = freeBytes;
  disk->Root = std::make_shared<Entry>();
  disk->Root->Attributes = AttributeDirectory;
  RemoveDisk(letter);
  TheMachine().Disks[disk->Letter] = std::move(disk);
}

void RemoveDisk(char letter) {
  const auto found = TheMachine().Disks.find(Upper(letter));
  if (found == TheMachine().Disks.end()) return;
  found->second->InDrive = false;
  TheMachine().Disks.erase(found);
}

void SetFreeSpace(char letter, std::uint64_t bytes) {
  Disk& disk = *Demand(std::string(1, letter) + ":\\").Where;
  disk.Capacity = disk.Used + bytes;
}

void SetProgramDirectory(const std::string& directory) {
  PutDirectory(directory);
  TheMachine().ProgramDirectory = Demand(directory).Path;
}

void KeepNoShortNames() { TheMachine().ShortNames = false; }

void KeepNoRecycleBin() { TheMachine().HasRecycleBin = false; }

std::vector<std::string> Recycled() { return TheMachine().RecycleBin; }

void PutDirectory(const std::string& path, std::uint32_t attributes) {
  PutParents(path);
  Place place = Demand(path);
  if (!place.Found) CreateEntry(place, 0);
  if (place.Folder) place.Found->Attributes = attributes | AttributeDirectory;
  MarkFlushed(*place.Found);
}

void PutFile(const std::string& path, std::string_view content, std::uint32_t attributes) {
  PutParents(path);
  Place place = Demand(path);
  if (place.Found) Detach(place);
  auto entry = std::make_shared<Entry>();
  entry->Content = content;
  entry->Attributes = attributes & ~AttributeNormal;
  entry->Changed = TheMachine().Clock;
  Attach(place, std::move(entry));
}

void PutForeignFile(const std::string& path, std::string_view content) {
  const std::size_t name = path.rfind('\\') + 1;
  const std::string written = path.substr(0, name) + "foreign";
  PutFile(written, content);
  Place place = Demand(written);
  const std::shared_ptr<Entry> entry = place.Found;
  Detach(place);
  place.Name = path.substr(name);
  Attach(place, entry);
}

void SetAttributes(const std::string& path, std::uint32_t attributes) {
  const std::optional<Place> place = Locate(path);
  if (!place || !place->Found) return;
  Entry& entry = *place->Found;
  entry.Attributes = (attributes & ~AttributeNormal) | (entry.Attributes & AttributeDirectory);
}

void LockFile(const std::string& path, bool locked) {
  const Place place = Demand(path);
  if (!place.Found) throw std::logic_error("no such file: " + path);
  place.Found->Locked = locked;
}

void RemoveFile(const std::string& path) {
  std::optional<Place> place = Locate(path);
  if (place && place->Found && !place->Found->IsDirectory()) Detach(*place);
}

std::optional<std::string> Content(const std::string& path) {
  const std::optional<Place> place = Locate(path);
  if (!place || !place->Found || place->Found->IsDirectory()) return std::nullopt;
  return place->Found->Content;
}

bool DirectoryStands(const std::string& path) {
  const std::optional<Place> place = Locate(path);
  return place && place->Found && place->Found->IsDirectory();
}

std::vector<std::string> AllFiles() {
  std::vector<std::string> files;
  for (const auto& [letter, disk] : TheMachine().Disks) Collect(*disk->Root, std::string(1, letter) + ":", files);
  std::sort(files.begin(), files.end());
  return files;
}

std::uint64_t WriteCount(const std::string& path) {
  const std::optional<Place> place = Locate(path);
  const auto found = TheMachine().Writes.find(CharUpperBuffA(place ? place->Path : path));
  return found == TheMachine().Writes.end() ? 0 : found->second;
}

std::uint64_t WritesEver() { return TheMachine().WritesEver; }

std::size_t OpenFiles() { return TheMachine().OpenFiles.size(); }

void TakeNoNewFiles(const std::string& directory) { Demand(directory).Found->TakesNoFiles = true; }

void PassTime(std::uint64_t seconds) { TheMachine().Clock += seconds; }

void SetAge(const std::string& path, std::uint64_t seconds) {
  Demand(path).Found->Changed = TheMachine().Clock - seconds;
}

void CutPower() {
  TheMachine().OpenFiles.clear();
  TheMachine().StartTime = ++TheMachine().Clock;
  for (const auto& [letter, disk] : TheMachine().Disks) disk->Used = Settle(*disk->Root);
}

}  // namespace platform::simulated
