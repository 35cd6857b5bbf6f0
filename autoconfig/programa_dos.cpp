#include "autoconfig/programa_dos.h"

#include <cstddef>
#include <cstdint>
#include <limits>
#include <string_view>

#include "support/mod_Arquivos.h"

// Every program begins with a header for DOS. Its last four bytes say where, in one for Windows, the other header is.
bool EhProgramaDoDos(const std::string& Caminho) {
  constexpr std::size_t tamanho = 64, indicador = 60;
  constexpr std::string_view marcaDoWindows("PE\0\0", 4);
  const std::string cabecalho = LerArquivo(Caminho, 1, tamanho);
  if (!cabecalho.starts_with("MZ")) return false;
  std::uint32_t posicao = 0;
  for (std::size_t i = tamanho; i-- > indicador;) posicao = posicao << 8 | static_cast<unsigned char>(cabecalho[i]);
  if (posicao >= std::numeric_limits<std::int32_t>::max()) return true;
  return LerArquivo(Caminho, static_cast<std::int32_t>(posicao) + 1, marcaDoWindows.size()) != marcaDoWindows;
}
