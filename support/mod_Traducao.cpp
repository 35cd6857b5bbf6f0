#include "support/mod_Traducao.h"

#include <array>

#include "platform/profile.h"
#include "support/caracteres.h"
#include "support/mod_Globais.h"

namespace {

constexpr const char* Secao20 = "TOLVARIS20";
constexpr std::size_t TamanhoBuffer = 255;

}  // namespace

std::string Traduzir(const std::string& Texto) {
  if (ArquivoIdioma.empty()) return Texto;
  std::string traducao = LerIni(Secao20, Texto);
  if (traducao.empty()) return Texto;
  for (auto barra = AcharUltimo(traducao, '|'); barra != std::string::npos; barra = AcharUltimo(traducao, '|')) {
    traducao.erase(barra, 1);
  }
  return traducao;
}

// A value may be wrapped in bars so that the blanks at its ends are kept.
std::string LerIni(const std::string& Secao, const std::string& Chave) {
  std::string valor = platform::GetPrivateProfileStringA(Secao, Chave, "", TamanhoBuffer, ArquivoIdioma);
  if (valor.starts_with('|')) valor.erase(0, 1);
  if (TerminaCom(valor, '|')) valor.pop_back();
  return valor;
}

std::string TituloPrograma() {
  constexpr std::array<unsigned char, 8> codigos = {84, 111, 108, 118, 97, 114, 105, 115};
  std::string titulo;
  for (const unsigned char codigo : codigos) titulo += static_cast<char>(codigo);
  return titulo;
}
