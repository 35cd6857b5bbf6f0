#include "repository/valores.h"

#include <algorithm>
#include <charconv>
#include <chrono>
#include <cstdio>

namespace {

bool EhDigito(char Qual) { return Qual >= '0' && Qual <= '9'; }

// A part of a moment: so many digits at a place.
int Parte(std::string_view Texto, std::size_t Inicio, std::size_t Quantos) {
  int numero = 0;
  std::from_chars(Texto.data() + Inicio, Texto.data() + Inicio + Quantos, numero);
  return numero;
}

}  // namespace

std::optional<std::int64_t> LerNumero(std::string_view Texto, std::int64_t Maior) {
  const bool digitos = !Texto.empty() && std::ranges::all_of(Texto, EhDigito);
  if (!digitos || (Texto[0] == '0' && Texto.size() > 1)) return std::nullopt;
  std::int64_t numero = 0;
  const auto lido = std::from_chars(Texto.data(), Texto.data() + Texto.size(), numero);
  if (lido.ec != std::errc() || numero > Maior) return std::nullopt;
  return numero;
}

std::optional<std::int64_t> LerInstante(std::string_view Texto) {
  constexpr std::string_view modelo = "0000-00-00T00:00:00Z";
  const bool igual = std::ranges::equal(
      Texto, modelo, [](char Dado, char Esperado) { return Esperado == '0' ? EhDigito(Dado) : Dado == Esperado; });
  if (!igual) return std::nullopt;
  const std::chrono::year_month_day dia{std::chrono::year(Parte(Texto, 0, 4)),
                                        std::chrono::month(static_cast<unsigned>(Parte(Texto, 5, 2))),
                                        std::chrono::day(static_cast<unsigned>(Parte(Texto, 8, 2)))};
  const int hora = Parte(Texto, 11, 2), minuto = Parte(Texto, 14, 2), segundo = Parte(Texto, 17, 2);
  if (!dia.ok() || dia.year() < std::chrono::year(1970) || hora > 23 || minuto > 59 || segundo > 59) {
    return std::nullopt;
  }
  const std::int64_t dias = std::chrono::sys_days(dia).time_since_epoch().count();
  return ((dias * 24 + hora) * 60 + minuto) * 60 + segundo;
}

std::string TextoDoInstante(std::int64_t Segundos) {
  using std::chrono::days;
  constexpr std::int64_t doDia = 86'400, ultimo = 253'402'300'799;  // the last second of the year 9999
  const std::int64_t segundos = std::clamp<std::int64_t>(Segundos, 0, ultimo), hora = segundos % doDia;
  const std::chrono::year_month_day dia{std::chrono::sys_days(days(segundos / doDia))};
  char texto[32];
  std::snprintf(texto, sizeof texto, "%04d-%02u-%02uT%02d:%02d:%02dZ", static_cast<int>(dia.year()),
                static_cast<unsigned>(dia.month()), static_cast<unsigned>(dia.day()), static_cast<int>(hora / 3'600),
                static_cast<int>(hora / 60 % 60), static_cast<int>(hora % 60));
  return texto;
}

std::string EmHexadecimal(const platform::Sha256Value& Soma) {
  constexpr std::string_view digitos = "0123456789abcdef";
  std::string texto;
  for (const std::uint8_t byte : Soma) {
    texto += digitos[byte >> 4];
    texto += digitos[byte & 0xF];
  }
  return texto;
}

bool EhSoma(std::string_view Texto) {
  constexpr std::size_t digitos = 2 * platform::Sha256Value().size();
  return Texto.size() == digitos && Texto.find_first_not_of("0123456789abcdef") == std::string_view::npos;
}

bool EhEspelho(std::string_view Endereco) {
  constexpr std::string_view esquema = "https://", proibidos = "?#\"<>\\^`{|}";
  if (!Endereco.starts_with(esquema) || !Endereco.ends_with('/')) return false;
  const bool caracteres = std::ranges::all_of(
      Endereco, [&](char Cada) { return Cada > ' ' && Cada <= '~' && proibidos.find(Cada) == std::string_view::npos; });
  const std::string_view servidor =
      Endereco.substr(esquema.size(), Endereco.find('/', esquema.size()) - esquema.size());
  return caracteres && !servidor.empty() && !servidor.starts_with(':') && servidor.find('@') == std::string_view::npos;
}

std::optional<ArquivoPublicado> LerArquivoPublicado(std::string_view Texto, std::int64_t Maior) {
  const std::size_t branco = Texto.find(' ');
  if (branco == std::string_view::npos || !EhSoma(Texto.substr(0, branco))) return std::nullopt;
  const auto tamanho = LerNumero(Texto.substr(branco + 1), Maior);
  if (!tamanho) return std::nullopt;
  return ArquivoPublicado{std::string(Texto.substr(0, branco)), *tamanho};
}

std::string TextoDoArquivo(const ArquivoPublicado& Qual) { return Qual.Soma + " " + std::to_string(Qual.Tamanho); }
