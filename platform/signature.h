// Signatures: ECDSA over the curve P-256, with SHA-256. Numbers have their highest byte first.
#pragma once

#include <array>
#include <cstdint>
#include <optional>
#include <string_view>

namespace platform {

using PublicKey = std::array<std::uint8_t, 65>;  // a 4, X and Y
using Signature = std::array<std::uint8_t, 64>;  // r and s

struct SigningKey {
  std::array<std::uint8_t, 32> Secret;
  PublicKey Public;
  bool operator==(const SigningKey&) const = default;
};

// A new key, of the system's random numbers. Nothing when the system makes none.
std::optional<SigningKey> MakeSigningKey();

// A signature of the bytes that VerifySignature confirms; the same bytes may get another one each time. Nothing when
// the two parts of the key do not belong together, or the system cannot sign.
std::optional<Signature> Sign(const SigningKey& key, std::string_view bytes);

// Whether the signature is one of these bytes by this key. False, too, for what is no point of the curve, and when the
// system cannot tell.
bool VerifySignature(const PublicKey& key, std::string_view bytes, const Signature& signature);

}  // namespace platform
