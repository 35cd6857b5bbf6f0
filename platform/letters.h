// Letters where a code page lacks them.
#pragma once

#include <string_view>

namespace platform {

// The letter of the Latin alphabet (U+00C0 to U+017F) without its accent, or "?" for any other character.
constexpr char WithoutAccent(char32_t character) {
  constexpr char32_t first = 0xC0;
  constexpr std::string_view letters =
      "AAAAAAACEEEEIIIIDNOOOOOxOUUUUYTsaaaaaaaceeeeiiiidnooooo/ouuuuyty"   // U+00C0
      "AaAaAaCcCcCcCcDdDdEeEeEeEeEeGgGgGgGgHhHhIiIiIiIiIiIiJjKkkLlLlLlL"   // U+0100
      "lLlNnNnNnnNnOoOoOoOoRrRrRrSsSsSsSsTtTtTtUuUuUuUuUuUuWwYyYZzZzZzs";  // U+0140
  static_assert(letters.size() == 0x180 - first);
  return character >= first && character - first < letters.size() ? letters[character - first] : '?';
}

}  // namespace platform
