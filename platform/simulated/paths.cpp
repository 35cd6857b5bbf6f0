// Files and directories by their paths, and what a disk tells of itself.
#include <algorithm>
#include <utility>

#include "platform/files.h"
#include "platform/simulated/machine.h"

namespace platform {
namespace {

using simulated::Entry;
using simulated::Fails;
using simulated::Locate;
using simulated::Place;
using simulated::TheMachine;

constexpr std::uint32_t BytesPerSector = 512;

bool InUse(const Entry& entry) { return entry.Locked || entry.TimesOpen > 0; }

bool IsFile(const std::optional<Place>& place) {
  return place && place->Found && !place->Found->IsDirectory() && !place->EndsWithBackslash;
}

bool MayDelete(const std::optional<Place>& place) {
  return IsFile(place) && !InUse(*place->Found) && (place->Found->Attributes & AttributeReadOnly) == 0;
}

// Whether another file may take this place.
bool MayTake(const std::optional<Place>& place, Existing existing) {
  if (!place || !place->Folder || place->EndsWithBackslash) return false;
  if (!place->Found) return !place->Folder->TakesNoFiles;
  return existing == Existing::Replace && MayDelete(place);
}

std::uint32_t Clusters(std::uint64_t bytes) {
  return static_cast<std::uint32_t>(std::min<std::uint64_t>(bytes / BytesPerSector, 0xFFFFFFFF));
}

}  // namespace

std::optional<std::uint32_t> GetFileAttributesA(const std::string& path) {
  const bool fault = Fails();
  const std::optional<Place> place = Locate(path);
  if (fault || !place || !place->Found) return std::nullopt;
  return place->Found->Attributes == 0 ? AttributeNormal : place->Found->Attributes;
}

std::optional<std::int64_t> FileSize(const std::string& path) {
  const bool fault = Fails();
  const std::optional<Place> place = Locate(path);
  if (fault) return -1;
  if (!IsFile(place)) return std::nullopt;
  return static_cast<std::int64_t>(place->Found->Content.size());
}

bool DeleteFileA(const std::string& path) {
  const bool fault = Fails();
  std::optional<Place> place = Locate(path);
  if (fault || !MayDelete(place)) return false;
  simulated::Detach(*place);
  return true;
}

bool MoveToRecycleBin(const std::string& path) {
  const bool fault = Fails();
  std::optional<Place> place = Locate(path);
  if (fault || !MayDelete(place) || !TheMachine().HasRecycleBin) return false;
  TheMachine().RecycleBin.push_back(place->Path);
  simulated::Detach(*place);
  return true;
}

bool DeleteAbandonedFile(const std::string& path, std::uint32_t seconds) {
  const bool fault = Fails();
  std::optional<Place> place = Locate(path);
  if (fault || !MayDelete(place)) return false;
  const std::uint64_t changed = place->Found->Changed;
  if (changed >= TheMachine().StartTime && changed + seconds >= TheMachine().Clock) return false;
  simulated::Detach(*place);
  return true;
}

// The new name is on the disk at once; contents that were not flushed are no safer under it.
bool MoveFileExA(const std::string& from, const std::string& to, Existing existing) {
  const bool fault = Fails();
  std::optional<Place> source = Locate(from), target = Locate(to);
  if (fault || !IsFile(source) || InUse(*source->Found) || !target || target->Where != source->Where) return false;
  const bool same = target->Found == source->Found;
  if (!same && !MayTake(target, existing)) return false;
  const std::shared_ptr<Entry> moved = source->Found;
  simulated::Detach(*source);
  if (target->Found && !same) simulated::Detach(*target);
  simulated::Attach(*target, moved);
  simulated::CountWrite(target->Path);
  return true;
}

bool CreateDirectoryA(const std::string& path) {
  const bool fault = Fails();
  std::optional<Place> place = Locate(path);
  if (fault || !place || place->Found) return false;
  simulated::MarkFlushed(*simulated::CreateEntry(*place, AttributeDirectory));
  return true;
}

std::optional<std::string> GetFinalPathNameA(const std::string& path) {
  const bool fault = Fails();
  const std::optional<Place> place = Locate(path);
  if (fault || !place || !place->Found) return std::nullopt;
  return place->Path;
}

std::optional<DiskFreeSpace> GetDiskFreeSpaceA(const std::string& root) {
  const bool fault = Fails();
  const bool isRoot = root.size() >= 2 && root[1] == ':' && (root.size() == 2 || root.substr(2) == "\\");
  const std::optional<Place> place = isRoot ? Locate(root) : std::nullopt;
  if (fault || !place) return std::nullopt;
  return DiskFreeSpace{1, BytesPerSector, Clusters(simulated::FreeBytes(*place->Where)),
                       Clusters(place->Where->Capacity)};
}

// Drives A: and B: take floppy disks.
std::vector<std::string> FixedDrives() {
  if (Fails()) return {};
  std::vector<std::string> roots;
  for (const auto& [letter, disk] : TheMachine().Disks) {
    if (letter > 'B') roots.push_back({letter, ':', '\\'});
  }
  return roots;
}

bool SetDriveDirectory(const std::string& directory) {
  const bool fault = Fails();
  const bool namesDrive = directory.size() >= 2 && directory[1] == ':';
  const std::optional<Place> place = namesDrive ? Locate(directory) : std::nullopt;
  if (fault || !place || !place->Found || !place->Found->IsDirectory()) return false;
  place->Where->Directory = place->Path.substr(3);
  return true;
}

std::string ProgramDirectory() { return TheMachine().ProgramDirectory; }

}  // namespace platform
