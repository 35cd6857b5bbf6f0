#include "repository/base64.h"

#include <algorithm>
#include <cstddef>
#include <cstdint>

namespace {

constexpr std::string_view Digitos = "ABCDEFGHIJKLMNOPQRSTUVWXYZabcdefghijklmnopqrstuvwxyz0123456789+/";
constexpr std::size_t BytesDoGrupo = 3, DigitosDoGrupo = 4;

}  // namespace

std::string EmBase64(std::string_view Bytes) {
  std::string texto;
  for (; !Bytes.empty(); Bytes.remove_prefix(std::min(BytesDoGrupo, Bytes.size()))) {
    std::uint32_t grupo = 0;
    for (std::size_t i = 0; i < BytesDoGrupo; ++i) {
      grupo = grupo << 8 | (i < Bytes.size() ? static_cast<unsigned char>(Bytes[i]) : 0U);
    }
    for (std::size_t i = 0; i < DigitosDoGrupo; ++i) {
      texto += i <= Bytes.size() ? Digitos[grupo >> (18 - 6 * i) & 63] : '=';
    }
  }
  return texto;
}

std::optional<std::string> DeBase64(std::string_view Texto) {
  std::string bytes;
  std::uint32_t bits = 0;
  std::size_t quantos = 0;
  for (const char digito : Texto.substr(0, Texto.find('='))) {
    const std::size_t valor = Digitos.find(digito);
    if (valor == std::string_view::npos) return std::nullopt;
    bits = bits << 6 | static_cast<std::uint32_t>(valor);
    quantos += 6;
    if (quantos < 8) continue;
    quantos -= 8;
    bytes += static_cast<char>(bits >> quantos & 0xFF);
  }
  if (EmBase64(bytes) != Texto) return std::nullopt;
  return bytes;
}
