// What the program is as a file, and what it leaves behind.
#include <algorithm>
#include <fstream>
#include <iterator>
#include <set>

#include "tests/windows/installation.h"
#include "tests/windows/main_window.h"

namespace {

// The program's file, read at the offsets of its headers.
class Image {
 public:
  explicit Image(const std::string& path) {
    std::ifstream file(path, std::ios::binary);
    bytes_.assign(std::istreambuf_iterator<char>(file), {});
  }

  size_t Size() const { return bytes_.size(); }

  const IMAGE_NT_HEADERS64& Headers() const {
    return At<IMAGE_NT_HEADERS64>(static_cast<DWORD>(At<IMAGE_DOS_HEADER>(0).e_lfanew));
  }

  // In lower case.
  std::set<std::string> ImportedLibraries() const {
    std::set<std::string> names;
    DWORD at = FileOffset(Headers().OptionalHeader.DataDirectory[IMAGE_DIRECTORY_ENTRY_IMPORT].VirtualAddress);
    for (; At<IMAGE_IMPORT_DESCRIPTOR>(at).Name != 0; at += sizeof(IMAGE_IMPORT_DESCRIPTOR)) {
      std::string name = &At<char>(FileOffset(At<IMAGE_IMPORT_DESCRIPTOR>(at).Name));
      std::transform(name.begin(), name.end(), name.begin(), [](char c) { return static_cast<char>(tolower(c)); });
      names.insert(name);
    }
    return names;
  }

 private:
  template <typename Part>
  const Part& At(DWORD offset) const {
    return reinterpret_cast<const Part&>(bytes_.at(offset));
  }

  DWORD FileOffset(DWORD address) const {
    const IMAGE_SECTION_HEADER* section = IMAGE_FIRST_SECTION(&Headers());
    while (address - section->VirtualAddress >= section->Misc.VirtualSize) ++section;
    return address - section->VirtualAddress + section->PointerToRawData;
  }

  std::string bytes_;
};

TEST(Executable, IsSmallHasNoConsoleAndNeedsNothingButWindows) {
  const Image image(Installation().CommandLine());
  EXPECT_LT(image.Size(), 1'000'000u);
  EXPECT_EQ(image.Headers().OptionalHeader.Subsystem, IMAGE_SUBSYSTEM_WINDOWS_GUI);
  const std::set<std::string> windows = {"advapi32.dll", "comctl32.dll",     "comdlg32.dll", "gdi32.dll",
                                         "gdiplus.dll",  "kernel32.dll",     "msvcrt.dll",   "ole32.dll",
                                         "oleaut32.dll", "shell32.dll",      "shlwapi.dll",  "user32.dll",
                                         "uxtheme.dll",  "windowscodecs.dll"};
  const std::set<std::string> imported = image.ImportedLibraries();
  EXPECT_TRUE(imported.contains("user32.dll"));
  for (const std::string& library : imported) EXPECT_TRUE(windows.contains(library)) << library;
}

// Everything on the disk with its length and time of change, and everything in the user's registry.
using Footprint = std::set<std::string>;

void AddFiles(const std::string& directory, Footprint& all) {
  WIN32_FIND_DATAA found{};
  const HANDLE search = FindFirstFileA((directory + "*").c_str(), &found);
  if (search == INVALID_HANDLE_VALUE) return;
  do {
    const std::string name = found.cFileName;
    const std::string path = directory + name;
    if (name == "." || name == "..") continue;
    if ((found.dwFileAttributes & FILE_ATTRIBUTE_DIRECTORY) != 0) {
      all.insert(path);
      if ((found.dwFileAttributes & FILE_ATTRIBUTE_REPARSE_POINT) == 0) AddFiles(path + "\\", all);
    } else {
      all.insert(path + " " + std::to_string(found.nFileSizeLow) + " " +
                 std::to_string(found.ftLastWriteTime.dwHighDateTime) + " " +
                 std::to_string(found.ftLastWriteTime.dwLowDateTime));
    }
  } while (FindNextFileA(search, &found));
  FindClose(search);
}

void AddKey(HKEY parent, const std::string& name, const std::string& path, Footprint& all) {
  HKEY key = nullptr;
  if (RegOpenKeyExA(parent, name.c_str(), 0, KEY_READ, &key) != ERROR_SUCCESS) return;
  all.insert(path);
  std::vector<char> text(16384);
  std::string data(1 << 20, '\0');
  for (DWORD i = 0;; ++i) {
    DWORD length = static_cast<DWORD>(text.size());
    DWORD size = static_cast<DWORD>(data.size());
    if (RegEnumValueA(key, i, text.data(), &length, nullptr, nullptr, reinterpret_cast<BYTE*>(data.data()), &size) !=
        ERROR_SUCCESS) {
      break;
    }
    all.insert(path + " " + text.data() + "=" + data.substr(0, size));
  }
  for (DWORD i = 0;; ++i) {
    DWORD length = static_cast<DWORD>(text.size());
    if (RegEnumKeyExA(key, i, text.data(), &length, nullptr, nullptr, nullptr, nullptr) != ERROR_SUCCESS) break;
    AddKey(key, text.data(), path + "\\" + text.data(), all);
  }
  RegCloseKey(key);
}

Footprint Everything() {
  Footprint all;
  AddFiles("C:\\", all);
  AddKey(HKEY_CURRENT_USER, "", "HKCU", all);
  return all;
}

bool IsOwn(const std::string& entry) {
  return entry.starts_with("C:\\Ensaio") || entry.starts_with("HKCU\\Software\\Roms");
}

TEST(Executable, WritesOnlyInItsDirectoryAndItsKey) {
  const Installation installation;
  installation.Configure();
  installation.PutGames();
  installation.Set("LRom", "Zebra");
  const auto playAndClose = [&] {
    const driver::Program program(installation.CommandLine());
    const MainWindow window(program);
    window.Play.Click();
    EXPECT_FALSE(NextCall(installation.Emulator).CommandLine.empty());
    window.Window.CloseByUser();
    EXPECT_SOON(program.HasEnded());
  };
  const Footprint before = Everything();
  playAndClose();
  const Footprint after = Everything();
  std::vector<std::string> changed;
  std::set_symmetric_difference(before.begin(), before.end(), after.begin(), after.end(), std::back_inserter(changed));
  EXPECT_TRUE(std::any_of(changed.begin(), changed.end(), IsOwn)) << "what is written is seen at all";
  std::erase_if(changed, IsOwn);
  EXPECT_EQ(changed, std::vector<std::string>{});
}

}  // namespace
