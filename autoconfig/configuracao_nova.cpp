#include "autoconfig/configuracao_nova.h"

#include "platform/text.h"

namespace {

constexpr std::string_view ChaveRoms = "ROMPath=", ChaveSaves = "SRAMPath=";
constexpr auto Nada = std::string_view::npos;

// The first position from `Posicao` on where a line begins with the key.
std::size_t AcharLinha(std::string_view Texto, std::string_view Chave, std::size_t Posicao = 0) {
  for (auto Achado = Texto.find(Chave, Posicao); Achado != Nada; Achado = Texto.find(Chave, Achado + 1)) {
    if (Achado == 0 || Texto[Achado - 1] == '\n') return Achado;
  }
  return Nada;
}

// The end of the value that begins there: behind its closing quote, or where the line ends.
std::size_t FimDoValor(std::string_view Texto, std::size_t Inicio) {
  const bool Aspas = Inicio < Texto.size() && Texto[Inicio] == '"';
  for (std::size_t i = Inicio + (Aspas ? 1 : 0); i < Texto.size(); ++i) {
    if (Texto[i] == '\r' || Texto[i] == '\n') return i;
    if (Aspas && Texto[i] == '"') return i + 1;
    if (Aspas && Texto[i] == '\\' && i + 1 < Texto.size() && Texto[i + 1] == '\\') ++i;
  }
  return Texto.size();
}

// The directory as the emulator writes it: without its last backslash, but for that of a disk's root.
std::string ValorDe(std::string Diretorio) {
  if (Diretorio.ends_with('\\') && !Diretorio.ends_with(":\\")) Diretorio.pop_back();
  std::string Valor = "\"";
  for (const char Caractere : Diretorio) Valor.append(Caractere == '\\' ? 2 : 1, Caractere);
  return Valor + '"';
}

// A value in a form in which those of the same directory are equal.
std::string Comparavel(std::string_view Valor) {
  std::string Texto = platform::CharUpperBuffA(std::string(Valor));
  if (Texto.ends_with("\\\\\"")) Texto.erase(Texto.size() - 3, 2);
  return Texto;
}

// Sets the value on each line of the key. True when one had to change.
bool Definir(std::string& Texto, std::string_view Chave, const std::string& Valor) {
  bool Mudou = false, Achou = false;
  std::string Resultado;
  std::size_t Copiado = 0;
  for (auto Linha = AcharLinha(Texto, Chave); Linha != Nada; Linha = AcharLinha(Texto, Chave, Copiado)) {
    const std::size_t Inicio = Linha + Chave.size(), Fim = FimDoValor(Texto, Inicio);
    const std::string Antigo = Texto.substr(Inicio, Fim - Inicio);
    const bool Igual = Comparavel(Antigo) == Comparavel(Valor);
    Resultado.append(Texto, Copiado, Inicio - Copiado).append(Igual ? Antigo : Valor);
    Copiado = Fim;
    Achou = true;
    Mudou = Mudou || !Igual;
  }
  Resultado.append(Texto, Copiado);
  if (!Achou) {
    const std::string_view FimDeLinha = Texto.find("\r\n") != std::string::npos ? "\r\n" : "\n";
    if (!Resultado.ends_with('\n')) Resultado.append(FimDeLinha);
    Resultado.append(Chave).append(Valor).append(FimDeLinha);
  }
  Texto = std::move(Resultado);
  return Mudou || !Achou;
}

}  // namespace

bool FormaNova(std::string_view Texto) {
  return AcharLinha(Texto, ChaveRoms) != Nada || AcharLinha(Texto, ChaveSaves) != Nada;
}

std::optional<std::string> ComDiretorios(std::string_view Texto, const std::string& Roms, const std::string& Saves) {
  std::string Novo(Texto);
  const bool MudouRoms = Definir(Novo, ChaveRoms, ValorDe(Roms));
  const bool MudouSaves = Definir(Novo, ChaveSaves, ValorDe(Saves));
  if (!MudouRoms && !MudouSaves) return std::nullopt;
  return Novo;
}
