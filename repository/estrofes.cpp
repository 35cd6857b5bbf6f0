#include "repository/estrofes.h"

#include <algorithm>
#include <cstdint>

namespace {

using Tipo = Recusa::Tipo;

constexpr std::size_t MaiorLinha = 4'096, MaisLinhas = 32;  // bytes; lines of a stanza
constexpr std::string_view Marca = "\xEF\xBB\xBF", Separador = ": ";

bool EhLetra(char Qual) { return (Qual >= 'A' && Qual <= 'Z') || (Qual >= 'a' && Qual <= 'z'); }

unsigned char Byte(char Qual) { return static_cast<unsigned char>(Qual); }

// What the first byte of a character says: the character's length, and the least number that needs it. Length 0: none
// begins so.
struct Inicio {
  std::size_t Tamanho;
  std::uint32_t Bits, Menor;
};

Inicio InicioDe(unsigned char Primeiro) {
  if (Primeiro < 0x80) return {1, Primeiro, 0};
  if (Primeiro < 0xC0) return {0, 0, 0};
  if (Primeiro < 0xE0) return {2, Primeiro & 0x1FU, 0x80};
  if (Primeiro < 0xF0) return {3, Primeiro & 0x0FU, 0x800};
  return {Primeiro < 0xF8 ? std::size_t{4} : 0, Primeiro & 0x07U, 0x10000};
}

// The length of the character that the text begins with; 0 when it is none, or a control character but LF.
std::size_t TamanhoDoCaractere(std::string_view Texto) {
  constexpr std::uint32_t ultimo = 0x10FFFF, primeiroSubstituto = 0xD800, ultimoSubstituto = 0xDFFF;
  auto [tamanho, numero, menor] = InicioDe(Byte(Texto[0]));
  if (tamanho == 0 || tamanho > Texto.size()) return 0;
  for (std::size_t i = 1; i < tamanho; ++i) {
    if ((Texto[i] & 0xC0) != 0x80) return 0;
    numero = numero << 6 | (Byte(Texto[i]) & 0x3FU);
  }
  const bool valido = numero >= menor && numero <= ultimo && (numero < primeiroSubstituto || numero > ultimoSubstituto);
  const bool controle = (numero < ' ' && numero != '\n') || numero == 0x7F;
  return valido && !controle ? tamanho : 0;
}

// Where the text stops being one; its length when it does not.
std::size_t FimDoTexto(std::string_view Texto) {
  std::size_t posicao = 0;
  while (posicao < Texto.size()) {
    const std::size_t tamanho = TamanhoDoCaractere(Texto.substr(posicao));
    if (tamanho == 0) break;
    posicao += tamanho;
  }
  return posicao;
}

std::size_t NumeroDaLinha(std::string_view Antes) {
  return 1 + static_cast<std::size_t>(std::ranges::count(Antes, '\n'));
}

}  // namespace

std::optional<Campo> Estrofe::Achar(std::string_view Chave) const {
  const auto achado = std::ranges::find(Campos, Chave, &Campo::Chave);
  return achado == Campos.end() ? std::nullopt : std::optional(*achado);
}

LeitorDeEstrofes::LeitorDeEstrofes(std::string_view Conteudo, std::size_t Maior) : resto_(Conteudo) {
  if (Conteudo.size() > Maior) {
    Recusar(Tipo::Grande);
    return;
  }
  const std::size_t fim = Conteudo.starts_with(Marca) ? 0 : FimDoTexto(Conteudo);
  if (fim == Conteudo.size()) return;
  linha_ = NumeroDaLinha(Conteudo.substr(0, fim));
  Recusar(Tipo::NaoEhTexto);
}

std::optional<Estrofe> LeitorDeEstrofes::Proxima() {
  Estrofe estrofe;
  if (porque_.Qual != Tipo::Nenhuma || resto_.empty()) return std::nullopt;
  for (;;) {
    const auto linha = ProximaLinha();
    if (!linha) return std::nullopt;
    if (linha->empty()) break;
    if (!Acrescentar(estrofe, *linha)) return std::nullopt;
    if (resto_.empty()) return estrofe;
  }
  if (!estrofe.Campos.empty() && !resto_.empty()) return estrofe;
  Recusar(Tipo::LinhaVazia);
  return std::nullopt;
}

std::optional<std::string_view> LeitorDeEstrofes::ProximaLinha() {
  ++linha_;
  const std::size_t fim = resto_.find('\n');
  const std::string_view linha = resto_.substr(0, fim);
  if (linha.size() > MaiorLinha) {
    Recusar(Tipo::LinhaLonga);
  } else if (fim == std::string_view::npos) {
    Recusar(Tipo::LinhaErrada);
  } else {
    resto_.remove_prefix(fim + 1);
    return linha;
  }
  return std::nullopt;
}

bool LeitorDeEstrofes::Acrescentar(Estrofe& Atual, std::string_view Texto) {
  const auto letras = static_cast<std::size_t>(std::ranges::find_if_not(Texto, EhLetra) - Texto.begin());
  const std::string_view chave = Texto.substr(0, letras), depois = Texto.substr(letras);
  if (chave.empty() || !depois.starts_with(Separador) || depois == Separador) {
    Recusar(Tipo::LinhaErrada);
  } else if (Atual.Campos.size() == MaisLinhas) {
    Recusar(Tipo::LinhasDemais);
  } else if (chave != "Espelho" && Atual.Achar(chave)) {
    Recusar(Tipo::ChaveRepetida, chave);
  } else {
    Atual.Campos.push_back({linha_, chave, depois.substr(Separador.size())});
    return true;
  }
  return false;
}

void LeitorDeEstrofes::Recusar(Recusa::Tipo Qual, std::string_view Chave) {
  porque_ = {Qual, linha_, std::string(Chave)};
}

bool PodeSerValor(std::string_view Chave, std::string_view Utf8) {
  const bool cabe = Chave.size() + Separador.size() + Utf8.size() <= MaiorLinha;
  return cabe && Utf8.find('\n') == std::string_view::npos && FimDoTexto(Utf8) == Utf8.size();
}
