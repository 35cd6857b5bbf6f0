// The settings: named values below a key of the registry. Nothing here reports an error.
#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <variant>

#include "platform/registry.h"

// What a setting can hold; std::monostate: not set.
using Valor = std::variant<std::monostate, std::string, std::uint8_t, std::int32_t, std::int16_t>;

// The value as text: numbers in decimal, nothing as the empty text.
std::string TextoDe(const Valor& Value);

// The value as a whole number of 32 bits, blanks around it allowed; nothing when it is none.
std::optional<std::int32_t> InteiroDe(const Valor& Value);

// Where the program's settings lie, below platform::RootCurrentUser.
inline constexpr const char* ChaveConfiguracao = "Software\\Roms\\Tolvaris";

// Key paths may begin with a backslash. A computer's name means the registry of that computer: whoever keeps several
// machines can set them up from one.
class cls_REG {
 public:
  // Writes a value and creates the key when it is missing. An existing number or byte stays one, and keeps what it held
  // when `Value` is none; any other value becomes a text. Always true.
  bool SetValue(std::uint32_t Predefinedkey, const std::string& Keyname, const std::string& ValueName,
                const Valor& Value, const std::string& ComputerName = "") const;

  // Not set: the key or the value is missing, its data is longer than 255 bytes, or it is no text, number or byte.
  Valor GetValue(std::uint32_t Predefinedkey, const std::string& Keyname, const std::string& ValueName,
                 const std::string& ComputerName = "") const;

  // For who takes a program's settings away with it. True: the key existed and its deletion was asked for. A key with
  // keys below it stays.
  bool DeletKey(std::uint32_t Predefinedkey, const std::string& Keyname, const std::string& ComputerName = "") const;
};
