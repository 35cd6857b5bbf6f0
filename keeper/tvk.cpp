#include "keeper/tvk.h"

#include <algorithm>
#include <array>
#include <iterator>
#include <span>

#include "keeper/argumentos.h"
#include "keeper/verbos.h"
#include "platform/console.h"
#include "support/mod_Configuracao.h"
#include "support/textos.h"

namespace {

using platform::Argument;

constexpr std::size_t Coluna = 2;          // where the help's tables begin
constexpr std::size_t LarguraVerbos = 12;  // characters up to the description
constexpr std::size_t LarguraOpcoes = 20;

constexpr Opcao Saida = {"--saida", "DIR", Texto::OpcaoSaida}, Csv = {"--csv", "", Texto::OpcaoCsv};

constexpr Opcao OpcoesDeCriar[] = {
    {"--nome", "NOME", Texto::OpcaoNome},        {"--dos", "DOS", Texto::OpcaoDOS},
    {"--figura", "ARQUIVO", Texto::OpcaoFigura}, {"--instalacao", "DIR", Texto::OpcaoDeInstalacao},
    {"--lista", "LISTA.csv", Texto::OpcaoLista}, Saida,
};
constexpr Opcao OpcoesDeListar[] = {Csv};
constexpr Opcao OpcoesDeExtrair[] = {Saida};
constexpr Opcao OpcoesDeInstalar[] = {
    {"--instalacao", "DIR", Texto::OpcaoEmInstalacao},
    {"--substituir", "", Texto::OpcaoSubstituir},
};

struct Verbo {
  std::string_view Nome;
  Texto Descricao;
  std::array<std::string_view, 3> Usos;  // the empty ones behind the last are none
  std::span<const Opcao> Opcoes;
  void (*Fazer)(const Pedido&, Relato&);
  bool SemArquivos = false;  // an option may name what it works on
};

constexpr Verbo Verbos[] = {
    {"criar",
     Texto::TvkCriar,
     {"tvk criar [--nome NOME] [--dos DOS] [--figura ARQUIVO] [--saida DIR] ROM...",
      "tvk criar --instalacao DIR [--saida DIR]", "tvk criar --lista LISTA.csv [--saida DIR]"},
     OpcoesDeCriar,
     Criar,
     true},
    {"listar", Texto::TvkListar, {"tvk listar [--csv] PACOTE|DIR..."}, OpcoesDeListar, Listar},
    {"verificar", Texto::TvkVerificar, {"tvk verificar [--csv] PACOTE|DIR..."}, OpcoesDeListar, Verificar},
    {"extrair", Texto::TvkExtrair, {"tvk extrair [--saida DIR] PACOTE..."}, OpcoesDeExtrair, Extrair},
    {"instalar",
     Texto::TvkInstalar,
     {"tvk instalar [--instalacao DIR] [--substituir] PACOTE..."},
     OpcoesDeInstalar,
     Instalar},
};

// A word and what it means.
std::string Explicada(std::string_view palavra, std::size_t largura, Texto descricao) {
  std::string linha(Coluna, ' ');
  linha += palavra;
  linha.resize(std::max(linha.size() + 1, Coluna + largura), ' ');
  return linha + Traduzir(descricao);
}

void AjudarComTudo(Relato& onde) {
  onde.Linha(Traduzir(Texto::TvkResumo));
  onde.Linha("");
  onde.Linha(Traduzir(Texto::TvkUso));
  onde.Linha("");
  for (const Verbo& verbo : Verbos) onde.Linha(Explicada(verbo.Nome, LarguraVerbos, verbo.Descricao));
  onde.Linha("");
  for (const Texto texto : {Texto::TvkAjudaDeVerbo, Texto::TvkArquivos, Texto::TvkListas, Texto::TvkEstado}) {
    onde.Linha(Traduzir(texto));
  }
}

void AjudarComVerbo(const Verbo& verbo, Relato& onde) {
  for (const std::string_view uso : verbo.Usos) {
    if (!uso.empty()) onde.Linha(std::string(uso));
  }
  onde.Linha("");
  onde.Linha(Explicada(verbo.Nome, LarguraOpcoes, verbo.Descricao));
  for (const Opcao& opcao : verbo.Opcoes) {
    onde.Linha(Explicada(std::string(opcao.Nome) + " " + std::string(opcao.Valor), LarguraOpcoes, opcao.Descricao));
  }
}

bool PedeAjuda(std::span<const Argument> argumentos) {
  for (const Argument& cada : argumentos) {
    if (cada.Utf8 == "--") return false;
    if (cada.Utf8 == "--ajuda") return true;
  }
  return false;
}

bool TemFonte(const Verbo& verbo, const Pedido& feito) {
  const bool naOpcao = feito.Tem("--lista") || feito.Tem("--instalacao");
  return !feito.Arquivos.empty() || (verbo.SemArquivos && naOpcao);
}

void FazerVerbo(const Verbo& verbo, std::span<const Argument> argumentos, Relato& onde) {
  if (PedeAjuda(argumentos)) return AjudarComVerbo(verbo, onde);
  const Pedido feito = LerPedido(argumentos, verbo.Opcoes, onde);
  if (onde.Estado() == 2) return;
  if (TemFonte(verbo, feito)) return verbo.Fazer(feito, onde);
  if (onde.Estado() == 0) onde.UsoErrado(Traduzir(Texto::FaltamArquivos));  // else all were refused
}

void Fazer(std::span<const Argument> argumentos, Relato& onde) {
  if (argumentos.empty()) return onde.UsoErrado(Traduzir(Texto::FaltaOVerbo));
  const std::string& primeiro = argumentos[0].Utf8;
  if (primeiro == "--ajuda" || primeiro == "/?") return AjudarComTudo(onde);
  if (primeiro == "--versao") return onde.Linha("tvk " TOLVARIS_VERSION);
  const auto* const verbo = std::ranges::find(Verbos, primeiro, &Verbo::Nome);
  if (verbo == std::end(Verbos)) return onde.UsoErrado(Traduzir(Texto::VerboDesconhecido, {primeiro}));
  FazerVerbo(*verbo, argumentos.subspan(1), onde);
}

}  // namespace

int Tvk() {
  DefinirDirPrograma();
  EscolherIdioma();
  Relato onde;
  const std::vector<Argument> argumentos = ComListas(platform::CommandLineArguments(), onde);
  Fazer(argumentos, onde);
  return onde.Estado();
}
