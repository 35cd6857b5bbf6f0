#include "mainwindow/configuracao_emulador.h"

#include <string_view>

#include "platform/text.h"

namespace {

constexpr std::string_view FimDeLinha = "\r\n";

struct Entrada {
  std::string_view Chave;  // as the emulator writes it, up to the value
  std::string Linha;       // the whole line that is wanted
};

Entrada NovaEntrada(std::string_view Chave, std::string_view Diretorio) {
  return {Chave, std::string(Chave) + std::string(Diretorio.substr(0, Diretorio.empty() ? 0 : Diretorio.size() - 1))};
}

Entrada EntradaSaves(const std::string& DirSaves) { return NovaEntrada("SaveDirectory = ", DirSaves); }
Entrada EntradaRoms(const std::string& DirRoms) { return NovaEntrada("GameDirectory = ", DirRoms); }

// Where the line that holds `posicao` ends. Files edited elsewhere may have a lone LF.
std::size_t FimDaLinha(const std::string& Texto, std::size_t Posicao) {
  const auto Fim = Texto.find('\n', Posicao);
  if (Fim == std::string::npos) return Texto.size();
  return Fim > Posicao && Texto[Fim - 1] == '\r' ? Fim - 1 : Fim;
}

// Every occurrence, from the start; in one pass, since a hostile file can hold very many.
std::string Substituir(const std::string& Texto, const std::string& Antigo, const std::string& Novo) {
  std::string Resultado;
  std::size_t Posicao = 0;
  for (auto Achado = Texto.find(Antigo); Achado != std::string::npos; Achado = Texto.find(Antigo, Posicao)) {
    Resultado.append(Texto, Posicao, Achado - Posicao).append(Novo);
    Posicao = Achado + Antigo.size();
  }
  return Resultado.append(Texto, Posicao);
}

// True when the text had to change. The last occurrence of the key is the one that the emulator reads; the blank
// after the "=" is no part of the search.
bool AtualizarEntrada(std::string& Texto, const Entrada& Nova) {
  const std::string Chave = platform::CharUpperBuffA(std::string(Nova.Chave.substr(0, Nova.Chave.size() - 1)));
  const auto Inicio = platform::CharUpperBuffA(Texto).rfind(Chave);
  if (Inicio == std::string::npos) {
    Texto.append(FimDeLinha).append(Nova.Linha).append(FimDeLinha);
    return true;
  }
  const std::string Antiga = Texto.substr(Inicio, FimDaLinha(Texto, Inicio) - Inicio);
  if (platform::CharUpperBuffA(Antiga) == platform::CharUpperBuffA(Nova.Linha)) return false;
  Texto = Substituir(Texto, Antiga, Nova.Linha);
  return true;
}

}  // namespace

std::string ConfiguracaoNova(const std::string& DirSaves, const std::string& DirRoms) {
  return std::string(FimDeLinha)
      .append(EntradaSaves(DirSaves).Linha)
      .append(FimDeLinha)
      .append(EntradaRoms(DirRoms).Linha)
      .append(FimDeLinha);
}

std::optional<std::string> ConfiguracaoAtualizada(std::string Texto, const std::string& DirSaves,
                                                  const std::string& DirRoms) {
  const bool MudouSaves = AtualizarEntrada(Texto, EntradaSaves(DirSaves));
  const bool MudouRoms = AtualizarEntrada(Texto, EntradaRoms(DirRoms));
  if (!MudouSaves && !MudouRoms) return std::nullopt;
  return Texto;
}
