#include "savemanager/nomes.h"

#include "catalog/cls_DAT.h"
#include "platform/text.h"

namespace {

constexpr std::string_view Estado = " [State ";

bool Digito(char c) { return c >= '0' && c <= '9'; }

}  // namespace

std::string NomeExibido(const std::string& arquivo, const cls_DAT& catalogo) {
  const std::size_t ponto = arquivo.rfind('.');
  if (ponto == std::string::npos) return arquivo;
  std::int16_t encontrado = 0;
  std::string texto = catalogo.DefineNome(arquivo.substr(0, ponto), encontrado);
  const std::string extensao = platform::CharUpperBuffA(arquivo.substr(ponto + 1));
  if (!extensao.starts_with("ZS")) return texto;
  const char estado = extensao.back() == 'T' ? '0' : extensao.back();
  if (Digito(estado)) texto.append(Estado).append({estado, ']'});
  return texto;
}

std::string NomeArquivo(const std::string& texto, const cls_DAT& catalogo) {
  const std::size_t inicio = texto.find(Estado);
  if (inicio == std::string::npos) return catalogo.DefineDOSName(texto) + ".srm";
  std::string estado = texto.substr(inicio + Estado.size(), 1);
  if (estado == "0") estado = "t";
  return catalogo.DefineDOSName(texto.substr(0, inicio)) + ".zs" + estado;
}
