// The machine's code page is 1252 as a rule, its language Portuguese.
#include "platform/text.h"

#include <algorithm>
#include <cstdint>
#include <iterator>

#include "platform/letters.h"
#include "platform/simulated/machine.h"
#include "platform/simulated/text_order.h"

namespace platform {
namespace {

constexpr unsigned Western = 1252, Utf8 = 65001;  // else: 932

unsigned Page() { return simulated::TheMachine().CodePage; }

// What stands at 0x80 to 0x9F; everywhere else the page's numbers are those of Unicode.
constexpr std::uint16_t Upper32[32] = {0x20AC, 0x81,   0x201A, 0x0192, 0x201E, 0x2026, 0x2020, 0x2021,
                                       0x02C6, 0x2030, 0x0160, 0x2039, 0x0152, 0x8D,   0x017D, 0x8F,
                                       0x90,   0x2018, 0x2019, 0x201C, 0x201D, 0x2022, 0x2013, 0x2014,
                                       0x02DC, 0x2122, 0x0161, 0x203A, 0x0153, 0x9D,   0x017E, 0x0178};

char ToCodePage(char32_t character) {
  if (character < 0x80) return static_cast<char>(character);
  if (Page() != Western) return WithoutAccent(character);
  if (character >= 0xA0 && character <= 0xFF) return static_cast<char>(character);
  const auto* found = std::find(std::begin(Upper32), std::end(Upper32), character);
  return found == std::end(Upper32) ? WithoutAccent(character)
                                    : static_cast<char>(0x80 + (found - std::begin(Upper32)));
}

void AppendUtf8(std::string& utf8, std::uint32_t character) {
  if (character < 0x80) {
    utf8 += static_cast<char>(character);
    return;
  }
  if (character < 0x800) {
    utf8 += static_cast<char>(0xC0 | character >> 6);
  } else {
    utf8 += static_cast<char>(0xE0 | character >> 12);
    utf8 += static_cast<char>(0x80 | (character >> 6 & 0x3F));
  }
  utf8 += static_cast<char>(0x80 | (character & 0x3F));
}

// Length in bytes of the sequence that starts with this byte; 0: none does.
std::size_t SequenceLength(unsigned char first) {
  if (first < 0x80) return 1;
  if (first >= 0xC2 && first < 0xE0) return 2;
  if (first >= 0xE0 && first < 0xF0) return 3;
  return first >= 0xF0 && first < 0xF5 ? 4 : 0;
}

// Takes one character off the front; a byte that fits nowhere is one unknown character.
char32_t TakeCharacter(std::string_view& utf8) {
  constexpr char32_t unknown = 0xFFFD;
  const auto first = static_cast<unsigned char>(utf8.front());
  const std::size_t length = SequenceLength(first);
  utf8.remove_prefix(1);
  if (length == 0) return unknown;
  char32_t character = length == 1 ? first : first & (0x7Fu >> length);
  for (std::size_t i = 1; i < length; ++i) {
    if (utf8.empty() || (utf8.front() & 0xC0) != 0x80) return unknown;
    character = character << 6 | (static_cast<unsigned char>(utf8.front()) & 0x3Fu);
    utf8.remove_prefix(1);
  }
  return character;
}

// In code page 932.
bool IsFirstOfTwo(char byte) {
  const auto code = static_cast<unsigned char>(byte);
  return (code >= 0x81 && code <= 0x9F) || (code >= 0xE0 && code <= 0xFC);
}

char ToUpper(char character) {
  const auto code = static_cast<unsigned char>(character);
  if (code >= 0x80 && Page() != Western) return character;
  if ((code >= 'a' && code <= 'z') || (code >= 0xE0 && code <= 0xFE && code != 0xF7)) {
    return static_cast<char>(code - 0x20);
  }
  if (code == 0x9A || code == 0x9C || code == 0x9E) return static_cast<char>(code - 0x10);
  return code == 0xFF ? '\x9F' : character;
}

}  // namespace

std::string FromUtf8(std::string_view utf8) {
  if (Page() == Utf8) return std::string(utf8);
  std::string text;
  text.reserve(utf8.size());
  while (!utf8.empty()) text += ToCodePage(TakeCharacter(utf8));
  return text;
}

bool CharacterBeginsAt(std::string_view text, std::size_t position) {
  if (position >= text.size() || Page() == Western) return true;
  if (Page() == Utf8) return (static_cast<unsigned char>(text[position]) & 0xC0) != 0x80;
  bool begins = true;
  while (position-- > 0 && IsFirstOfTwo(text[position])) begins = !begins;
  return begins;
}

// Of code page 932 the machine knows only which bytes belong together.
std::string ToUtf8(std::string_view text) {
  if (Page() == Utf8) return std::string(text);
  std::string utf8;
  for (const char character : text) {
    const auto code = static_cast<unsigned char>(character);
    AppendUtf8(utf8, code >= 0x80 && code < 0xA0 ? Upper32[code - 0x80] : code);
  }
  return utf8;
}

std::string CharUpperBuffA(std::string text) {
  for (std::size_t i = 0; i < text.size(); ++i) {
    if (CharacterBeginsAt(text, i)) text[i] = ToUpper(text[i]);
  }
  return text;
}

int CompareStringA(std::string_view left, std::string_view right) {
  return simulated::SortKey(left).compare(simulated::SortKey(right));
}

}  // namespace platform

namespace platform::simulated {

void SetCodePage(unsigned page) { TheMachine().CodePage = page; }

}  // namespace platform::simulated
