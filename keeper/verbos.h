// The verbs of tvk: each takes what was asked for, and tells what it does.
#pragma once

#include "keeper/argumentos.h"
#include "keeper/relato.h"

void Criar(const Pedido& Feito, Relato& Onde);
void Listar(const Pedido& Feito, Relato& Onde);
void Verificar(const Pedido& Feito, Relato& Onde);
void Extrair(const Pedido& Feito, Relato& Onde);
void Instalar(const Pedido& Feito, Relato& Onde);
void Nomear(const Pedido& Feito, Relato& Onde);
void Desfazer(const Pedido& Feito, Relato& Onde);
void FazerChave(const Pedido& Feito, Relato& Onde);
void Publicar(const Pedido& Feito, Relato& Onde);
