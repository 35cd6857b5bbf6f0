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

// Where the line that holds `Posicao` ends. Files edited elsewhere may have a lone LF.
std::size_t FimDaLinha(const std::string& Texto, std::size_t Posicao) {
  const auto fim = Texto.find('\n', Posicao);
  if (fim == std::string::npos) return Texto.size();
  return fim > Posicao && Texto[fim - 1] == '\r' ? fim - 1 : fim;
}

// Every occurrence, from the start; in one pass, since a hostile file can hold very many.
std::string TrocarTodas(const std::string& Texto, const std::string& Antigo, const std::string& Novo) {
  std::string resultado;
  std::size_t posicao = 0;
  for (auto achado = Texto.find(Antigo); achado != std::string::npos; achado = Texto.find(Antigo, posicao)) {
    resultado.append(Texto, posicao, achado - posicao).append(Novo);
    posicao = achado + Antigo.size();
  }
  return resultado.append(Texto, posicao);
}

// True when the text had to change. The last occurrence of the key is the one that the emulator reads; the blank
// after the "=" is no part of the search.
bool AtualizarEntrada(std::string& Texto, const Entrada& Nova) {
  const std::string chave = platform::CharUpperBuffA(std::string(Nova.Chave.substr(0, Nova.Chave.size() - 1)));
  const auto inicio = platform::CharUpperBuffA(Texto).rfind(chave);
  if (inicio == std::string::npos) {
    Texto.append(FimDeLinha).append(Nova.Linha).append(FimDeLinha);
    return true;
  }
  const std::string antiga = Texto.substr(inicio, FimDaLinha(Texto, inicio) - inicio);
  if (platform::CharUpperBuffA(antiga) == platform::CharUpperBuffA(Nova.Linha)) return false;
  Texto = TrocarTodas(Texto, antiga, Nova.Linha);
  return true;
}

}  // namespace

std::string ConfiguracaoInicial(const std::string& DirSaves, const std::string& DirRoms) {
  return std::string(FimDeLinha)
      .append(EntradaSaves(DirSaves).Linha)
      .append(FimDeLinha)
      .append(EntradaRoms(DirRoms).Linha)
      .append(FimDeLinha);
}

std::optional<std::string> ConfiguracaoAtualizada(std::string Texto, const std::string& DirSaves,
                                                  const std::string& DirRoms) {
  const bool mudouSaves = AtualizarEntrada(Texto, EntradaSaves(DirSaves));
  const bool mudouRoms = AtualizarEntrada(Texto, EntradaRoms(DirRoms));
  if (!mudouSaves && !mudouRoms) return std::nullopt;
  return Texto;
}
