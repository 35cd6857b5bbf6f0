#include "platform/files.h"

#include <windows.h>

#include <algorithm>
#include <iterator>
#include <utility>

#include "platform/windows/paths.h"
#include "platform/windows/wide.h"

namespace platform {
namespace {

constexpr std::size_t LongestTransfer = std::size_t{1} << 30;  // Windows counts the bytes of one call in 32 bits

HANDLE Handle(std::intptr_t handle) { return reinterpret_cast<HANDLE>(handle); }

OVERLAPPED At(std::int64_t position) {
  OVERLAPPED place{};
  place.Offset = static_cast<DWORD>(position);
  place.OffsetHigh = static_cast<DWORD>(position >> 32);
  return place;
}

DWORD Disposition(Access access) {
  switch (access) {
    case Access::CreateNew:
      return CREATE_NEW;
    case Access::ReadWrite:
      return OPEN_ALWAYS;
    default:
      return OPEN_EXISTING;
  }
}

HANDLE OpenFile(const std::string& path, Access access) {
  const DWORD rights = access == Access::Read ? GENERIC_READ : GENERIC_READ | GENERIC_WRITE;
  const DWORD sharing = access == Access::Alone ? 0 : FILE_SHARE_READ | FILE_SHARE_WRITE;
  return ::CreateFileA(WindowsPath(path), rights, sharing, nullptr, Disposition(access), FILE_ATTRIBUTE_NORMAL,
                       nullptr);
}

// What a failure to see a file says of its length.
std::optional<std::int64_t> Unseen(DWORD error) {
  constexpr DWORD none[] = {ERROR_FILE_NOT_FOUND, ERROR_PATH_NOT_FOUND, ERROR_INVALID_NAME,        ERROR_BAD_PATHNAME,
                            ERROR_INVALID_DRIVE,  ERROR_NOT_READY,      ERROR_FILENAME_EXCED_RANGE};
  if (std::find(std::begin(none), std::end(none), error) != std::end(none)) return std::nullopt;
  return -1;
}

std::uint64_t Number(const FILETIME& time) { return std::uint64_t{time.dwHighDateTime} << 32 | time.dwLowDateTime; }

// In units of 100 nanoseconds, as the system counts its time.
bool IsOld(const FILETIME& changed, std::uint32_t seconds) {
  constexpr std::uint64_t millisecond = 10'000, second = 1'000 * millisecond;
  FILETIME now = {};
  ::GetSystemTimeAsFileTime(&now);
  const std::uint64_t started = Number(now) - ::GetTickCount64() * millisecond;
  return Number(changed) < started || Number(changed) + seconds * second < Number(now);
}

// Empty where the name cannot be had in this form: disks that the system did not mount itself have no letter for it.
std::wstring FinalName(HANDLE opened, DWORD form) {
  constexpr DWORD longest = 32'768;
  std::wstring name(longest, L'\0');
  const DWORD length = ::GetFinalPathNameByHandleW(opened, name.data(), longest, FILE_NAME_NORMALIZED | form);
  name.resize(length < longest ? length : 0);
  return name;
}

}  // namespace

File::File(const std::string& path, Access access) : handle_(reinterpret_cast<std::intptr_t>(OpenFile(path, access))) {
  if (!IsOpen()) return;
  // Names like "nul" and "com1" open a device, in every directory and with any extension: what is written there is
  // lost.
  if (::GetFileType(Handle(handle_)) != FILE_TYPE_DISK) Close();
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

bool File::IsOpen() const { return handle_ != -1; }

void File::Close() {
  if (IsOpen()) ::CloseHandle(Handle(std::exchange(handle_, -1)));
}

std::int64_t File::Size() const {
  LARGE_INTEGER size;
  return IsOpen() && ::GetFileSizeEx(Handle(handle_), &size) ? size.QuadPart : -1;
}

std::int64_t File::Read(std::int64_t position, void* buffer, std::size_t length) {
  if (!IsOpen() || position < 0) return -1;
  std::size_t done = 0;
  while (done < length) {
    OVERLAPPED place = At(position + static_cast<std::int64_t>(done));
    DWORD count = 0;
    const auto wanted = static_cast<DWORD>(std::min(length - done, LongestTransfer));
    if (!::ReadFile(Handle(handle_), static_cast<char*>(buffer) + done, wanted, &count, &place) &&
        ::GetLastError() != ERROR_HANDLE_EOF) {
      return -1;
    }
    if (count == 0) break;
    done += count;
  }
  return static_cast<std::int64_t>(done);
}

bool File::Write(std::int64_t position, std::string_view bytes) {
  if (!IsOpen() || position < 0) return false;
  while (!bytes.empty()) {
    OVERLAPPED place = At(position);
    DWORD count = 0;
    const auto wanted = static_cast<DWORD>(std::min(bytes.size(), LongestTransfer));
    if (!::WriteFile(Handle(handle_), bytes.data(), wanted, &count, &place) || count != wanted) return false;
    bytes.remove_prefix(count);
    position += count;
  }
  return true;
}

bool File::SetSize(std::int64_t length) {
  FILE_END_OF_FILE_INFO end{};
  end.EndOfFile.QuadPart = length;
  return IsOpen() && length >= 0 &&
         ::SetFileInformationByHandle(Handle(handle_), FileEndOfFileInfo, &end, sizeof end) != 0;
}

bool File::Flush() { return IsOpen() && ::FlushFileBuffers(Handle(handle_)) != 0; }

// A zero leaves a time as it is.
bool File::CopyInformation(const File& from) {
  FILE_BASIC_INFO source{}, target{};
  if (!::GetFileInformationByHandleEx(Handle(from.handle_), FileBasicInfo, &source, sizeof source)) return false;
  target.LastWriteTime = source.LastWriteTime;
  target.FileAttributes = source.FileAttributes & ~DWORD{FILE_ATTRIBUTE_READONLY};
  if (target.FileAttributes == 0) target.FileAttributes = FILE_ATTRIBUTE_NORMAL;
  return ::SetFileInformationByHandle(Handle(handle_), FileBasicInfo, &target, sizeof target) != 0;
}

std::optional<std::uint32_t> GetFileAttributesA(const std::string& path) {
  const DWORD attributes = ::GetFileAttributesA(WindowsPath(path));
  if (attributes == INVALID_FILE_ATTRIBUTES) return std::nullopt;
  return attributes;
}

std::optional<std::int64_t> FileSize(const std::string& path) {
  WIN32_FILE_ATTRIBUTE_DATA data;
  if (!::GetFileAttributesExA(WindowsPath(path), GetFileExInfoStandard, &data)) return Unseen(::GetLastError());
  if (data.dwFileAttributes & FILE_ATTRIBUTE_DIRECTORY) return std::nullopt;
  return static_cast<std::int64_t>(data.nFileSizeHigh) << 32 | data.nFileSizeLow;
}

bool DeleteFileA(const std::string& path) { return ::DeleteFileA(WindowsPath(path)) != 0; }

// Opened without sharing, it is nobody else's; deleted by its handle, it is no other file of that name.
bool DeleteAbandonedFile(const std::string& path, std::uint32_t seconds) {
  const HANDLE file = ::CreateFileA(WindowsPath(path), GENERIC_READ | DELETE, 0, nullptr, OPEN_EXISTING,
                                    FILE_ATTRIBUTE_NORMAL, nullptr);
  if (file == INVALID_HANDLE_VALUE) return false;
  FILETIME changed = {};
  FILE_DISPOSITION_INFO gone{TRUE};
  const bool deleted = ::GetFileTime(file, nullptr, nullptr, &changed) && IsOld(changed, seconds) &&
                       ::SetFileInformationByHandle(file, FileDispositionInfo, &gone, sizeof gone);
  ::CloseHandle(file);
  return deleted;
}

bool MoveFileExA(const std::string& from, const std::string& to, Existing existing) {
  const DWORD replace = existing == Existing::Replace ? MOVEFILE_REPLACE_EXISTING : 0;
  return ::MoveFileExA(WindowsPath(from), WindowsPath(to), replace | MOVEFILE_WRITE_THROUGH) != 0;
}

bool CreateDirectoryA(const std::string& path) { return ::CreateDirectoryA(WindowsPath(path), nullptr) != 0; }

std::optional<std::string> GetShortPathNameA(const std::string& path, std::size_t bufferLength) {
  std::string buffer(bufferLength, '\0');
  const DWORD length = ::GetShortPathNameA(WindowsPath(path), buffer.data(), static_cast<DWORD>(bufferLength));
  if (length == 0 || length >= bufferLength) return std::nullopt;
  buffer.resize(length);
  return buffer;
}

std::optional<std::string> GetFinalPathNameA(const std::string& path) {
  constexpr DWORD all = FILE_SHARE_READ | FILE_SHARE_WRITE | FILE_SHARE_DELETE;
  const HANDLE opened =
      ::CreateFileA(WindowsPath(path), 0, all, nullptr, OPEN_EXISTING, FILE_FLAG_BACKUP_SEMANTICS, nullptr);
  if (opened == INVALID_HANDLE_VALUE) return std::nullopt;
  std::wstring name = FinalName(opened, VOLUME_NAME_DOS);
  if (name.empty()) name = FinalName(opened, VOLUME_NAME_NT);
  ::CloseHandle(opened);
  return name.empty() ? std::nullopt : std::optional(NameToAnsi(name).Text);
}

}  // namespace platform
