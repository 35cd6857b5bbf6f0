#include <tuple>

#include "platform/profile.h"
#include "platform/text.h"
#include "tests/contract/machine.h"

namespace {

using namespace contract;

class Profile : public Machine {};

TEST_F(Profile, FindsValuesInFilesOfAnyLineEnd) {
  const std::tuple<string, string, string> cases[] = {
      {"Jogar=outside", " Jogar ", "Play"},
      {"[ Other ]", "Jogar ", "Play"},
      {"Jogar=other", "JOGAR", "Play"},
      {"[TOLVARIS20]", "Nada", "none"},
      {"Jogar=Play", "Jogar", "Play"},
      {"Jogar=second", "Joga", "none"},
      {"", "", "none"},
      {"  Blanks \t =  \t in and out  ", "Blanks", "in and out"},
      {"' que está no Computador ?=' there?"_ansi, "' que está no Computador ?"_ansi, "' there?"},
      {"Quoted=\" two words \"", "Quoted", " two words "},
      {"Single=' one '", "Single", " one "},
      {"Equals=a=b;c", "Equals", "a=b;c"},
      {"Empty=", "Empty", ""},
      {"Long=0123456789", "Configuracao", "none"},
      {"Last=no line end", "Last", "no line end"},
  };
  for (const string end : {"\r\n", "\n"}) {
    string file = here_ + std::to_string(end.size()) + ".ini", content;
    for (const auto& each : cases) content += (content.empty() ? "" : end) + std::get<0>(each);
    Put(file, content);
    for (const auto& [line, key, value] : cases) {
      EXPECT_EQ(GetPrivateProfileStringA("Tolvaris20", key, "none", 255, file), value) << key;
    }
    for (const std::size_t room : {1u, 10u, 11u}) {
      EXPECT_EQ(GetPrivateProfileStringA("TOLVARIS20", "Long", "", room, file), string("0123456789", room - 1));
    }
    EXPECT_EQ(GetPrivateProfileStringA("TOLVARIS2", "Jogar", "none", 255, file), "none");
    EXPECT_EQ(GetPrivateProfileStringA("TOLVARIS20", "Jogar", "none", 255, here_ + "other.ini"), "none");
  }
}

}  // namespace
