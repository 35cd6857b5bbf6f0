// SHA-256.
#pragma once

#include <array>
#include <cstdint>
#include <optional>
#include <string_view>

namespace platform {

using Sha256Value = std::array<std::uint8_t, 32>;  // the first byte of its usual notation comes first

// The SHA-256 of the bytes; nothing when the system cannot compute it.
std::optional<Sha256Value> Sha256(std::string_view bytes);

}  // namespace platform
