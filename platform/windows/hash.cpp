#include "platform/hash.h"

#include "platform/windows/algorithms.h"

namespace platform {
namespace {

struct HashDestroyer {
  void operator()(void* hash) const { ::BCryptDestroyHash(hash); }
};
using Hash = std::unique_ptr<void, HashDestroyer>;

// Without a buffer of the caller's, Windows makes one.
Hash CreateHash(const Provider& provider) {
  BCRYPT_HASH_HANDLE hash = nullptr;
  if (!provider || !BCRYPT_SUCCESS(::BCryptCreateHash(provider.get(), &hash, nullptr, 0, nullptr, 0, 0))) return {};
  return Hash(hash);
}

bool Add(const Hash& hash, std::string_view bytes) {
  constexpr std::size_t most = std::size_t{1} << 30;  // bytes of one call are counted in 32 bits
  while (!bytes.empty()) {
    const std::string_view piece = bytes.substr(0, most);
    if (!BCRYPT_SUCCESS(::BCryptHashData(hash.get(), Data(piece), static_cast<ULONG>(piece.size()), 0))) return false;
    bytes.remove_prefix(piece.size());
  }
  return true;
}

}  // namespace

std::optional<Sha256Value> Sha256(std::string_view bytes) {
  const Provider provider = OpenProvider(BCRYPT_SHA256_ALGORITHM);
  const Hash hash = CreateHash(provider);
  Sha256Value value = {};
  if (!hash || !Add(hash, bytes)) return std::nullopt;
  if (!BCRYPT_SUCCESS(::BCryptFinishHash(hash.get(), value.data(), static_cast<ULONG>(value.size()), 0))) {
    return std::nullopt;
  }
  return value;
}

}  // namespace platform
