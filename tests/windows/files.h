// Files as the tests make them, and as the program leaves them.
#pragma once

#include <windows.h>

#include <map>
#include <string>

// All bytes of a file; the empty text when it is missing.
std::string ContentOf(const std::string& path);

// Writes a file; the directories on its way are created.
void PutFile(const std::string& path, const std::string& content);

// Contents by name. A directory without anything is there too, with a backslash behind its name.
using Files = std::map<std::string, std::string>;

// The files in a directory, whose path ends with a backslash, and in those below it.
Files FilesIn(const std::string& directory);

// Contents are too long to be shown: the names of those that differ are.
void ExpectFiles(const Files& expected, const Files& found);

// The path with each part in its short form, as the system makes it.
std::string ShortPath(const std::string& path);

// How a stand-in was started.
struct Call {
  std::string CommandLine, Directory;
  bool operator==(const Call&) const = default;
};
void PrintTo(const Call& call, std::ostream* out);

// Waits for the call that the stand-in at this path recorded and forgets it, so that the next one can be waited for.
// Empty when there is none in time.
Call NextCall(const std::string& program);

// Every byte there is, and no two contents of different kinds alike by chance.
std::string Bytes(unsigned kind, size_t size);

// A GIF file of one pixel.
std::string Gif(COLORREF colour);

// Has the implementation of packages in Python (tests/package/package_format.py) do something in a directory; its
// output.
std::string PackageFormat(const std::string& directory, const std::string& arguments);

// A package, whose checksum is given: the tests know it from elsewhere.
std::string Package(const std::string& name, const std::string& dosName, const std::string& checksum,
                    const std::string& picture, const std::string& rom);
