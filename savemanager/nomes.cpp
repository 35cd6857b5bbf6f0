#include "savemanager/nomes.h"

#include "catalog/cls_DAT.h"
#include "platform/text.h"
#include "support/caminhos.h"

namespace {

constexpr std::string_view Estado = " [State ";

bool Digito(char C) { return C >= '0' && C <= '9'; }

}  // namespace

std::string NomeExibido(const std::string& Arquivo, const cls_DAT& Catalogo) {
  const auto base = NomeBase(Arquivo);
  if (!base) return Arquivo;
  std::int16_t encontrado = 0;
  std::string texto = Catalogo.DefineNome(*base, encontrado);
  const std::string extensao = platform::CharUpperBuffA(Arquivo.substr(base->size() + 1));
  if (!extensao.starts_with("ZS")) return texto;
  const char estado = extensao.back() == 'T' ? '0' : extensao.back();
  if (Digito(estado)) texto.append(Estado).append({estado, ']'});
  return texto;
}

std::string NomeArquivo(const std::string& Texto, const cls_DAT& Catalogo) {
  const std::size_t inicio = Texto.find(Estado);
  if (inicio == std::string::npos) return Catalogo.DefineDOSName(Texto) + ".srm";
  std::string estado = Texto.substr(inicio + Estado.size(), 1);
  if (estado == "0") estado = "t";
  return Catalogo.DefineDOSName(Texto.substr(0, inicio)) + ".zs" + estado;
}
