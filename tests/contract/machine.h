// What the contract tests need of the machine and no platform header can do.
#pragma once

#include <gtest/gtest.h>

#include <cstdint>
#include <string>

#include "platform/files.h"

namespace contract {

using namespace platform;
using std::string;

inline constexpr const char* Key = "Software\\Tolvaris test";  // below HKEY_CURRENT_USER; gone at a test's end
inline const string Zero(1, '\0');                             // a path with one in it names nothing

// A test with a new, empty directory.
class Machine : public testing::Test {
 protected:
  Machine();
  ~Machine() override;

  const string here_;  // the directory, with a backslash at its end
};

inline void Put(const string& path, std::string_view content = "") {
  File file(path, Access::ReadWrite);
  ASSERT_TRUE(file.SetSize(0)) << path;
  ASSERT_TRUE(file.Write(0, content)) << path;
}

// What the file holds, or "(none)".
inline string Content(const string& path) {
  File file(path, Access::Read);
  if (!file.IsOpen()) return "(none)";
  string content(static_cast<std::size_t>(file.Size()), '?');
  EXPECT_EQ(file.Read(0, content.data(), content.size()), file.Size());
  return content;
}

void SetAttributes(const string& path, std::uint32_t attributes);
void SetAge(const string& path, unsigned seconds);             // since the file was changed last
void SetEnvironment(const string& name, const string& value);  // of this program, until its end

// Wine lets read-only files be replaced, and root also write to them.
bool IsWine();

// The command line of a program that writes the file "here" in the directory it works in, and ends.
string StandIn();

}  // namespace contract
