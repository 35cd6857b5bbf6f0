#include <gtest/gtest.h>

#include "platform/files.h"
#include "platform/profile.h"
#include "platform/text.h"
#include "tests/contract/machine.h"

namespace {

using platform::GetPrivateProfileStringA;

TEST(Profile, FindsValues) {
  const contract::FreshDirectory directory;
  const std::string file = directory / "language.ini";
  platform::File(file, platform::Access::ReplaceContent)
      .Write(0,
             "Jogar=outside\r\n"
             "[Other]\r\nJogar=other\r\n"
             "[TOLVARIS20]\r\n"
             "; Comentado=no\r\n"
             "Jogar=Play\r\nJogar=second\r\n"
             "\r\n"
             "  Blanks \t =  \t in and out  \r\n"
             "Salvar como...=Save as...\r\n"
             "Substituir ?=Replace ?\r\n"
             "Deletar o jogo '=Delete '\r\n"
             "' que está no Computador ?=' on the computer?\r\n"
             "Configuração=Configuração nova\r\n"
             "&Fechar=&Close\r\n"
             "Quoted=\" two words \"\r\n"
             "Single=' one '\r\n"
             "Doubly=\"'x'\"\r\n"
             "Unmatched=\"x'\r\n"
             "Half=\"x\r\n"
             "Only a mark=\"\r\n"
             "Bars=| x |\r\n"
             "Equals=a=b\r\n"
             "Mark=a;b\r\n"
             "Empty=\r\n"
             "Long=0123456789\r\n"
             "Last=no line end"_ansi);
  struct {
    std::string Key, Value;
  } const cases[] = {
      {"Jogar", "Play"},
      {"JOGAR", "Play"},
      {"Blanks", "in and out"},
      {"Salvar como...", "Save as..."},
      {"Substituir ?", "Replace ?"},
      {"Deletar o jogo '", "Delete '"},
      {"' que está no Computador ?"_ansi, "' on the computer?"},
      {"Configuração"_ansi, "Configuração nova"_ansi},
      {"Configuracao", "none"},
      {"&Fechar", "&Close"},
      {"Quoted", " two words "},
      {"Single", " one "},
      {"Doubly", "'x'"},
      {"Unmatched", "\"x'"},
      {"Half", "\"x"},
      {"Only a mark", "\""},
      {"Bars", "| x |"},
      {"Equals", "a=b"},
      {"Mark", "a;b"},
      {"Empty", ""},
      {"Comentado", "none"},
      {"Joga", "none"},
      {"Jogar ", "Play"},
      {" Jogar ", "Play"},
      {"Last", "no line end"},
  };
  for (const auto& each : cases) {
    EXPECT_EQ(GetPrivateProfileStringA("Tolvaris20", each.Key, "none", 255, file), each.Value) << each.Key;
  }
  for (const std::size_t room : {1u, 2u, 10u, 11u, 255u}) {
    EXPECT_EQ(GetPrivateProfileStringA("TOLVARIS20", "Long", "", room, file),
              std::string("0123456789").substr(0, room - 1));
  }
  EXPECT_EQ(GetPrivateProfileStringA("TOLVARIS2", "Jogar", "none", 255, file), "none");
  EXPECT_EQ(GetPrivateProfileStringA("TOLVARIS20", "Nada", "default", 5, file), "defa");
  EXPECT_EQ(GetPrivateProfileStringA("TOLVARIS20", "Jogar", "none", 255, directory / "other.ini"), "none");
  EXPECT_EQ(GetPrivateProfileStringA("TOLVARIS20", "Jogar", "none", 255, file + std::string("\0x", 2)), "none");
}

TEST(Profile, ReadsFilesOfAnyLineEnd) {
  const contract::FreshDirectory directory;
  for (const std::string end : {"\n", "\r\n"}) {
    const std::string file = directory / ("language" + std::to_string(end.size()) + ".ini");
    platform::File(file, platform::Access::ReplaceContent)
        .Write(0, "[ x ]" + end + "[TOLVARIS20]" + end + "a=1" + end + "b=2");
    EXPECT_EQ(GetPrivateProfileStringA("TOLVARIS20", "a", "none", 255, file), "1");
    EXPECT_EQ(GetPrivateProfileStringA("TOLVARIS20", "b", "none", 255, file), "2");
  }
}

}  // namespace
