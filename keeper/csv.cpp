#include "keeper/csv.h"

namespace {

char SeparadorDe(std::string_view Conteudo) {
  bool entreAspas = false;
  for (const char letra : Conteudo) {
    if (letra == '"') entreAspas = !entreAspas;
    if (entreAspas) continue;
    if (letra == ';' || letra == ',') return letra;
    if (letra == '\r' || letra == '\n') break;
  }
  return ',';
}

std::string EntreAspas(std::string_view Campo) {
  std::string texto = "\"";
  for (const char letra : Campo) {
    if (letra == '"') texto += '"';
    texto += letra;
  }
  return texto + '"';
}

}  // namespace

std::string LinhaCsv(std::initializer_list<std::string_view> Campos) {
  std::string linha;
  for (const std::string_view campo : Campos) {
    linha += campo.find_first_of(",;\"\r\n") == std::string_view::npos ? std::string(campo) : EntreAspas(campo);
    linha += ',';
  }
  linha.pop_back();
  return linha;
}

LeitorCsv::LeitorCsv(std::string_view Conteudo) : conteudo_(Conteudo), separador_(SeparadorDe(Conteudo)) {}

std::optional<LinhaDaTabela> LeitorCsv::Proxima() {
  while (!NoFim() && NoFimDaLinha()) PularFimDeLinha();
  if (NoFim() || errada_ != 0) return std::nullopt;
  LinhaDaTabela lida{linha_, {}};
  for (;;) {
    auto campo = Campo();
    if (!campo || (!NoFimDaLinha() && conteudo_[posicao_] != separador_)) {
      errada_ = lida.Numero;
      return std::nullopt;
    }
    lida.Campos.push_back(std::move(*campo));
    if (NoFimDaLinha()) break;
    ++posicao_;
  }
  PularFimDeLinha();
  return lida;
}

std::optional<std::string> LeitorCsv::Campo() {
  if (!NoFim() && conteudo_[posicao_] == '"') return CampoEntreAspas();
  const std::size_t inicio = posicao_;
  while (!NoFimDaLinha() && conteudo_[posicao_] != separador_) {
    if (conteudo_[posicao_++] == '"') return std::nullopt;
  }
  return std::string(conteudo_.substr(inicio, posicao_ - inicio));
}

// Two quotes are one; a line end belongs to the field.
std::optional<std::string> LeitorCsv::CampoEntreAspas() {
  std::string campo;
  for (++posicao_; !NoFim(); ++posicao_) {
    const char letra = conteudo_[posicao_];
    const bool dobrada = letra == '"' && conteudo_.substr(posicao_ + 1).starts_with('"');
    if (letra == '"' && !dobrada) {
      ++posicao_;
      return campo;
    }
    if (dobrada) ++posicao_;
    if (letra == '\n' || (letra == '\r' && !conteudo_.substr(posicao_ + 1).starts_with('\n'))) ++linha_;
    campo += letra;
  }
  return std::nullopt;
}

void LeitorCsv::PularFimDeLinha() {
  if (NoFim()) return;
  if (conteudo_.substr(posicao_).starts_with("\r\n")) ++posicao_;
  ++posicao_;
  ++linha_;
}
