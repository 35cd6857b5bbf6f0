#include "autoconfig/configuracao_nova.h"

#include <gtest/gtest.h>

#include <random>

#include "platform/text.h"

namespace {

constexpr char Roms[] = "C:\\Meus Jogos\\Roms\\", Saves[] = "D:\\";
const std::string LinhaRoms = R"(ROMPath="C:\\Meus Jogos\\Roms")", LinhaSaves = R"(SRAMPath="D:\\")";

TEST(ConfiguracaoNova, IsToldByAKeyAtTheBeginningOfALine) {
  struct {
    const char* Texto;
    bool Nova;
  } const casos[] = {
      {"", false},
      {"ROMPath=\"\"", true},
      {"; a remark\r\nSRAMPath=\"C:\\\\S\"\r\n", true},
      {"a=1\nROMPath=", true},
      {"SaveDirectory = C:\\S\r\nGameDirectory = C:\\R\r\n", false},
      {"ROMPath = \"\"\r\nSRAMPath =\"\"", false},
      {"; ROMPath=\"\"\r\nMyROMPath=\"\"\r\n SRAMPath=\"\"", false},
  };
  for (const auto& caso : casos) EXPECT_EQ(FormaNova(caso.Texto), caso.Nova) << caso.Texto;
}

TEST(ConfiguracaoNova, NamesTheTwoDirectoriesAndKeepsEveryOtherByte) {
  const std::string certo = "a=1\r\n" + LinhaRoms + "\r\n" + LinhaSaves + "\r\n";
  struct {
    const char* Nome;
    std::string Antes, Depois;  // an empty Depois: no change
  } const casos[] = {
      {"right already", certo, ""},
      {"right in other letters, and with a backslash more",
       "rompath=\"\"\nROMPath=\"c:\\\\MEUS jogos\\\\roms\\\\\"\n" + LinhaSaves, ""},
      {"empty values between other lines", "ROMPath=\"\"\r\nb=\"x\"\r\nSRAMPath=\"\"\r\n\r\nc=2",
       LinhaRoms + "\r\nb=\"x\"\r\n" + LinhaSaves + "\r\n\r\nc=2"},
      {"lone line feeds, and no line end at the end", "SRAMPath=\"E:\\\\S\"\nb=1\nROMPath=\"E:\\\\R\"",
       LinhaSaves + "\nb=1\n" + LinhaRoms},
      {"what follows the closing quote stays", "ROMPath=\"X\" ; mine\r\nSRAMPath=\"Y\"\t\r\n",
       LinhaRoms + " ; mine\r\n" + LinhaSaves + "\t\r\n"},
      {"without quotes, or with the first one only", "ROMPath=C:\\R x\r\nSRAMPath=\"C:\\S\r\nb=\"1\"\r\n",
       LinhaRoms + "\r\n" + LinhaSaves + "\r\nb=\"1\"\r\n"},
      {"a backslash that is not doubled does not hide the quote", "ROMPath=\"C:\\R\\\"\r\n" + LinhaSaves,
       LinhaRoms + "\r\n" + LinhaSaves},
      {"each line of the key", "ROMPath=\"1\"\r\n" + LinhaSaves + "\r\nROMPath=\"2\"\r\n",
       LinhaRoms + "\r\n" + LinhaSaves + "\r\n" + LinhaRoms + "\r\n"},
      {"a missing key is added", "x=1\r\nROMPath=\"\"", "x=1\r\n" + LinhaRoms + "\r\n" + LinhaSaves + "\r\n"},
      {"in the file's own line ends", "SRAMPath=\"\"\n", LinhaSaves + "\n" + LinhaRoms + "\n"},
      {"a value at the very end", LinhaSaves + "\r\nROMPath=", LinhaSaves + "\r\n" + LinhaRoms},
  };
  for (const auto& caso : casos) {
    const auto depois = ComDiretorios(caso.Antes, Roms, Saves);
    EXPECT_EQ(depois.value_or(""), caso.Depois) << caso.Nome;
    EXPECT_EQ(ComDiretorios(depois.value_or(caso.Antes), Roms, Saves), std::nullopt) << caso.Nome << ", again";
  }
}

// Any bytes around the two lines, zeros and lone carriage returns included.
TEST(ConfiguracaoNova, TouchesNothingOfALongFile) {
  std::mt19937 acaso(11);
  std::string partes[3];
  for (std::string& parte : partes) {
    for (int i = 0; i < 5000; ++i) parte += static_cast<char>(acaso() % 256);
    parte += '\n';
  }
  const auto depois = ComDiretorios(
      partes[0] + "SRAMPath=\"\"\n" + partes[1] + "ROMPath=\"C:\\\\\xE7\xE3\"\r\n" + partes[2], Roms, Saves);
  EXPECT_EQ(depois, partes[0] + LinhaSaves + "\n" + partes[1] + LinhaRoms + "\r\n" + partes[2]);
}

}  // namespace
