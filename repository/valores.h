// The values that the lines of a repository's files have. A text that is not the one way to write its value is none.
#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

#include "platform/hash.h"
#include "repository/estrofes.h"

// A number from 0 to this one, without leading zeros.
std::optional<std::int64_t> LerNumero(std::string_view Texto, std::int64_t Maior);

// A moment, in seconds since 1970, as "2026-11-23T10:00:00Z"; the years 1970 to 9999.
std::optional<std::int64_t> LerInstante(std::string_view Texto);
std::string TextoDoInstante(std::int64_t Segundos);

// Small hexadecimal digits, two a byte; whether a text is those of a SHA-256.
std::string EmHexadecimal(const platform::Sha256Value& Soma);
bool EhSoma(std::string_view Texto);

// Whether a mirror may have this base address: https, without user, query and fragment, with a slash at its end.
bool EhEspelho(std::string_view Endereco);

// A file that is called as its content's SHA-256.
struct ArquivoPublicado {
  std::string Soma;          // 64 hexadecimal digits
  std::int64_t Tamanho = 0;  // bytes

  bool operator==(const ArquivoPublicado&) const = default;
};

// "<sha256> <length>", of at most so many bytes.
std::optional<ArquivoPublicado> LerArquivoPublicado(std::string_view Texto, std::int64_t Maior);
std::string TextoDoArquivo(const ArquivoPublicado& Qual);

// Takes the values out of a stanza. The first one that is missing or wrong is the reason to refuse it.
class LeitorDeValores {
 public:
  LeitorDeValores(const Estrofe& Onde, Recusa& Porque) : onde_(Onde), porque_(Porque) {}

  // What `Ler` makes of the value: an optional, which is empty for a wrong one. Without the key, `Lido` stays.
  template <typename T, typename Funcao>
  void Opcional(std::string_view Chave, T& Lido, Funcao Ler) {
    const auto campo = onde_.Achar(Chave);
    if (!campo || porque_.Qual != Recusa::Tipo::Nenhuma) return;
    std::optional<T> valor = Ler(campo->Valor);
    if (valor) {
      Lido = std::move(*valor);
    } else {
      porque_ = {Recusa::Tipo::ValorErrado, campo->Linha, std::string(Chave)};
    }
  }

  // The same of a key that has to be there.
  template <typename T, typename Funcao>
  void Exigido(std::string_view Chave, T& Lido, Funcao Ler) {
    Opcional(Chave, Lido, Ler);
    if (porque_.Qual != Recusa::Tipo::Nenhuma || onde_.Achar(Chave)) return;
    porque_ = {Recusa::Tipo::FaltaChave, onde_.Campos.front().Linha, std::string(Chave)};
  }

 private:
  const Estrofe& onde_;
  Recusa& porque_;
};

// Any text.
inline std::optional<std::string> LerTexto(std::string_view Texto) { return std::string(Texto); }
