#include "tests/windows/files.h"

#include <array>
#include <filesystem>
#include <fstream>
#include <iterator>

#include "tests/windows/driver/program.h"
#include "tests/windows/driver/waiting.h"
#include "tests/windows/driver/window.h"

namespace {

std::filesystem::path Path(const std::string& path) {
  std::wstring wide;
  for (const char letter : path) wide += static_cast<unsigned char>(letter);
  return wide;
}

}  // namespace

std::string ContentOf(const std::string& path) {
  std::ifstream file(path, std::ios::binary);
  return {std::istreambuf_iterator<char>(file), {}};
}

void PutFile(const std::string& path, const std::string& content) {
  std::filesystem::create_directories(Path(path).parent_path());
  EXPECT_TRUE((std::ofstream(path, std::ios::binary) << content).flush()) << "cannot write " << path;
}

Files FilesIn(const std::string& directory) {
  Files files;
  std::error_code missing;
  for (const auto& entry : std::filesystem::recursive_directory_iterator(Path(directory), missing)) {
    const std::string path = FromWide(entry.path());
    if (entry.is_regular_file()) files[path.substr(directory.size())] = ContentOf(path);
    if (entry.is_directory() && is_empty(entry)) files[path.substr(directory.size()) + "\\"] = "";
  }
  return files;
}

void ExpectFiles(const Files& expected, const Files& found) {
  for (const auto& [name, content] : found) EXPECT_TRUE(expected.contains(name)) << name << " should not be there";
  for (const auto& [name, content] : expected) {
    if (!found.contains(name)) {
      ADD_FAILURE() << name << " is missing";
    } else {
      EXPECT_TRUE(found.at(name) == content) << name << " has other bytes";
    }
  }
}

std::string ShortPath(const std::string& path) {
  std::array<char, MAX_PATH> shortPath{};
  GetShortPathNameA(path.c_str(), shortPath.data(), MAX_PATH);
  return shortPath.data();
}

void PrintTo(const Call& call, std::ostream* out) { *out << call.CommandLine << " in " << call.Directory; }

Call NextCall(const std::string& program) {
  const std::string record = program + ".call";
  Call call;
  // The file can be there for a moment before it can be opened: who renamed it still holds it.
  const auto read = [&] {
    std::ifstream file(record, std::ios::binary);
    return std::getline(file, call.CommandLine) && std::getline(file, call.Directory);
  };
  EXPECT_SOON(read()) << " of " << program;
  EXPECT_SOON(DeleteFileA(record.c_str()));
  return call;
}

std::string Bytes(unsigned kind, size_t size) {
  std::string bytes;
  for (unsigned i = 0; i < size; ++i) bytes += static_cast<char>(i * (2 * kind + 1) + i / 256);
  return bytes;
}

std::string Gif(COLORREF colour) {
  const std::string size("\1\0\1\0", 4);
  const std::string bytes = {static_cast<char>(GetRValue(colour)), static_cast<char>(GetGValue(colour)),
                             static_cast<char>(GetBValue(colour))};
  return "GIF89a" + size + std::string("\x80\0\0", 3) + bytes + std::string(3, '\0') + "," + std::string(4, '\0') +
         size + std::string("\0\2\2\x44\1\0;", 7);
}

std::string PackageFormat(const std::string& directory, const std::string& arguments) {
  // A program of the machine that Wine runs on. Its output takes its name when it is complete.
  const Program python(
      "/bin/sh -c \"python3 '" PACKAGE_FORMAT_PY "' " + arguments + " >output- 2>&1; mv output- output\"", directory);
  EXPECT_SOON(std::filesystem::exists(Path(directory + "output"))) << arguments;
  const std::string output = ContentOf(directory + "output");
  std::filesystem::remove(Path(directory + "output"));
  return output;
}

std::string Package(const std::string& name, const std::string& dosName, const std::string& checksum,
                    const std::string& picture, const std::string& rom) {
  return "TOLVARIS\r\nNOME=" + name + "\r\nNOMEDOS=" + dosName + "\r\nCRC=" + checksum +
         "\r\niIMG=1\r\ntIMG=" + std::to_string(picture.size()) + "\r\niROM=" + std::to_string(picture.size() + 1) +
         "\r\ntROM=" + std::to_string(rom.size()) + "\r\n|IMGROMDAT|" + picture + rom;
}
