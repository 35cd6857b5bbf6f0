// What Windows computes for those who hash and sign. As Windows 7 has it: neither the shorter functions nor the ready
// handles of Windows 10.
#pragma once

// clang-format off
#include <windows.h>
#include <bcrypt.h>
// clang-format on

#include <memory>
#include <string_view>

namespace platform {

struct ProviderCloser {
  void operator()(void* provider) const { ::BCryptCloseAlgorithmProvider(provider, 0); }
};
using Provider = std::unique_ptr<void, ProviderCloser>;

// Null where the system has no such algorithm.
inline Provider OpenProvider(LPCWSTR algorithm) {
  BCRYPT_ALG_HANDLE provider = nullptr;
  const NTSTATUS status = ::BCryptOpenAlgorithmProvider(&provider, algorithm, nullptr, 0);
  return Provider(BCRYPT_SUCCESS(status) ? provider : nullptr);
}

// For parameters that are only read.
inline PUCHAR Data(std::string_view bytes) { return reinterpret_cast<PUCHAR>(const_cast<char*>(bytes.data())); }
inline PUCHAR Data(const unsigned char* bytes) { return const_cast<PUCHAR>(bytes); }

}  // namespace platform
