// The entry of a repository, entrada.txt: the one file of it that changes, small and signed.
#pragma once

#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "platform/signature.h"
#include "repository/estrofes.h"
#include "repository/valores.h"

inline constexpr const char* NomeDaEntrada = "entrada.txt";
inline constexpr std::size_t MaiorEntrada = 64 << 10, MaiorIndice = 16 << 20;  // bytes
inline constexpr std::int64_t MaiorSerie = 999'999'999'999'999;
inline constexpr std::size_t MaisEspelhos = 8;

struct EntradaDoRepositorio {
  std::string Titulo;  // UTF-8
  std::int64_t Serie = 0;
  std::int64_t Publicado = 0, Validade = 0;  // seconds since 1970
  ArquivoPublicado Indice;
  std::vector<std::string> Espelhos;  // base addresses
  platform::PublicKey Chave = {};

  bool operator==(const EntradaDoRepositorio&) const = default;
};

struct EntradaLida {
  EntradaDoRepositorio Entrada;
  Recusa Porque;
};

// Of bytes as they came: whole, and rightly signed by the key that they name. Whether that is the key of somebody who
// is trusted, and whether the entry is old, is for the caller to look at.
EntradaLida LerEntrada(std::string_view Conteudo);

// The same without a look at the signature.
EntradaLida LerEntradaSemAssinatura(std::string_view Conteudo);

// The bytes of an entry, with the key's public part and its signature. Nothing when the system does not sign, and where
// LerEntrada would refuse them.
std::optional<std::string> AssinarEntrada(EntradaDoRepositorio Entrada, const platform::SigningKey& Chave);

// Where the index lies, from the repository's own directory.
std::string ArquivoDoIndice(const ArquivoPublicado& Indice);
