// Texts without the blanks around them.
#pragma once

#include <algorithm>
#include <string_view>

// The part of the text between the first and the last character that is none of `Brancos`; empty when all are.
inline std::string_view SemBrancos(std::string_view Texto, std::string_view Brancos) {
  Texto.remove_prefix(std::min(Texto.find_first_not_of(Brancos), Texto.size()));
  return Texto.substr(0, Texto.find_last_not_of(Brancos) + 1);
}
