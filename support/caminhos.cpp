#include "support/caminhos.h"

#include <string_view>

#include "platform/text.h"

std::string DiretorioDe(const std::string& Caminho) { return Caminho.substr(0, Caminho.rfind('\\') + 1); }

std::string ComBarra(const std::string& Diretorio) {
  return Diretorio.ends_with('\\') || Diretorio.ends_with('/') ? Diretorio : Diretorio + '\\';
}

std::string UltimaParte(const std::string& Caminho) { return Caminho.substr(Caminho.rfind('\\') + 1); }

std::optional<std::string> NomeBase(const std::string& NomeDoArquivo) {
  const auto ponto = NomeDoArquivo.rfind('.');
  if (ponto == std::string::npos) return std::nullopt;
  return NomeDoArquivo.substr(0, ponto);
}

std::string SoDeNomeDeArquivo(const std::string& Texto) {
  constexpr std::string_view proibidos = "<>:\"/\\|?*";
  std::string nome;
  for (const char letra : Texto) {
    if (static_cast<unsigned char>(letra) >= ' ' && proibidos.find(letra) == std::string_view::npos) nome += letra;
  }
  return nome;
}

std::string TipoDoArquivo(const std::string& Caminho) {
  return platform::CharUpperBuffA(Caminho.size() > 3 ? Caminho.substr(Caminho.size() - 3) : Caminho);
}
