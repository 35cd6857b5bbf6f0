// Listings of directories, and the short forms of names.
#include <algorithm>
#include <utility>

#include "platform/files.h"
#include "platform/simulated/machine.h"
#include "platform/simulated/text_order.h"
#include "platform/text.h"
#include "platform/wildcards.h"

namespace platform {
namespace {

using simulated::Entry;
using simulated::Fails;
using simulated::Locate;
using simulated::Place;

using Found = std::vector<std::pair<std::string, const Entry*>>;  // with their sort keys

void Sort(Found& found) {
  const auto before = [](const auto& a, const auto& b) { return a.first < b.first; };
  if (!std::is_sorted(found.begin(), found.end(), before)) std::stable_sort(found.begin(), found.end(), before);
}

// A name that the code page lacks has a "?" in it, which no path can have.
DirectoryEntry EntryOf(const Entry& entry) {
  return {entry.Name, entry.ShortName, entry.Name.find('?') == std::string::npos};
}

bool IsListed(const Entry& entry) {
  return (entry.Attributes & (AttributeHidden | AttributeSystem | AttributeDirectory)) == 0;
}

bool IsSeenDirectory(const Entry& entry) {
  return entry.IsDirectory() && (entry.Attributes & (AttributeHidden | AttributeSystem)) == 0;
}

bool IsDirectory(const std::optional<Place>& place) {
  return place && place->EndsWithBackslash && place->Found && place->Found->IsDirectory();
}

}  // namespace

std::vector<DirectoryEntry> ListDirectory(const std::string& directory, const std::string& patterns) {
  const bool fault = Fails();
  const std::optional<Place> place = Locate(directory);
  if (fault || !IsDirectory(place)) return {};
  const std::string wanted = CharUpperBuffA(patterns);
  Found found;
  for (const auto& [upperName, entry] : place->Found->Entries) {
    if (IsListed(*entry) && MatchesAnyPattern(upperName, wanted)) {
      found.emplace_back(simulated::SortKey(entry->Name), entry.get());
    }
  }
  Sort(found);
  std::vector<DirectoryEntry> entries;
  for (const auto& [key, entry] : found) entries.push_back(EntryOf(*entry));
  return entries;
}

std::vector<std::string> ListSubdirectories(const std::string& directory) {
  const bool fault = Fails();
  const std::optional<Place> place = Locate(directory);
  if (fault || !IsDirectory(place)) return {};
  Found found;
  for (const auto& [upperName, entry] : place->Found->Entries) {
    if (IsSeenDirectory(*entry)) found.emplace_back(simulated::SortKey(entry->Name), entry.get());
  }
  Sort(found);
  std::vector<std::string> names;
  for (const auto& [key, entry] : found) {
    const DirectoryEntry listed = EntryOf(*entry);
    if (!listed.PathName().empty()) names.push_back(listed.PathName());
  }
  return names;
}

std::optional<DirectoryEntry> ListPath(const std::string& path) {
  const bool fault = Fails();
  const std::optional<Place> place = Locate(path);
  if (fault || !place || !place->Found || place->EndsWithBackslash || !IsListed(*place->Found)) return std::nullopt;
  return EntryOf(*place->Found);
}

std::optional<std::string> GetShortPathNameA(const std::string& path, std::size_t bufferLength) {
  const bool fault = Fails();
  const std::optional<Place> whole = Locate(path);
  if (fault || !whole || !whole->Found) return std::nullopt;
  std::string shortPath;
  std::size_t start = 0;
  while (start < path.size()) {
    std::size_t end = path.find('\\', start);
    while (!CharacterBeginsAt(path, end)) end = path.find('\\', end + 1);
    end = std::min(end, path.size());
    const std::optional<Place> part = Locate(path.substr(0, end));
    const bool named = part && part->Found && part->Folder && end > start;
    const std::string written = path.substr(start, end - start);
    shortPath += named && !part->Found->ShortName.empty() ? part->Found->ShortName : written;
    if (end < path.size()) shortPath += '\\';
    start = end + 1;
  }
  if (shortPath.size() + 1 > bufferLength) return std::nullopt;
  return shortPath;
}

}  // namespace platform
