#include "support/caminhos.h"

#include <string_view>

#include "platform/text.h"
#include "support/caracteres.h"

std::string DiretorioDe(const std::string& Caminho) { return Caminho.substr(0, AcharUltimo(Caminho, '\\') + 1); }

std::string ComBarra(const std::string& Diretorio) {
  return TerminaCom(Diretorio, '\\') || Diretorio.ends_with('/') ? Diretorio : Diretorio + '\\';
}

std::string UltimaParte(const std::string& Caminho) { return Caminho.substr(AcharUltimo(Caminho, '\\') + 1); }

std::optional<std::string> NomeBase(const std::string& NomeDoArquivo) {
  const auto ponto = NomeDoArquivo.rfind('.');
  if (ponto == std::string::npos) return std::nullopt;
  return NomeDoArquivo.substr(0, ponto);
}

std::string SoDeNomeDeArquivo(const std::string& Texto) {
  constexpr std::string_view proibidos = "<>:\"/\\|?*";
  std::string nome;
  for (std::size_t i = 0; i < Texto.size(); ++i) {
    const bool proibido =
        static_cast<unsigned char>(Texto[i]) < ' ' || proibidos.find(Texto[i]) != std::string_view::npos;
    if (!proibido || !platform::CharacterBeginsAt(Texto, i)) nome += Texto[i];
  }
  return nome;
}

std::string TipoDoArquivo(const std::string& Caminho) {
  return platform::CharUpperBuffA(Caminho.size() > 3 ? Caminho.substr(Caminho.size() - 3) : Caminho);
}
