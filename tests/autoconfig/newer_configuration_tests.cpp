#include <gtest/gtest.h>

#include "autoconfig/forma_nova.h"
#include "platform/text.h"

namespace {

constexpr char Roms[] = "C:\\Meus Jogos\\Roms\\", Saves[] = "D:\\";
const std::string RomsLine = R"(ROMPath="C:\\Meus Jogos\\Roms")", SavesLine = R"(SRAMPath="D:\\")";

TEST(NewerConfiguration, IsToldByAKeyAtTheBeginningOfALine) {
  for (const char* newer : {"ROMPath=\"\"", "; a remark\r\nSRAMPath=\"C:\\\\S\"\r\n"})
    EXPECT_TRUE(FormaNova(newer)) << newer;
  for (const char* older : {"", "ROMPath = \"\"\r\nSRAMPath =", "; ROMPath=\"\"\r\n SRAMPath=\"\""}) {
    EXPECT_FALSE(FormaNova(older)) << older;
  }
}

TEST(NewerConfiguration, NamesTheTwoDirectoriesAndKeepsEveryOtherByte) {
  std::string bytes;  // all of them, on 150 lines
  for (int i = 0; i < 150 * 256; ++i) bytes += static_cast<char>(i);
  const std::string r = RomsLine, s = SavesLine, right = "a=1\r\n" + r + "\r\n" + s + "\r\n";
  const std::tuple<const char*, std::string, std::string> cases[] = {
      // nothing afterwards: no change
      {"right already", right, ""},
      {"right in other letters, and with a backslash more",
       "rompath=\"\"\nROMPath=\"c:\\\\MEUS jogos\\\\roms\\\\\"\n" + s, ""},
      {"empty values between other lines", "ROMPath=\"\"\r\nb=\"x\"\r\nSRAMPath=\"\"\r\n\r\nc=2",
       r + "\r\nb=\"x\"\r\n" + s + "\r\n\r\nc=2"},
      {"lone line feeds", "SRAMPath=\"E:\\\\S\"\nb=1\nROMPath=\"E:\\\\R\"", s + "\nb=1\n" + r},
      {"behind the quote", "ROMPath=\"X\" ; mine\r\nSRAMPath=\"Y\"\t\r\n", r + " ; mine\r\n" + s + "\t\r\n"},
      {"no quotes, one quote", "ROMPath=C:\\R x\r\nSRAMPath=\"C:\\S\r\nb=\"1\"\r\n",
       r + "\r\n" + s + "\r\nb=\"1\"\r\n"},
      {"a lone backslash hides no quote", "ROMPath=\"C:\\R\\\" ; mine\r\n" + s, r + " ; mine\r\n" + s},
      {"each line of the key", "ROMPath=\"1\"\r\n" + s + "\r\nROMPath=\"2\"\r\n", r + "\r\n" + s + "\r\n" + r + "\r\n"},
      {"a missing key is added", "x=1\r\nROMPath=\"\"", "x=1\r\n" + r + "\r\n" + s + "\r\n"},
      {"in the file's own line ends", "SRAMPath=\"\"\n", s + "\n" + r + "\n"},
      {"a value at the very end", s + "\r\nROMPath=", s + "\r\n" + r},
      {"any bytes", bytes + "\nSRAMPath=\"\"\n" + bytes + "\nROMPath=\"\xE7\"\r\n" + bytes,
       bytes + "\n" + s + "\n" + bytes + "\n" + r + "\r\n" + bytes},
  };
  for (const auto& [name, before, after] : cases) {
    const auto changed = ComDiretorios(before, Roms, Saves);
    EXPECT_EQ(changed.value_or(""), after) << name;
    EXPECT_EQ(ComDiretorios(changed.value_or(before), Roms, Saves), std::nullopt) << name << ", again";
  }
}

}  // namespace
