// What the tests of a repository's files share.
#pragma once

#include <gtest/gtest.h>

#include <string>

#include "platform/simulated/simulated.h"
#include "repository/estrofes.h"

using namespace std::string_literals;

inline const std::string Hash = "0123456789abcdef0123456789abcdef0123456789abcdef0123456789abcdef";

// "kind line key"; empty when nothing is refused.
inline std::string InWords(const Recusa& why) {
  constexpr const char* words[] = {"",           "too large",   "newer version",  "no text",     "long line",
                                   "wrong line", "empty line",  "too many lines", "line behind", "key twice",
                                   "no key",     "wrong value", "not in order",   "same name",   "wrong signature"};
  if (why.Qual == Recusa::Tipo::Nenhuma) return "";
  std::string text = words[static_cast<int>(why.Qual)];
  if (why.Linha != 0) text += " " + std::to_string(why.Linha);
  return why.Chave.empty() ? text : text + " " + why.Chave;
}

// The text with one piece replaced, which it has to have.
inline std::string With(std::string text, const std::string& piece, const std::string& instead) {
  const std::size_t place = text.find(piece);
  EXPECT_NE(place, std::string::npos) << piece;
  return place == std::string::npos ? text : text.replace(place, piece.size(), instead);
}
