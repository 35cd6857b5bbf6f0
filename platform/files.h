// Files, directories and disks. Paths have backslashes, and one with a NUL in it names nothing; nothing here shows
// a message or asks for a disk.
#pragma once

#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace platform {

enum class Access {
  Read,       // the file must exist
  ReadWrite,  // created empty when missing; an existing file keeps its contents
  CreateNew,  // for writing; fails when anything of that name exists
  Alone       // the file must exist and can be written; no other program has it open, and none can open it meanwhile
};

// An open file, closed at the end of its life. Other programs may read and write it meanwhile.
class File {
 public:
  File() = default;
  File(const std::string& path, Access access);
  File(File&& other) noexcept;
  File& operator=(File&& other) noexcept;
  File(const File&) = delete;
  File& operator=(const File&) = delete;
  ~File();

  // False when the file could not be opened, and after Close. Every other operation then fails.
  bool IsOpen() const;
  void Close();

  // The length in bytes, or -1 when it cannot be told.
  std::int64_t Size() const;

  // Reads up to `length` bytes from byte `position` (the first byte is 0). How many were read: fewer only
  // at the end of the file, 0 beyond it; -1 when reading failed.
  std::int64_t Read(std::int64_t position, void* buffer, std::size_t length);

  // Writes all bytes at byte `position` (the first byte is 0) in one call of the platform. On failure some of
  // them may have been written.
  bool Write(std::int64_t position, std::string_view bytes);

  // Makes the file this long: cuts it, or reserves the room on the disk. On failure the length is as before.
  bool SetSize(std::int64_t length);

  // Returns when the contents are on the disk itself; false when they may not be.
  bool Flush();

  // Gives this file, which is open for writing, the other one's time of change and its attributes but read-only.
  bool CopyInformation(const File& from);

 private:
  std::intptr_t handle_ = -1;  // of the implementation; -1: not open
};

inline constexpr std::uint32_t AttributeReadOnly = 0x01;
inline constexpr std::uint32_t AttributeHidden = 0x02;
inline constexpr std::uint32_t AttributeSystem = 0x04;
inline constexpr std::uint32_t AttributeDirectory = 0x10;
inline constexpr std::uint32_t AttributeArchive = 0x20;
inline constexpr std::uint32_t AttributeNormal = 0x80;  // of a file that has no other attribute

// The attribute set of a file or directory; nothing when the path does not exist or cannot be reached.
std::optional<std::uint32_t> GetFileAttributesA(const std::string& path);

// The length in bytes of a file, without opening it; nothing for a directory and for a missing file, -1 when it cannot
// be told whether there is one.
std::optional<std::int64_t> FileSize(const std::string& path);

bool DeleteFileA(const std::string& path);  // false for a missing, read-only or open file

// Puts a file into its disk's recycle bin, without any dialog; where the disk has none it may be deleted. True when it
// is gone. False, and it stays, for what DeleteFileA would leave, and where the shell cannot do it.
bool MoveToRecycleBin(const std::string& path);

// Deletes a file that no program has open, and that was changed last before the machine was started or more than so
// many seconds ago. False when it stays; one that was changed in the future stays.
bool DeleteAbandonedFile(const std::string& path, std::uint32_t seconds);

enum class Existing { Replace, Keep };

// Gives the file another name on the same disk, and returns when the disk holds it so. A file that has that name is
// replaced; with Keep it stays, and the answer is false.
bool MoveFileExA(const std::string& from, const std::string& to, Existing existing);

bool CreateDirectoryA(const std::string& path);  // one directory; false when it exists or its parent does not

struct DirectoryEntry {
  std::string Name;       // as it is written on the disk, with "?" for each character that the code page lacks
  std::string ShortName;  // its 8.3 form, where the disk keeps another one; else empty
  bool IsExact = true;    // else the code page lacks the name: a path with it leads to nothing, or to another file

  // The name for a path that leads here: as it is written, or else the short one. Empty when there is none.
  const std::string& PathName() const { return IsExact ? Name : ShortName; }

  bool operator==(const DirectoryEntry&) const = default;
};

// The files of a directory (its path ends with a backslash) whose long names match one of the patterns
// ("*.zip;*.smc"; "*" and "?", without regard to letter case), without hidden and system files and directories,
// in ascending order of their names as CompareStringA orders them. An entry that cannot be read is left out. Empty when
// the directory cannot be read, or its path ends otherwise.
std::vector<DirectoryEntry> ListDirectory(const std::string& directory, const std::string& patterns);

// The names of the directories in a directory (its path ends with a backslash), in the order of ListDirectory, without
// hidden and system ones and without "." and "..", each as a path has it; one that no path leads to is left out. Empty
// when the directory cannot be read, or its path ends otherwise.
std::vector<std::string> ListSubdirectories(const std::string& directory);

// The listing of exactly this path, no wildcards: nothing when it is missing, a directory, hidden or system.
std::optional<DirectoryEntry> ListPath(const std::string& path);

// The path with each part in 8.3 form where the disk has one; nothing when the path does not exist or the result is
// longer than `bufferLength` - 1 characters.
std::optional<std::string> GetShortPathNameA(const std::string& path, std::size_t bufferLength);

// The path of a file or directory however it was reached: whole, without short names, links and drives that stand for
// directories. For comparing: nothing of it need be in the code page. Nothing when it is missing or does not open.
std::optional<std::string> GetFinalPathNameA(const std::string& path);

struct DiskFreeSpace {
  std::uint32_t SectorsPerCluster;
  std::uint32_t BytesPerSector;
  std::uint32_t FreeClusters;
  std::uint32_t TotalClusters;
};

// Of the disk that `root` names ("A:" or "C:\"); nothing when there is no such disk or none is in the drive.
std::optional<DiskFreeSpace> GetDiskFreeSpaceA(const std::string& root);

// The roots ("C:\") of the disks that are built in, neither removable nor in a network, in ascending order.
std::vector<std::string> FixedDrives();

// Makes `directory` ("a:\") the current directory of its own drive; the current drive stays as it is. False when the
// drive is absent or has no disk.
bool SetDriveDirectory(const std::string& directory);

// Directory of the running program's own file, without a backslash at its end but for a disk's root ("C:\").
std::string ProgramDirectory();

}  // namespace platform
