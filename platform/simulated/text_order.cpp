#include "platform/simulated/text_order.h"

#include <algorithm>
#include <array>
#include <cstddef>
#include <cstdint>

#include "platform/text.h"

namespace platform::simulated {
namespace {

constexpr unsigned char NoAccent = 2, NoStyle = 2, RaisedStyle = 6;

// The characters that differ by more than accent and case, in their order (code page 1252 written in UTF-8).
constexpr std::string_view Alphabet =
    " \u00A0\t\n\v\f\r!\"#$%&()*,./:;?@[\\]^_`{|}~¡¦¨¯´¸¿˜‘’‚“”„‹›¢£¤¥€+<=>±«»×÷§©¬®°µ¶·…†‡•‰\u00810¼½¾123456789"
    "ABCDEFGHIJKLMNOPQRST™UVWXYZ";

// These hardly count: they only decide between texts that are equal without them. In their order.
constexpr std::string_view Light =
    "\x01\x02\x03\x04\x05\x06\x07\x08\x0E\x0F\x10\x11\x12\x13\x14\x15\x16\x17\x18\x19\x1A\x1B\x1C\x1D\x1E\x1F\x7F'-–—";

// A letter with an accent stands right after the letter without one; the weights order the accents.
struct Accent {
  unsigned char Weight;
  std::string_view Letters, Bases;
};
constexpr Accent Accents[] = {
    {0x02, "ˆ¹²³", "^123"},   {0x03, "ªº", "AO"},         {0x0E, "ÁÉÍÓÚÝ", "AEIOUY"}, {0x0F, "ÀÈÌÒÙ", "AEIOU"},
    {0x12, "ÂÊÎÔÛ", "AEIOU"}, {0x13, "ÄËÏÖÜŸ", "AEIOUY"}, {0x14, "ŠŽ", "SZ"},         {0x19, "ÃÑÕ", "ANO"},
    {0x1A, "Å", "A"},         {0x1C, "Ç", "C"},           {0x21, "Ø", "O"},           {0x43, "ƒ", "F"},
    {0x68, "Ð", "D"},
};
constexpr std::string_view Raised = "ª²³¹º";

// Characters that the code page leaves empty are told apart as if by accents.
struct Empty {
  unsigned char Character, Weight;
};
constexpr Empty EmptyPlaces[] = {{0x81, 0x1E}, {0x8D, 0x2A}, {0x8F, 0x2C}, {0x90, 0x2D}, {0x9D, 0x3A}};

// Letters that sort as two.
struct Pair {
  std::string_view Letter, Bases;
};
constexpr Pair Pairs[] = {{"Æ", "AE"}, {"Œ", "OE"}, {"Þ", "TH"}, {"ß", "SS"}};

struct Weights {
  unsigned char First = 0, Second = 0;  // of the alphabet; 0: none
  unsigned char Accent = NoAccent, Style = NoStyle;
  unsigned char Light = 0;
};
using Table = std::array<Weights, 256>;

std::size_t Code(char character) { return static_cast<unsigned char>(character); }

Weights& Of(Table& table, std::string_view letter) { return table[Code(FromUtf8(letter)[0])]; }

void AddAlphabet(Table& table) {
  unsigned char rank = 3;
  for (const char character : FromUtf8(Alphabet)) table[Code(character)].First = rank++;
  unsigned char light = 1;
  for (const char character : FromUtf8(Light)) table[Code(character)].Light = light++;
}

void AddVariants(Table& table) {
  for (const Accent& accent : Accents) {
    const std::string letters = FromUtf8(accent.Letters);
    for (std::size_t i = 0; i < letters.size(); ++i) {
      table[Code(letters[i])].First = table[Code(accent.Bases[i])].First;
      table[Code(letters[i])].Accent = accent.Weight;
    }
  }
  for (const Empty& empty : EmptyPlaces) {
    table[empty.Character].First = table[0x81].First;
    table[empty.Character].Accent = empty.Weight;
  }
  for (const char character : FromUtf8(Raised)) table[Code(character)].Style = RaisedStyle;
}

void AddPairs(Table& table) {
  for (const Pair& pair : Pairs) {
    Of(table, pair.Letter).First = table[Code(pair.Bases[0])].First;
    Of(table, pair.Letter).Second = table[Code(pair.Bases[1])].First;
  }
}

Table MakeTable() {
  Table table;
  AddAlphabet(table);
  AddVariants(table);
  AddPairs(table);
  for (int code = 0; code < 256; ++code) {  // small letters weigh what capitals do
    const char upper = CharUpperBuffA(std::string(1, static_cast<char>(code)))[0];
    table[static_cast<std::size_t>(code)] = table[Code(upper)];
  }
  return table;
}

void Trim(std::string& weights, unsigned char common) {
  weights.erase(weights.find_last_not_of(static_cast<char>(common)) + 1);
}

}  // namespace

std::string SortKey(std::string_view text) {
  static const Table table = MakeTable();
  std::string key, accents, styles, light;
  for (std::string* each : {&key, &accents, &styles}) each->reserve(text.size() + 3);
  for (const char character : text) {
    const Weights& weights = table[Code(character)];
    if (weights.Light != 0) {  // the later its place in the text, the sooner it sorts
      const auto place = static_cast<std::uint16_t>(0xFFFF - std::min<std::size_t>(key.size(), 0xFFFF));
      light += {static_cast<char>(place >> 8), static_cast<char>(place & 0xFF), static_cast<char>(weights.Light)};
    }
    for (const unsigned char rank : {weights.First, weights.Second}) {
      if (rank == 0) continue;
      key += static_cast<char>(rank);
      accents += static_cast<char>(weights.Accent);
      styles += static_cast<char>(weights.Style);
    }
  }
  Trim(accents, NoAccent);
  Trim(styles, NoStyle);
  return key.append(1, '\x01').append(accents).append(1, '\x01').append(styles).append(1, '\x01').append(light);
}

}  // namespace platform::simulated
