#include "platform/simulated/short_names.h"

#include <cstdint>
#include <cstdio>
#include <string_view>

#include "platform/text.h"

namespace platform::simulated {
namespace {

constexpr std::string_view NotInShortNames = " +,;=[].?";

bool IsPlain(char character) {
  return static_cast<unsigned char>(character) < 0x80 && NotInShortNames.find(character) == std::string_view::npos;
}

// In upper case, without blanks, dots and accented letters; other characters that a short name lacks become "_".
std::string Simplify(std::string_view part) {
  std::string simple;
  for (const char character : CharUpperBuffA(std::string(part))) {
    if (IsPlain(character)) {
      simple += character;
    } else if (character != ' ' && character != '.' && static_cast<unsigned char>(character) < 0x80) {
      simple += '_';
    }
  }
  return simple;
}

std::string Hash(const std::string& name) {
  std::uint16_t sum = 0;
  for (const char character : name) sum = static_cast<std::uint16_t>(sum * 37 + static_cast<unsigned char>(character));
  char text[8];
  std::snprintf(text, sizeof text, "%04X", sum);
  return text;
}

bool AllPlain(std::string_view part) {
  for (const char character : part) {
    if (!IsPlain(character)) return false;
  }
  return true;
}

}  // namespace

bool IsShortName(const std::string& name) {
  const std::size_t dot = name.find('.');
  const std::string_view base = std::string_view(name).substr(0, dot);
  if (base.empty() || base.size() > 8 || !AllPlain(base)) return false;
  if (dot == std::string::npos) return true;
  const std::string_view extension = std::string_view(name).substr(dot + 1);
  return !extension.empty() && extension.size() <= 3 && AllPlain(extension);
}

std::string MakeShortName(const std::string& name, const std::function<bool(const std::string&)>& taken) {
  const std::size_t dot = name.find_last_of('.');
  const bool extended = dot != std::string::npos && dot > 0;
  std::string base = Simplify(extended ? std::string_view(name).substr(0, dot) : name);
  std::string extension = extended ? Simplify(std::string_view(name).substr(dot + 1)).substr(0, 3) : "";
  if (!extension.empty()) extension.insert(0, 1, '.');
  if (base.size() < 3) base += Hash(name);
  for (int number = 1;; ++number) {
    // From the fifth file of the same beginning on, the name's hash takes the place of most of it.
    if (number == 5) base = base.substr(0, 2) + Hash(name);
    const std::string tail = "~" + std::to_string(number > 4 ? number - 4 : number);
    std::string candidate = base.substr(0, 8 - tail.size() < 6 ? 8 - tail.size() : 6);
    candidate.append(tail).append(extension);
    if (!taken(candidate)) return candidate;
  }
}

}  // namespace platform::simulated
