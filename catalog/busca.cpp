#include "catalog/busca.h"

#include <string>

#include "support/caracteres.h"

std::optional<std::string_view> BuscarNome(std::string_view Dados, std::string_view Chave) {
  const std::size_t barra = Dados.find("|" + std::string(Chave) + "=");
  if (barra == std::string_view::npos) return std::nullopt;
  return NomeEm(Dados, barra + Chave.size() + 2);
}

std::optional<std::string_view> BuscarChave(std::string_view Dados, std::string_view Nome) {
  const std::size_t igual = Dados.find("=" + std::string(Nome) + "|");
  if (igual == std::string_view::npos) return std::nullopt;
  return ChaveAntesDe(Dados, igual);
}

std::string_view NomeEm(std::string_view Dados, std::size_t Inicio) {
  const std::string_view resto = Dados.substr(Inicio);
  return resto.substr(0, AcharCaractere(resto, '|'));
}

std::string_view ChaveAntesDe(std::string_view Dados, std::size_t Igual) {
  const std::size_t barra = AcharUltimo(Dados.substr(0, Igual), '|');
  const std::size_t inicio = barra == std::string_view::npos ? 0 : barra + 1;
  return Dados.substr(inicio, Igual - inicio);
}
