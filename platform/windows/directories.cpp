// Listings of directories.
#include <windows.h>

#include <memory>
#include <utility>

#include "platform/files.h"
#include "platform/text.h"
#include "platform/wildcards.h"
#include "platform/windows/order.h"
#include "platform/windows/paths.h"
#include "platform/windows/wide.h"

namespace platform {
namespace {

constexpr DWORD NotListed = FILE_ATTRIBUTE_HIDDEN | FILE_ATTRIBUTE_SYSTEM | FILE_ATTRIBUTE_DIRECTORY;

struct FindCloser {
  using pointer = HANDLE;
  void operator()(HANDLE find) const { ::FindClose(find); }
};
using FindHandle = std::unique_ptr<void, FindCloser>;  // null: nothing found

FindHandle FindFirst(const std::string& pattern, WIN32_FIND_DATAW& data) {
  const HANDLE find = ::FindFirstFileExW(ToWide(WindowsPath(pattern)).c_str(), FindExInfoStandard, &data,
                                         FindExSearchNameMatch, nullptr, FIND_FIRST_EX_LARGE_FETCH);
  return FindHandle(find == INVALID_HANDLE_VALUE ? nullptr : find);
}

// An entry that cannot be read leaves those behind it; a disk that goes on failing ends the listing.
bool FindNext(const FindHandle& find, WIN32_FIND_DATAW& data) {
  constexpr int mostFailures = 8;
  for (int failures = 0; failures < mostFailures; ++failures) {
    if (::FindNextFileW(find.get(), &data)) return true;
    if (::GetLastError() == ERROR_NO_MORE_FILES) return false;
  }
  return false;
}

// The wide structure holds every name, where that of ANSI has 260 bytes and fails at a longer one.
DirectoryEntry EntryOf(const WIN32_FIND_DATAW& data) {
  AnsiName name = NameToAnsi(data.cFileName), shorter = NameToAnsi(data.cAlternateFileName);
  if (!shorter.IsExact) shorter.Text.clear();
  return {std::move(name.Text), std::move(shorter.Text), name.IsExact};
}

// What a directory holds of a kind (those attributes of NotListed), as far as its name is wanted, in the order of the
// names. A path without its last backslash would list what begins with the directory's name beside it.
template <typename Wanted>
std::vector<DirectoryEntry> Collect(const std::string& directory, DWORD kind, const Wanted& wanted) {
  std::vector<DirectoryEntry> found;
  if (!directory.ends_with('\\') && !directory.ends_with('/')) return found;
  WIN32_FIND_DATAW data;
  const FindHandle find = FindFirst(directory + "*", data);
  for (bool more = find != nullptr; more; more = FindNext(find, data)) {
    if ((data.dwFileAttributes & NotListed) != kind) continue;
    DirectoryEntry entry = EntryOf(data);
    if (wanted(entry.Name)) found.push_back(std::move(entry));
  }
  std::vector<const std::string*> names;
  names.reserve(found.size());
  for (const DirectoryEntry& each : found) names.push_back(&each.Name);

  std::vector<DirectoryEntry> entries;
  entries.reserve(found.size());
  for (const std::size_t place : InOrder(names)) entries.push_back(std::move(found[place]));
  return entries;
}

bool HasWildcard(const std::string& path) {
  const std::wstring wide = ToWide(path);
  const std::size_t name = wide.find_last_of(L"\\/:") + 1;           // 0 when there is none
  return wide.find_first_of(L"*?<>\"", name) != std::wstring::npos;  // the last three are wildcards inside Windows
}

}  // namespace

// Each name is matched here and not by Windows, whose own search also looks at the 8.3 names, so that "*.zip" would
// find "a.zipx", and which would read the directory anew for each pattern.
std::vector<DirectoryEntry> ListDirectory(const std::string& directory, const std::string& patterns) {
  const std::string wanted = CharUpperBuffA(patterns);
  return Collect(directory, 0,
                 [&](const std::string& name) { return MatchesAnyPattern(CharUpperBuffA(name), wanted); });
}

std::vector<std::string> ListSubdirectories(const std::string& directory) {
  std::vector<std::string> names;
  const auto isNeitherSelfNorParent = [](const std::string& name) { return name != "." && name != ".."; };
  for (const DirectoryEntry& each : Collect(directory, FILE_ATTRIBUTE_DIRECTORY, isNeitherSelfNorParent)) {
    if (!each.PathName().empty()) names.push_back(each.PathName());
  }
  return names;
}

std::optional<DirectoryEntry> ListPath(const std::string& path) {
  if (HasWildcard(path)) return std::nullopt;
  WIN32_FIND_DATAW data;
  if (!FindFirst(path, data) || data.dwFileAttributes & NotListed) return std::nullopt;
  return EntryOf(data);
}

}  // namespace platform
