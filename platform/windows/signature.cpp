#include "platform/signature.h"

#include <algorithm>
#include <utility>

#include "platform/hash.h"
#include "platform/windows/algorithms.h"

namespace platform {
namespace {

struct KeyDestroyer {
  void operator()(void* key) const { ::BCryptDestroyKey(key); }
};
using Key = std::unique_ptr<void, KeyDestroyer>;

constexpr ULONG BytesOfNumber = 32;

// A key as it is handed over: behind the header X and Y and, of one that signs, the secret number.
struct Blob {
  BCRYPT_ECCKEY_BLOB Header;
  std::array<std::uint8_t, std::size_t{3} * BytesOfNumber> Numbers;
};
constexpr ULONG SizeOfPrivate = sizeof(Blob), SizeOfPublic = SizeOfPrivate - BytesOfNumber;
static_assert(SizeOfPrivate == sizeof(BCRYPT_ECCKEY_BLOB) + 3 * BytesOfNumber, "nothing lies between");

Blob BlobOf(ULONG kind, const PublicKey& key) {
  Blob blob = {{kind, BytesOfNumber}, {}};
  std::copy(key.begin() + 1, key.end(), blob.Numbers.begin());
  return blob;
}

Key Import(const Provider& provider, LPCWSTR kind, Blob& blob, ULONG size) {
  BCRYPT_KEY_HANDLE key = nullptr;
  if (!provider) return {};
  const NTSTATUS status =
      ::BCryptImportKeyPair(provider.get(), nullptr, kind, &key, reinterpret_cast<PUCHAR>(&blob), size, 0);
  return Key(BCRYPT_SUCCESS(status) ? key : nullptr);
}

Key Generate(const Provider& provider) {
  constexpr ULONG bits = 256;
  BCRYPT_KEY_HANDLE made = nullptr;
  if (!provider || !BCRYPT_SUCCESS(::BCryptGenerateKeyPair(provider.get(), &made, bits, 0))) return {};
  Key key(made);
  return BCRYPT_SUCCESS(::BCryptFinalizeKeyPair(made, 0)) ? std::move(key) : Key();
}

}  // namespace

std::optional<SigningKey> MakeSigningKey() {
  const Provider provider = OpenProvider(BCRYPT_ECDSA_P256_ALGORITHM);
  const Key key = Generate(provider);
  Blob blob = {};
  ULONG size = 0;
  if (!key || !BCRYPT_SUCCESS(::BCryptExportKey(key.get(), nullptr, BCRYPT_ECCPRIVATE_BLOB,
                                                reinterpret_cast<PUCHAR>(&blob), sizeof blob, &size, 0))) {
    return std::nullopt;
  }
  if (size != SizeOfPrivate || blob.Header.cbKey != BytesOfNumber) return std::nullopt;
  SigningKey made = {{}, {4}};
  const auto secret = blob.Numbers.begin() + 2 * BytesOfNumber;
  std::copy(blob.Numbers.begin(), secret, made.Public.begin() + 1);
  std::copy(secret, blob.Numbers.end(), made.Secret.begin());
  return made;
}

// Windows need not look whether both parts of an imported key belong together.
std::optional<Signature> Sign(const SigningKey& key, std::string_view bytes) {
  const Provider provider = OpenProvider(BCRYPT_ECDSA_P256_ALGORITHM);
  Blob blob = BlobOf(BCRYPT_ECDSA_PRIVATE_P256_MAGIC, key.Public);
  std::ranges::copy(key.Secret, blob.Numbers.begin() + 2 * BytesOfNumber);
  const Key imported = Import(provider, BCRYPT_ECCPRIVATE_BLOB, blob, SizeOfPrivate);
  const auto hash = Sha256(bytes);
  if (!imported || !hash) return std::nullopt;
  Signature signature = {};
  ULONG size = 0;
  const NTSTATUS status =
      ::BCryptSignHash(imported.get(), nullptr, Data(hash->data()), static_cast<ULONG>(hash->size()), signature.data(),
                       static_cast<ULONG>(signature.size()), &size, 0);
  const bool made = BCRYPT_SUCCESS(status) && size == signature.size();
  return made && VerifySignature(key.Public, bytes, signature) ? std::optional(signature) : std::nullopt;
}

bool VerifySignature(const PublicKey& key, std::string_view bytes, const Signature& signature) {
  const Provider provider = OpenProvider(BCRYPT_ECDSA_P256_ALGORITHM);
  Blob blob = BlobOf(BCRYPT_ECDSA_PUBLIC_P256_MAGIC, key);
  const Key imported = key[0] == 4 ? Import(provider, BCRYPT_ECCPUBLIC_BLOB, blob, SizeOfPublic) : Key();
  const auto hash = Sha256(bytes);
  if (!imported || !hash) return false;
  return BCRYPT_SUCCESS(::BCryptVerifySignature(imported.get(), nullptr, Data(hash->data()),
                                                static_cast<ULONG>(hash->size()), Data(signature.data()),
                                                static_cast<ULONG>(signature.size()), 0));
}

}  // namespace platform
