// The keeper's tool on the machine in memory.
#pragma once

#include <algorithm>
#include <map>
#include <string>
#include <vector>

#include "catalog/cls_DAT.h"
#include "keeper/tvk.h"
#include "package/pacote.h"
#include "tests/contract/small_pictures.h"
#include "tests/fresh_machine.h"

using Files = std::map<std::string, std::string>;  // contents by full path

inline const std::string Picture = contract::SmallGif();
// Another installation than the person's own.
inline const std::string Target = "C:\\T\\", Catalogue = Target + "tolvaris.dat";

inline const std::string Rom = "123456789", RomChecksum = "-873187034";

struct Outcome {
  int Status;
  std::string Output, Errors;  // UTF-8; lines end with "\n"
  bool operator==(const Outcome&) const = default;
};

inline void PrintTo(const Outcome& told, std::ostream* out) {
  *out << "status " << told.Status << "\noutput:\n" << told.Output << "errors:\n" << told.Errors;
}

inline std::string TakeText(platform::Stream stream) {
  std::string text = TakeStream(stream);
  EXPECT_EQ(std::count(text.begin(), text.end(), '\n'), std::count(text.begin(), text.end(), '\r'));
  std::erase(text, '\r');
  return text;
}

// Runs tvk with these arguments, which are UTF-8.
inline Outcome RunTvk(const Texts& arguments) {
  SetArguments(arguments);
  const int status = Tvk();
  Catalogo().Fechar();
  return {status, TakeText(platform::Stream::Output), TakeText(platform::Stream::Error)};
}

inline std::string Package(const std::string& name, const std::string& dosName, const std::string& rom = Rom,
                           const std::string& picture = Picture, const std::string& checksum = RomChecksum) {
  return MontarPacote(name, dosName, checksum, std::ssize(picture), std::ssize(rom), picture, rom);
}

inline Files Standing() {
  Files files;
  for (const std::string& path : AllFiles()) files[path] = *Content(path);
  return files;
}

struct Keeper : FreshMachine {};
