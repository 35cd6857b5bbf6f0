#include "autoconfig/forma_nova.h"

#include "platform/text.h"
#include "support/caracteres.h"

namespace {

constexpr std::string_view ChaveRoms = "ROMPath=", ChaveSaves = "SRAMPath=";
constexpr auto Nada = std::string_view::npos;

// The first position from `Posicao` on where a line begins with the key.
std::size_t AcharLinha(std::string_view Texto, std::string_view Chave, std::size_t Posicao = 0) {
  for (auto achado = Texto.find(Chave, Posicao); achado != Nada; achado = Texto.find(Chave, achado + 1)) {
    if (achado == 0 || Texto[achado - 1] == '\n') return achado;
  }
  return Nada;
}

// The end of the value that begins there: behind its closing quote, or where the line ends.
std::size_t FimDoValor(std::string_view Texto, std::size_t Inicio) {
  const bool aspas = Inicio < Texto.size() && Texto[Inicio] == '"';
  for (std::size_t i = Inicio + (aspas ? 1 : 0); i < Texto.size(); ++i) {
    if (Texto[i] == '\r' || Texto[i] == '\n') return i;
    if (aspas && Texto[i] == '"') return i + 1;
    if (aspas && Texto[i] == '\\' && i + 1 < Texto.size() && Texto[i + 1] == '\\') ++i;
  }
  return Texto.size();
}

// The directory as the emulator writes it: without its last backslash, but for that of a disk's root.
std::string ValorDe(std::string Diretorio) {
  if (TerminaCom(Diretorio, '\\') && !Diretorio.ends_with(":\\")) Diretorio.pop_back();
  std::string valor = "\"";
  for (const char caractere : Diretorio) valor.append(caractere == '\\' ? 2 : 1, caractere);
  return valor + '"';
}

// A value in a form in which those of the same directory are equal.
std::string Comparavel(std::string_view Valor) {
  std::string texto = platform::CharUpperBuffA(std::string(Valor));
  if (texto.ends_with("\\\\\"")) texto.erase(texto.size() - 3, 2);
  return texto;
}

// Sets the value on each line of the key. True when one had to change.
bool Definir(std::string& Texto, std::string_view Chave, const std::string& Valor) {
  bool mudou = false, achou = false;
  std::string resultado;
  std::size_t copiado = 0;
  for (auto linha = AcharLinha(Texto, Chave); linha != Nada; linha = AcharLinha(Texto, Chave, copiado)) {
    const std::size_t inicio = linha + Chave.size(), fim = FimDoValor(Texto, inicio);
    const std::string antigo = Texto.substr(inicio, fim - inicio);
    const bool igual = Comparavel(antigo) == Comparavel(Valor);
    resultado.append(Texto, copiado, inicio - copiado).append(igual ? antigo : Valor);
    copiado = fim;
    achou = true;
    mudou = mudou || !igual;
  }
  resultado.append(Texto, copiado);
  if (!achou) {
    const std::string_view fimDeLinha = Texto.find("\r\n") != std::string::npos ? "\r\n" : "\n";
    if (!resultado.ends_with('\n')) resultado.append(fimDeLinha);
    resultado.append(Chave).append(Valor).append(fimDeLinha);
  }
  Texto = std::move(resultado);
  return mudou || !achou;
}

}  // namespace

bool FormaNova(std::string_view Texto) {
  return AcharLinha(Texto, ChaveRoms) != Nada || AcharLinha(Texto, ChaveSaves) != Nada;
}

std::optional<std::string> ComDiretorios(std::string_view Texto, const std::string& Roms, const std::string& Saves) {
  std::string novo(Texto);
  const bool mudouRoms = Definir(novo, ChaveRoms, ValorDe(Roms));
  const bool mudouSaves = Definir(novo, ChaveSaves, ValorDe(Saves));
  if (!mudouRoms && !mudouSaves) return std::nullopt;
  return novo;
}
