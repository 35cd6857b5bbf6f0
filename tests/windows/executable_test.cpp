// What the program is as a file, and what it leaves behind.
#include <windows.h>

// After it, as it needs its types.
#include <shellapi.h>

#include <algorithm>
#include <filesystem>
#include <iterator>

#include "tests/windows/installation.h"

namespace {

class Executable : public Installation {};

TEST_F(Executable, IsSmallAndHasNoConsole) {
  const std::string path = Home + "tolvaris.exe";
  EXPECT_LT(ContentOf(path).size(), 1'000'000u);
  // "PE", and above it the version of Windows that a program with windows is for; a console program has none.
  const DWORD_PTR type = SHGetFileInfoA(path.c_str(), 0, nullptr, 0, SHGFI_EXETYPE);
  EXPECT_EQ(LOWORD(type), 0x4550);
  EXPECT_NE(HIWORD(type), 0);
}

// A program for an older one is told other sizes of its frames than they have.
TEST_F(Executable, IsForWindows7AndAsksForTheCommonControls) {
  const std::string content = ContentOf(Home + "tolvaris.exe");
  const auto* const start = reinterpret_cast<const IMAGE_DOS_HEADER*>(content.data());
  const auto* const headers = reinterpret_cast<const IMAGE_NT_HEADERS64*>(content.data() + start->e_lfanew);
  EXPECT_EQ(headers->OptionalHeader.MajorSubsystemVersion, 6);
  EXPECT_EQ(headers->OptionalHeader.MinorSubsystemVersion, 1);
  EXPECT_NE(content.find("InitCommonControlsEx"), std::string::npos) << "else there are no tool tips to be made";
}

// Everything on the disk with its length and time of change, and everything in the user's registry.
std::set<std::string> Everything() {
  std::set<std::string> all = Registry("HKCU");
  const auto skip = std::filesystem::directory_options::skip_permission_denied;
  for (const auto& entry : std::filesystem::recursive_directory_iterator("C:\\", skip)) {
    std::error_code gone;
    const auto change = entry.last_write_time(gone).time_since_epoch().count();
    const std::string size = entry.is_regular_file() ? " " + std::to_string(entry.file_size(gone)) : "";
    all.insert(FromWide(entry.path()) + (size.empty() ? "" : size + " " + std::to_string(change)));
  }
  return all;
}

bool IsOwn(const std::string& entry) {
  return entry.starts_with(Home) || entry.starts_with("HKEY_CURRENT_USER\\Software\\Roms");
}

// Wine notes there, until it ends, which of the system's parameters somebody asked for.
bool IsOfWine(const std::string& entry) {
  return entry.starts_with("HKEY_CURRENT_USER\\Software\\Wine\\Temporary System Parameters");
}

TEST_F(Executable, WritesOnlyInItsDirectoryAndItsKey) {
  Set("LRom", "Zebra");
  const std::set<std::string> before = Everything();
  Start();
  window->Play.Click();
  ExpectPlayed("ZEBRA.SMC");
  window->CloseByUser();
  EXPECT_SOON(program->HasEnded());
  const std::set<std::string> after = Everything();
  std::vector<std::string> changed;
  std::set_symmetric_difference(before.begin(), before.end(), after.begin(), after.end(), std::back_inserter(changed));
  EXPECT_GT(std::erase_if(changed, IsOwn), 0u) << "what is written is seen at all";
  std::erase_if(changed, IsOfWine);
  EXPECT_EQ(changed, Texts{});
}

}  // namespace
