// The texts that the windows show beside their messages and the captions of their controls: as data, like those.
#pragma once

#include <span>
#include <string>
#include <string_view>

enum class Texto {
  Carregando,
  Jogador1,
  Jogador2,
  Adicionar,
  ArquivosSuportados,
  SalvarComo,
  ArquivoTolvaris,
  ArquivoZip,
  ArquivoSmc,
  Copiando,
  CopiarParaDisquete,
  CopiarParaComputador,
  Procurando,
  BuscaConcluida,
  NenhumEmulador,
  ProcurarEmulador,
  EmuladorZsnes,
  Programas,
};

// All of them, UTF-8, in the order of their names above.
std::span<const std::string_view> TodosOsTextos();

// In the ANSI code page, translated.
std::string Traduzir(Texto Qual);
