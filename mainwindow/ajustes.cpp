#include "mainwindow/ajustes.h"

#include <charconv>

namespace {

constexpr int Margem = 255;  // twips of the window that a restored position must leave on the screen

}  // namespace

std::optional<std::int32_t> NumeroInteiro(std::string_view Texto) {
  const auto Inicio = Texto.find_first_not_of(' ');
  if (Inicio == std::string_view::npos) return std::nullopt;
  Texto = Texto.substr(Inicio, Texto.find_last_not_of(' ') - Inicio + 1);
  if (Texto.starts_with('+') && !Texto.starts_with("+-")) Texto.remove_prefix(1);
  std::int32_t Numero = 0;
  const char* Fim = Texto.data() + Texto.size();
  const auto [Lido, Erro] = std::from_chars(Texto.data(), Fim, Numero);
  if (Erro != std::errc{} || Lido != Fim) return std::nullopt;
  return Numero;
}

int EstadoDisquete(std::string_view Texto) { return NumeroInteiro(Texto) == 1 ? 1 : 0; }

std::optional<int> EsquerdaInicial(std::string_view Texto, int LarguraJanela, int LarguraTela) {
  if (Texto.empty()) return (LarguraTela - LarguraJanela) / 2;
  const auto Esquerda = NumeroInteiro(Texto);
  if (Esquerda && *Esquerda > Margem - LarguraJanela && *Esquerda < LarguraTela - Margem) return Esquerda;
  return std::nullopt;
}

std::optional<int> TopoInicial(std::string_view Texto, int AlturaJanela, int AlturaTela) {
  if (Texto.empty()) return (AlturaTela - AlturaJanela) / 2;
  const auto Topo = NumeroInteiro(Texto);
  if (Topo && *Topo > 0 && *Topo < AlturaTela - Margem) return Topo;
  return std::nullopt;
}
