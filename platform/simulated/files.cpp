// Open files.
#include "platform/files.h"

#include <algorithm>
#include <utility>

#include "platform/simulated/machine.h"

namespace platform {
namespace {

using simulated::Fails;
using simulated::OpenFile;
using simulated::Place;
using simulated::TheMachine;

// Null when the handle is closed, the power was cut, or the disk is no longer in its drive.
OpenFile* Opened(std::intptr_t handle) {
  const auto found = TheMachine().OpenFiles.find(handle);
  const bool usable = found != TheMachine().OpenFiles.end() && found->second.Where->InDrive;
  return usable ? &found->second : nullptr;
}

bool IsOpenAlone(const simulated::Entry& file) {
  return std::ranges::any_of(TheMachine().OpenFiles,
                             [&](const auto& each) { return each.second.Alone && each.second.Target.get() == &file; });
}

bool MayOpen(const Place& place, Access access) {
  if (place.EndsWithBackslash) return false;
  const bool mustExist = access == Access::Read || access == Access::Alone;
  if (!place.Found) return !mustExist && place.Folder && !place.Folder->TakesNoFiles;
  if (access == Access::CreateNew) return false;
  if (place.Found->IsDirectory() || place.Found->Locked || IsOpenAlone(*place.Found)) return false;
  if (access == Access::Alone && place.Found->TimesOpen > 0) return false;
  return access == Access::Read || (place.Found->Attributes & AttributeReadOnly) == 0;
}

}  // namespace

File::File(const std::string& path, Access access) {
  const bool fault = Fails();
  std::optional<Place> place = simulated::Locate(path);
  if (fault || !place || !MayOpen(*place, access)) return;
  if (!place->Found) simulated::CreateEntry(*place, AttributeArchive);
  ++place->Found->TimesOpen;
  handle_ = ++TheMachine().LastHandle;
  TheMachine().OpenFiles[handle_] = {place->Where, place->Found, place->Path, access != Access::Read,
                                     access == Access::Alone};
}

File::File(File&& other) noexcept : handle_(std::exchange(other.handle_, -1)) {}

File& File::operator=(File&& other) noexcept {
  if (this != &other) {
    Close();
    handle_ = std::exchange(other.handle_, -1);
  }
  return *this;
}

File::~File() { Close(); }

bool File::IsOpen() const { return TheMachine().OpenFiles.contains(handle_); }

void File::Close() {
  const auto found = TheMachine().OpenFiles.find(std::exchange(handle_, -1));
  if (found == TheMachine().OpenFiles.end()) return;
  --found->second.Target->TimesOpen;
  TheMachine().OpenFiles.erase(found);
}

std::int64_t File::Size() const {
  const OpenFile* open = Opened(handle_);
  if (!open || Fails()) return -1;
  return static_cast<std::int64_t>(open->Target->Content.size());
}

std::int64_t File::Read(std::int64_t position, void* buffer, std::size_t length) {
  const OpenFile* open = Opened(handle_);
  if (!open || Fails() || position < 0) return -1;
  const std::string& content = open->Target->Content;
  if (static_cast<std::uint64_t>(position) >= content.size()) return 0;
  return static_cast<std::int64_t>(
      content.copy(static_cast<char*>(buffer), length, static_cast<std::size_t>(position)));
}

bool File::Write(std::int64_t position, std::string_view bytes) {
  const bool fault = Fails();  // may close all files
  OpenFile* open = Opened(handle_);
  if (!open || !open->Writable || position < 0) return false;
  const std::string_view tried = bytes.substr(0, fault ? bytes.size() / 2 : bytes.size());
  const std::size_t stored = simulated::Store(*open->Where, *open->Target, static_cast<std::uint64_t>(position), tried);
  if (stored > 0) simulated::CountWrite(open->Path);
  return !fault && stored == bytes.size();
}

bool File::SetSize(std::int64_t length) {
  OpenFile* open = Opened(handle_);
  if (!open || Fails() || !open->Writable || length < 0) return false;
  const auto wanted = static_cast<std::uint64_t>(length);
  if (wanted == open->Target->Content.size()) return true;
  if (!simulated::Resize(*open->Where, *open->Target, wanted)) return false;
  simulated::CountWrite(open->Path);
  return true;
}

bool File::Flush() {
  OpenFile* open = Opened(handle_);
  if (!open || Fails() || !open->Writable) return false;
  simulated::MarkFlushed(*open->Target);
  return true;
}

bool File::CopyInformation(const File& from) {
  const OpenFile *open = Opened(handle_), *source = Opened(from.handle_);
  if (!open || !source || Fails() || !open->Writable) return false;
  open->Target->Attributes = source->Target->Attributes & ~AttributeReadOnly;
  open->Target->Changed = source->Target->Changed;
  return true;
}

}  // namespace platform
