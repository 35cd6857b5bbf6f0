#include "package/cls_CRC.h"

#include <algorithm>
#include <array>
#include <cstddef>
#include <memory>

#include "package/crc32.h"

namespace {

// What is read at a time. The platform reads faster into memory that starts at the beginning of a page.
struct alignas(4096) Pedaco {
  std::array<char, 1'048'576> Bytes;
};

}  // namespace

std::optional<std::int64_t> cls_CRC::CRC(platform::File& Filenr) {
  constexpr std::int64_t cheio = sizeof(Pedaco);
  const std::int64_t tamanho = Filenr.Size();
  if (tamanho < 0 || tamanho % cheio == 0) return std::nullopt;
  const auto pedaco = std::make_unique_for_overwrite<Pedaco>();
  std::int64_t soma = 0;
  Registro = CRC32::Inicial;
  for (std::int64_t posicao = 0; posicao < tamanho; posicao += cheio) {
    const std::int64_t parte = std::min(cheio, tamanho - posicao);
    const auto quantos = static_cast<std::size_t>(parte);
    if (Filenr.Read(posicao, pedaco->Bytes.data(), quantos) != parte) return std::nullopt;
    Registro = CRC32::Atualizar(Registro, {pedaco->Bytes.data(), quantos});
    soma += static_cast<std::int32_t>(~Registro);
  }
  return soma;
}

std::string TextoCRC(std::int64_t Valor) { return std::to_string(Valor); }
