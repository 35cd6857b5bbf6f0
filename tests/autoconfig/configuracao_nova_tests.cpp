#include <gtest/gtest.h>

#include "autoconfig/configuracao_nova.h"
#include "platform/text.h"

namespace {

constexpr char Roms[] = "C:\\Meus Jogos\\Roms\\", Saves[] = "D:\\";
const std::string LinhaRoms = R"(ROMPath="C:\\Meus Jogos\\Roms")", LinhaSaves = R"(SRAMPath="D:\\")";

TEST(ConfiguracaoNova, IsToldByAKeyAtTheBeginningOfALine) {
  for (const char* nova : {"ROMPath=\"\"", "; a remark\r\nSRAMPath=\"C:\\\\S\"\r\n"})
    EXPECT_TRUE(FormaNova(nova)) << nova;
  for (const char* antiga : {"", "ROMPath = \"\"\r\nSRAMPath =", "; ROMPath=\"\"\r\n SRAMPath=\"\""}) {
    EXPECT_FALSE(FormaNova(antiga)) << antiga;
  }
}

TEST(ConfiguracaoNova, NamesTheTwoDirectoriesAndKeepsEveryOtherByte) {
  std::string bytes;  // all of them, on 150 lines
  for (int i = 0; i < 150 * 256; ++i) bytes += static_cast<char>(i);
  const std::string r = LinhaRoms, s = LinhaSaves, certo = "a=1\r\n" + r + "\r\n" + s + "\r\n";
  const std::tuple<const char*, std::string, std::string> casos[] = {
      // nothing afterwards: no change
      {"right already", certo, ""},
      {"right in other letters, and with a backslash more",
       "rompath=\"\"\nROMPath=\"c:\\\\MEUS jogos\\\\roms\\\\\"\n" + s, ""},
      {"empty values between other lines", "ROMPath=\"\"\r\nb=\"x\"\r\nSRAMPath=\"\"\r\n\r\nc=2",
       r + "\r\nb=\"x\"\r\n" + s + "\r\n\r\nc=2"},
      {"lone line feeds", "SRAMPath=\"E:\\\\S\"\nb=1\nROMPath=\"E:\\\\R\"", s + "\nb=1\n" + r},
      {"behind the quote", "ROMPath=\"X\" ; mine\r\nSRAMPath=\"Y\"\t\r\n", r + " ; mine\r\n" + s + "\t\r\n"},
      {"no quotes, one quote", "ROMPath=C:\\R x\r\nSRAMPath=\"C:\\S\r\nb=\"1\"\r\n",
       r + "\r\n" + s + "\r\nb=\"1\"\r\n"},
      {"a lone backslash hides no quote", "ROMPath=\"C:\\R\\\"\r\n" + s, r + "\r\n" + s},
      {"each line of the key", "ROMPath=\"1\"\r\n" + s + "\r\nROMPath=\"2\"\r\n", r + "\r\n" + s + "\r\n" + r + "\r\n"},
      {"a missing key is added", "x=1\r\nROMPath=\"\"", "x=1\r\n" + r + "\r\n" + s + "\r\n"},
      {"in the file's own line ends", "SRAMPath=\"\"\n", s + "\n" + r + "\n"},
      {"a value at the very end", s + "\r\nROMPath=", s + "\r\n" + r},
      {"any bytes", bytes + "\nSRAMPath=\"\"\n" + bytes + "\nROMPath=\"\xE7\"\r\n" + bytes,
       bytes + "\n" + s + "\n" + bytes + "\n" + r + "\r\n" + bytes},
  };
  for (const auto& [nome, antes, depois] : casos) {
    const auto novo = ComDiretorios(antes, Roms, Saves);
    EXPECT_EQ(novo.value_or(""), depois) << nome;
    EXPECT_EQ(ComDiretorios(novo.value_or(antes), Roms, Saves), std::nullopt) << nome << ", again";
  }
}

}  // namespace
