// The names that a game may have where it is given on.
#include <gtest/gtest.h>

#include "package/nomes.h"

namespace {

// What is wrong with a name, in a word and with the character.
std::string Fault(const FaltaNoNome& fault) {
  constexpr const char* words[] = {"", "empty", "long", "character ", "end", "device"};
  return words[static_cast<int>(fault.Qual)] + fault.Caractere;
}

TEST(Names, OfGamesAreWhatEveryDiskAndTheCatalogueCanHold) {
  const std::pair<std::string, const char*> cases[] = {
      {"Ação Máxima 2 - Edição “Ouro” (€)", ""},
      {std::string(100, 'x'), ""},
      {"Concerto", ""},
      {"", "empty"},
      {std::string(101, 'x'), "long"},
      {"a|b", "character |"},
      {"a=b", "character ="},
      {"a\\b", "character \\"},
      {"a/b", "character /"},
      {"c:d", "character :"},
      {"que?", "character ?"},
      {"a\"b", "character \""},
      {"a\tb", "character U+0009"},
      {"a\x7F", "character U+007F"},
      {"a\xC2\x81"
       "b",
       "character U+0081"},
      {"a\xC2\xAD"
       "b",
       "character U+00AD"},
      {"日本", "character 日"},
      {"a\xE2\x80\xAE"
       "b",
       "character \xE2\x80\xAE"},  // turns the direction of writing
      {"\xF0\x9F\x98\x80", "character \xF0\x9F\x98\x80"},
      {" a", "end"},
      {"a.", "end"},
      {"a\xC2\xA0", "end"},
      {"con", "device"},
      {"COM¹.x", "device"},
  };
  for (const auto& [name, fault] : cases) EXPECT_EQ(Fault(ConferirNome(name)), fault) << name;
}

TEST(Names, OfDosAreShortAndPlain) {
  const std::pair<const char*, const char*> cases[] = {
      {"A", ""},
      {"ABCD-_09", ""},
      {"", "empty"},
      {"ABCDEFGHI", "long"},
      {"a", "character a"},
      {"A.B", "character ."},
      {"SUPER~1", "character ~"},
      {"Ç", "character Ç"},
      {"AUX", "device"},
      {"LPT1", "device"},
  };
  for (const auto& [name, fault] : cases) EXPECT_EQ(Fault(ConferirNomeDOS(name)), fault) << name;
}

}  // namespace
