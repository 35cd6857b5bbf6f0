// What `publicar` is asked for.
#pragma once

#include <optional>
#include <string>

#include "keeper/argumentos.h"
#include "keeper/publicacao.h"
#include "platform/signature.h"

struct PedidoDePublicacao {
  Desejo Entrada;
  platform::SigningKey Chave;
  Repositorio Destino;
  std::string Lista;  // path; empty: none
  bool Limpar, Simular;
};

// Nothing, and told, where an option is missing or wrong, or the key cannot be used.
std::optional<PedidoDePublicacao> LerPublicacao(const Pedido& Feito, Relato& Onde);
