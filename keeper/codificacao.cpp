#include "keeper/codificacao.h"

#include <cstddef>

#include "platform/text.h"

namespace {

constexpr std::string_view Marca = "\xEF\xBB\xBF";

// Bytes of the character that begins with this one; 0: none does.
std::size_t TamanhoDe(unsigned char Primeiro) {
  if (Primeiro < 0x80) return 1;
  if (Primeiro >= 0xC2 && Primeiro < 0xE0) return 2;
  if (Primeiro >= 0xE0 && Primeiro < 0xF0) return 3;
  return Primeiro >= 0xF0 && Primeiro < 0xF5 ? 4 : 0;
}

bool EhUtf8(std::string_view Texto) {
  while (!Texto.empty()) {
    const std::size_t tamanho = TamanhoDe(static_cast<unsigned char>(Texto[0]));
    if (tamanho == 0 || tamanho > Texto.size()) return false;
    for (std::size_t i = 1; i < tamanho; ++i) {
      if ((Texto[i] & 0xC0) != 0x80) return false;
    }
    Texto.remove_prefix(tamanho);
  }
  return true;
}

}  // namespace

std::string EmUtf8(std::string_view Conteudo) {
  if (Conteudo.starts_with(Marca)) return std::string(Conteudo.substr(Marca.size()));
  return EhUtf8(Conteudo) ? std::string(Conteudo) : platform::ToUtf8(Conteudo);
}
