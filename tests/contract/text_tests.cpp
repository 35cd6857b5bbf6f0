#include <gtest/gtest.h>

#include <iterator>

#include "platform/text.h"

namespace {

using namespace platform;

TEST(Text, IsInCodePage1252WhoseEveryLetterHasItsUpperCase) {
  EXPECT_EQ("\0Configuração € 日Āş"_ansi, std::string("\0Configura\xE7\xE3o \x80 ?As", 19));
  const std::string lower = "\0abcdefghijklmnopqrstuvwxyzàáâãäåæçèéêëìíîïðñòóôõöøùúûüýþšœžÿ"_ansi;
  const std::string upper = "\0ABCDEFGHIJKLMNOPQRSTUVWXYZÀÁÂÃÄÅÆÇÈÉÊËÌÍÎÏÐÑÒÓÔÕÖØÙÚÛÜÝÞŠŒŽŸ"_ansi;
  EXPECT_EQ(CharUpperBuffA(lower), upper);
  const std::string unlike = lower + "ƒªµº"_ansi;  // the last four: upper case elsewhere, or none
  for (int code = 0; code < 256; ++code) {
    const std::string other(1, static_cast<char>(code));
    EXPECT_TRUE(unlike.find(other) != std::string::npos || CharUpperBuffA(other) == other) << code;
  }
}

TEST(Text, GoesToUtf8AndBackWhereTheCodePageHasIt) {
  std::string all;
  for (int code = 0; code < 256; ++code) all += static_cast<char>(code);
  EXPECT_EQ(FromUtf8Exactly(ToUtf8(all)), all);
  EXPECT_EQ(ToUtf8("Não €"_ansi), "Não €");
  for (const char* lacking : {"日", "Ā", "a\xFF", "\xC3"}) EXPECT_FALSE(FromUtf8Exactly(lacking)) << lacking;
}

TEST(Text, SortsAsAListDoes) {
  // Ascending: signs, digits, letters; accents count after all letters, as do hyphens and apostrophes.
  const std::string ascending[] = {"",        "!ola",     "_x",       "1",     "10",       "2",      "a",    "Ab",
                                   "áb"_ansi, "abc",      "billet",   "bills", "bill's",   "cannot", "cant", "can't",
                                   "cao",     "cão"_ansi, "caozinho", "con",   "coop",     "co-op",  "e",    "é"_ansi,
                                   "Jogo 1",  "jogo 10",  "Jogo 2",   "jogos", "Não"_ansi, "Nao s",  "zebra"};
  for (std::size_t i = 1; i < std::size(ascending); ++i) {
    EXPECT_LT(CompareStringA(ascending[i - 1], ascending[i]), 0) << ascending[i];
    EXPECT_GT(CompareStringA(ascending[i], ascending[i - 1]), 0) << ascending[i];
  }
  EXPECT_EQ(CompareStringA("SUPER ÁGUA"_ansi, "super água"_ansi), 0);
}

}  // namespace
