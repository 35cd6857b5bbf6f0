#include "repository/entrada.h"

#include <algorithm>

#include "repository/base64.h"

namespace {

using Tipo = Recusa::Tipo;
using platform::PublicKey;
using platform::Signature;

constexpr std::string_view Formato = "1", ChaveDaAssinatura = "Assinatura";

struct Partes {
  EntradaLida Lida;
  std::string_view Assinado;  // all before the signature's line
  Signature Assinatura = {};
};

template <typename Bytes>
std::string EmTexto(const Bytes& Quais) {
  return {Quais.begin(), Quais.end()};
}

template <typename Bytes>
std::optional<Bytes> LerBytes(std::string_view Texto) {
  const auto lidos = DeBase64(Texto);
  Bytes bytes = {};
  if (!lidos || lidos->size() != bytes.size()) return std::nullopt;
  std::ranges::copy(*lidos, bytes.begin());
  return bytes;
}

std::optional<PublicKey> LerChavePublica(std::string_view Texto) {
  const auto chave = LerBytes<PublicKey>(Texto);
  return chave && (*chave)[0] == 4 ? chave : std::nullopt;
}

// Another format may look different everywhere else.
bool EhMaisNova(const Estrofe& Qual) {
  constexpr std::int64_t maior = 1'000'000;
  const auto formato = Qual.Achar("Formato");
  return formato && formato->Valor != Formato && LerNumero(formato->Valor, maior);
}

bool ComecaMaisNova(std::string_view Conteudo) {
  const std::size_t fim = Conteudo.find('\n');
  if (fim == std::string_view::npos) return false;
  LeitorDeEstrofes leitor(Conteudo.substr(0, fim + 1), MaiorEntrada);
  const auto primeira = leitor.Proxima();
  return primeira && EhMaisNova(*primeira);
}

// The signature has to be the last line, for it is of all that stands before it.
Recusa ConferirFim(const Estrofe& Qual, LeitorDeEstrofes& Leitor) {
  const auto assinatura = Qual.Achar(ChaveDaAssinatura);
  if (!assinatura) return {Tipo::FaltaChave, Qual.Campos.front().Linha, std::string(ChaveDaAssinatura)};
  const auto outra = Leitor.Proxima();
  if (Leitor.Porque().Qual != Tipo::Nenhuma) return Leitor.Porque();
  if (assinatura->Linha == Qual.Campos.back().Linha && !outra) return {};
  return {Tipo::LinhaAMais, assinatura->Linha + 1};
}

void LerEspelhos(const Estrofe& Qual, std::vector<std::string>& Espelhos, Recusa& Porque) {
  for (const Campo& campo : Qual.Campos) {
    if (campo.Chave != "Espelho" || Porque.Qual != Tipo::Nenhuma) continue;
    if (!EhEspelho(campo.Valor) || Espelhos.size() == MaisEspelhos)
      Porque = {Tipo::ValorErrado, campo.Linha, "Espelho"};
    Espelhos.emplace_back(campo.Valor);
  }
}

void LerValores(const Estrofe& Qual, Partes& Lidas) {
  EntradaDoRepositorio& entrada = Lidas.Lida.Entrada;
  LeitorDeValores valores(Qual, Lidas.Lida.Porque);
  std::string formato;
  valores.Exigido("Formato", formato,
                  [](std::string_view Texto) { return Texto == Formato ? LerTexto(Texto) : std::nullopt; });
  valores.Exigido("Titulo", entrada.Titulo, LerTexto);
  valores.Exigido("Serie", entrada.Serie, [](std::string_view Texto) { return LerNumero(Texto, MaiorSerie); });
  valores.Exigido("Publicado", entrada.Publicado, LerInstante);
  valores.Exigido("Validade", entrada.Validade, LerInstante);
  valores.Exigido("Indice", entrada.Indice,
                  [](std::string_view Texto) { return LerArquivoPublicado(Texto, MaiorIndice); });
  valores.Exigido("Chave", entrada.Chave, LerChavePublica);
  valores.Exigido(ChaveDaAssinatura, Lidas.Assinatura, LerBytes<Signature>);
  LerEspelhos(Qual, entrada.Espelhos, Lidas.Lida.Porque);
}

Partes LerPartes(std::string_view Conteudo) {
  Partes lidas;
  Recusa& porque = lidas.Lida.Porque;
  LeitorDeEstrofes leitor(Conteudo, MaiorEntrada);
  const auto estrofe = leitor.Proxima();
  porque = leitor.Porque();
  const bool nova = estrofe ? EhMaisNova(*estrofe) : porque.Qual != Tipo::Grande && ComecaMaisNova(Conteudo);
  if (nova) porque = {Tipo::VersaoNova};
  if (!estrofe && porque.Qual == Tipo::Nenhuma) porque = {Tipo::FaltaChave, 0, "Formato"};
  if (porque.Qual == Tipo::Nenhuma) porque = ConferirFim(*estrofe, leitor);
  if (porque.Qual != Tipo::Nenhuma) return lidas;
  LerValores(*estrofe, lidas);
  const auto antes = static_cast<std::size_t>(estrofe->Campos.back().Chave.data() - Conteudo.data());
  lidas.Assinado = Conteudo.substr(0, antes);
  return lidas;
}

std::string TextoAAssinar(const EntradaDoRepositorio& Entrada) {
  std::string texto =
      "Formato: " + std::string(Formato) + "\nTitulo: " + Entrada.Titulo + "\nSerie: " + std::to_string(Entrada.Serie) +
      "\nPublicado: " + TextoDoInstante(Entrada.Publicado) + "\nValidade: " + TextoDoInstante(Entrada.Validade) +
      "\nIndice: " + TextoDoArquivo(Entrada.Indice) + "\n";
  for (const std::string& espelho : Entrada.Espelhos) texto += "Espelho: " + espelho + "\n";
  return texto + "Chave: " + EmBase64(EmTexto(Entrada.Chave)) + "\n";
}

}  // namespace

EntradaLida LerEntrada(std::string_view Conteudo) {
  Partes lidas = LerPartes(Conteudo);
  EntradaLida& lida = lidas.Lida;
  if (lida.Porque.Qual == Tipo::Nenhuma &&
      !platform::VerifySignature(lida.Entrada.Chave, lidas.Assinado, lidas.Assinatura)) {
    lida.Porque = {Tipo::AssinaturaErrada};
  }
  return lida;
}

EntradaLida LerEntradaSemAssinatura(std::string_view Conteudo) { return LerPartes(Conteudo).Lida; }

std::optional<std::string> AssinarEntrada(EntradaDoRepositorio Entrada, const platform::SigningKey& Chave) {
  Entrada.Chave = Chave.Public;
  std::string texto = TextoAAssinar(Entrada);
  const auto assinatura = platform::Sign(Chave, texto);
  if (!assinatura) return std::nullopt;
  texto += std::string(ChaveDaAssinatura) + ": " + EmBase64(EmTexto(*assinatura)) + "\n";
  const EntradaLida lida = LerEntrada(texto);
  const bool igual = lida.Porque.Qual == Tipo::Nenhuma && lida.Entrada == Entrada;
  return igual ? std::optional(std::move(texto)) : std::nullopt;
}

std::string ArquivoDoIndice(const ArquivoPublicado& Indice) { return "indice/" + Indice.Soma + ".txt"; }
