// What the contract tests need of the machine and no platform header can do.
#pragma once

#include <cstdint>
#include <string>

namespace contract {

// A new directory, empty; gone with all that is in it, as are the files' attributes, at the end of its life.
class FreshDirectory {
 public:
  FreshDirectory();
  ~FreshDirectory();
  FreshDirectory(const FreshDirectory&) = delete;
  FreshDirectory& operator=(const FreshDirectory&) = delete;

  const std::string& Path() const { return path_; }  // with a backslash at its end
  std::string operator/(const std::string& name) const { return path_ + name; }

 private:
  std::string path_;
};

// The path below HKEY_CURRENT_USER of a new key, empty; gone with all that is in it at the end of its life.
class FreshKey {
 public:
  FreshKey();
  ~FreshKey();
  FreshKey(const FreshKey&) = delete;
  FreshKey& operator=(const FreshKey&) = delete;

  const std::string& Path() const { return path_; }

 private:
  std::string path_;
};

// Of this program, until its end.
void SetEnvironment(const std::string& name, const std::string& value);

void SetAttributes(const std::string& path, std::uint32_t attributes);

// Where Wine differs from Windows, the tests ask Windows and the twin only:
bool ProtectsReadOnlyFiles();  // Wine lets them be replaced, and root also write to them
bool StartsWithPriority();     // Wine starts every process with the normal priority

// A program that runs until it is told to end, and then writes the file "here.txt" in the directory it works in: the
// number of its priority class, a blank, and its whole command line.
class StandIn {
 public:
  StandIn();
  ~StandIn();
  StandIn(const StandIn&) = delete;
  StandIn& operator=(const StandIn&) = delete;

  const std::string& CommandLine() const { return commandLine_; }  // what starts it; arguments may be added
  void TellToEnd();

 private:
  std::string commandLine_;
  std::intptr_t signal_ = 0;
};

}  // namespace contract
