// What a publication changes: functions of what stands in a repository and of what is wanted.
#pragma once

#include <cstdint>
#include <optional>
#include <set>
#include <string>
#include <vector>

#include "keeper/repositorio.h"

// What may be wanted of the entry; what is not given stays as it is.
struct Desejo {
  std::optional<std::string> Titulo;  // UTF-8
  std::optional<std::vector<std::string>> Espelhos;
  std::optional<std::int64_t> Validade;  // seconds
};

// The entry for this index at this moment, in seconds since 1970, without a key; nothing when no title is known.
std::optional<EntradaDoRepositorio> NovaEntrada(const std::optional<EntradaDoRepositorio>& Anterior,
                                                const Desejo& Pedido, const ArquivoPublicado& Indice,
                                                std::int64_t Agora);

// Whether the entry that is there says the same as the new one, and more than half of the time for which it is valid
// remains.
bool PodeFicar(const std::optional<EntradaDoRepositorio>& Anterior, const EntradaDoRepositorio& Nova,
               std::int64_t Agora);

enum class Novidade { Novo, Mudou, Saiu };

struct JogoMudado {
  Novidade Como;
  std::string NomeDOS, Nome;  // UTF-8
};

// Which games differ, in the order of their DOS names, by which a game goes.
std::vector<JogoMudado> Diferencas(const std::vector<JogoPublicado>& Antes, const std::vector<JogoPublicado>& Depois);

// The files that these games and their index need.
std::set<std::string> ArquivosDe(const ArquivoPublicado& Indice, const std::vector<JogoPublicado>& Jogos);
