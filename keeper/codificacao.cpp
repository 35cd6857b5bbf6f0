#include "keeper/codificacao.h"

#include <cstddef>

#include "platform/text.h"

namespace {

constexpr std::string_view Marca = "\xEF\xBB\xBF";

// Bytes of the character that begins with this one; 0: none does.
std::size_t TamanhoDe(unsigned char primeiro) {
  if (primeiro < 0x80) return 1;
  if (primeiro >= 0xC2 && primeiro < 0xE0) return 2;
  if (primeiro >= 0xE0 && primeiro < 0xF0) return 3;
  return primeiro >= 0xF0 && primeiro < 0xF5 ? 4 : 0;
}

bool EhUtf8(std::string_view texto) {
  while (!texto.empty()) {
    const std::size_t tamanho = TamanhoDe(static_cast<unsigned char>(texto[0]));
    if (tamanho == 0 || tamanho > texto.size()) return false;
    for (std::size_t i = 1; i < tamanho; ++i) {
      if ((texto[i] & 0xC0) != 0x80) return false;
    }
    texto.remove_prefix(tamanho);
  }
  return true;
}

}  // namespace

std::string EmUtf8(std::string_view Conteudo) {
  if (Conteudo.starts_with(Marca)) return std::string(Conteudo.substr(Marca.size()));
  return EhUtf8(Conteudo) ? std::string(Conteudo) : platform::ToUtf8(Conteudo);
}
