// A stand-in: it tells each changed byte and each other key, and anybody who reads this could forge it. Everything is a
// hash of what it comes from: X of the secret, Y of X, a signature of the public key and the bytes.
#include "platform/signature.h"

#include <algorithm>
#include <string>

#include "platform/simulated/hash.h"
#include "platform/simulated/machine.h"

namespace platform {
namespace {

std::string Text(const auto& bytes) { return {bytes.begin(), bytes.end()}; }

PublicKey KeyAt(const Sha256Value& x) {
  const Sha256Value y = simulated::HashOf("Y" + Text(x));
  PublicKey key = {4};
  std::ranges::copy(y, std::ranges::copy(x, key.begin() + 1).out);
  return key;
}

PublicKey PublicPart(const Sha256Value& secret) { return KeyAt(simulated::HashOf("X" + Text(secret))); }

bool IsOnCurve(const PublicKey& key) {
  Sha256Value x = {};
  std::copy_n(key.begin() + 1, x.size(), x.begin());
  return key == KeyAt(x);
}

Signature SignatureBy(const PublicKey& key, std::string_view bytes) {
  const std::string signedText = Text(key) + Text(simulated::HashOf(bytes));
  Signature signature = {};
  const auto s = std::ranges::copy(simulated::HashOf("r" + signedText), signature.begin()).out;
  std::ranges::copy(simulated::HashOf("s" + signedText), s);
  return signature;
}

}  // namespace

std::optional<SigningKey> MakeSigningKey() {
  if (simulated::Fails()) return std::nullopt;
  const Sha256Value secret = simulated::HashOf("key " + std::to_string(++simulated::TheMachine().KeysMade));
  return SigningKey{secret, PublicPart(secret)};
}

std::optional<Signature> Sign(const SigningKey& key, std::string_view bytes) {
  if (simulated::Fails() || key.Public != PublicPart(key.Secret)) return std::nullopt;
  return SignatureBy(key.Public, bytes);
}

bool VerifySignature(const PublicKey& key, std::string_view bytes, const Signature& signature) {
  return !simulated::Fails() && IsOnCurve(key) && signature == SignatureBy(key, bytes);
}

}  // namespace platform
