#include <gtest/gtest.h>

#include <iterator>

#include "platform/text.h"

namespace {

using platform::CharUpperBuffA;
using platform::CompareStringA;

TEST(Text, LiteralsBecomeCodePage1252) {
  struct {
    std::string Text, Bytes;
  } const cases[] = {{"Não há"_ansi, "N\xE3o h\xE1"},
                     {"Configuração"_ansi, "Configura\xE7\xE3o"},
                     {"€ Š ž Ÿ"_ansi, "\x80 \x8A \x9E \x9F"},
                     {"日本 ok"_ansi, "?? ok"},
                     {"Ā"_ansi, "?"},  // no look-alike either
                     {""_ansi, ""},
                     {"a\0b"_ansi, std::string("a\0b", 3)}};
  for (const auto& each : cases) EXPECT_EQ(each.Text, each.Bytes);
}

TEST(Text, UpperCaseKnowsEveryLetterOfCodePage1252) {
  for (int code = 0; code < 256; ++code) {
    const auto byte = static_cast<unsigned char>(code);
    if (byte == 0x83 || byte == 0xAA || byte == 0xB5 || byte == 0xBA) continue;  // upper case elsewhere, or none
    unsigned char upper = byte;
    if ((byte >= 'a' && byte <= 'z') || (byte >= 0xE0 && byte != 0xF7 && byte != 0xFF)) {
      upper = static_cast<unsigned char>(byte - 0x20);
    } else if (byte == 0x9A || byte == 0x9C || byte == 0x9E) {  // s with caron, oe, z with caron
      upper = static_cast<unsigned char>(byte - 0x10);
    } else if (byte == 0xFF) {
      upper = 0x9F;
    }
    EXPECT_EQ(CharUpperBuffA({'x', static_cast<char>(byte)}), std::string({'X', static_cast<char>(upper)})) << code;
  }
  EXPECT_EQ(CharUpperBuffA(std::string("a\0b", 3)), std::string("A\0B", 3));
}

TEST(Text, SortsAsAListDoes) {
  // Ascending: signs, digits, letters; accents count after all letters, as do hyphens and apostrophes.
  const std::string ascending[] = {"",
                                   "!ola",
                                   "_x",
                                   "1",
                                   "10",
                                   "2",
                                   "a",
                                   "Ab",
                                   "\xE1"
                                   "b",
                                   "abc",
                                   "billet",
                                   "bills",
                                   "bill's",
                                   "cannot",
                                   "cant",
                                   "can't",
                                   "cao",
                                   "c\xE3o",
                                   "caozinho",
                                   "con",
                                   "coop",
                                   "co-op",
                                   "e",
                                   "\xE9",
                                   "Jogo 1",
                                   "jogo 10",
                                   "Jogo 2",
                                   "jogos",
                                   "N\xE3o",
                                   "Nao s",
                                   "zebra"};
  const auto count = std::ssize(ascending);
  for (std::ptrdiff_t left = 0; left < count; ++left) {
    for (std::ptrdiff_t right = 0; right < count; ++right) {
      const int sign = (left > right) - (left < right);
      const int result = CompareStringA(ascending[left], ascending[right]);
      EXPECT_EQ((result > 0) - (result < 0), sign) << ascending[left] << " / " << ascending[right];
    }
  }
  EXPECT_EQ(CompareStringA("SUPER \xC1GUA", "super \xE1gua"), 0);
  EXPECT_EQ(CompareStringA({}, {}), 0);
}

}  // namespace
