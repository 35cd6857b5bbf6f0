#include "package/cls_CRC.h"

#include <algorithm>
#include <array>
#include <cstddef>
#include <memory>

#include "package/crc32.h"

namespace {

constexpr std::int64_t Cheio = 1'048'576;  // bytes of a chunk

// What is read at a time: the platform reads faster into memory that starts at the beginning of a page, and that the
// processor still holds from the piece before.
struct alignas(4096) Pedaco {
  std::array<char, Cheio / 4> Bytes;
};

}  // namespace

std::optional<std::int64_t> cls_CRC::CRC(platform::File& Filenr) {
  const std::int64_t tamanho = Filenr.Size();
  if (tamanho < 0 || tamanho % Cheio == 0) return std::nullopt;
  const auto pedaco = std::make_unique_for_overwrite<Pedaco>();
  std::int64_t soma = 0;
  registro_ = CRC32::Inicial;
  for (std::int64_t posicao = 0; posicao < tamanho;) {
    const std::int64_t parte = std::min<std::int64_t>(sizeof pedaco->Bytes, tamanho - posicao);
    const auto quantos = static_cast<std::size_t>(parte);
    if (Filenr.Read(posicao, pedaco->Bytes.data(), quantos) != parte) return std::nullopt;
    const std::int32_t valor = Acrescentar({pedaco->Bytes.data(), quantos});
    posicao += parte;
    if (posicao % Cheio == 0 || posicao == tamanho) soma += valor;
  }
  return soma;
}

std::optional<std::int64_t> cls_CRC::CRC(std::string_view Conteudo) {
  if (Conteudo.size() % Cheio == 0) return std::nullopt;
  std::int64_t soma = 0;
  registro_ = CRC32::Inicial;
  for (std::size_t posicao = 0; posicao < Conteudo.size(); posicao += Cheio) {
    soma += Acrescentar(Conteudo.substr(posicao, Cheio));
  }
  return soma;
}

// The register's value after the next bytes.
std::int32_t cls_CRC::Acrescentar(std::string_view Bytes) {
  registro_ = CRC32::Atualizar(registro_, Bytes);
  return static_cast<std::int32_t>(~registro_);
}

std::string TextoCRC(std::int64_t Valor) { return std::to_string(Valor); }
