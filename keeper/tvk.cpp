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
constexpr Opcao EmInstalacao = {"--instalacao", "DIR", Texto::OpcaoQualInstalacao};
constexpr Opcao OpcoesDeNomear[] = {EmInstalacao, {"--simular", "", Texto::OpcaoSimular}};
constexpr Opcao OpcoesDeDesfazer[] = {EmInstalacao};
constexpr Opcao OpcoesDeInstalar[] = {
    {"--instalacao", "DIR", Texto::OpcaoEmInstalacao},
    {"--substituir", "", Texto::OpcaoSubstituir},
};
constexpr Opcao OpcoesDePublicar[] = {
    {"--titulo", "T", Texto::OpcaoTitulo},        {"--espelho", "URL", Texto::OpcaoEspelho, true},
    {"--validade", "DIAS", Texto::OpcaoValidade}, {"--lista", "LISTA.csv", Texto::OpcaoListaDePublicar},
    {"--limpar", "", Texto::OpcaoLimpar},         {"--simular", "", Texto::OpcaoSimular},
    {"--chave", "ARQUIVO", Texto::OpcaoChave},    {"--repositorio", "DIR", Texto::OpcaoRepositorio},
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
    {"nomear", Texto::TvkNomear, {"tvk nomear --instalacao DIR [--simular] LISTA.csv"}, OpcoesDeNomear, Nomear},
    {"desfazer", Texto::TvkDesfazer, {"tvk desfazer --instalacao DIR ARQUIVO"}, OpcoesDeDesfazer, Desfazer},
    {"chave", Texto::TvkChave, {"tvk chave ARQUIVO"}, {}, FazerChave},
    {"publicar",
     Texto::TvkPublicar,
     {"tvk publicar [--titulo T] [--espelho URL]... [--validade DIAS] [--limpar]",
      "             [--lista LISTA.csv] [--simular] --chave ARQUIVO", "             --repositorio DIR PACOTE|DIR..."},
     OpcoesDePublicar,
     Publicar},
};

// A word and what it means.
std::string Explicada(std::string_view Palavra, std::size_t Largura, Texto Descricao) {
  std::string linha(Coluna, ' ');
  linha += Palavra;
  linha.resize(std::max(linha.size() + 1, Coluna + Largura), ' ');
  return linha + Traduzir(Descricao);
}

void AjudarComTudo(Relato& Onde) {
  Onde.Linha(Traduzir(Texto::TvkResumo));
  Onde.Linha("");
  Onde.Linha(Traduzir(Texto::TvkUso));
  Onde.Linha("");
  for (const Verbo& verbo : Verbos) Onde.Linha(Explicada(verbo.Nome, LarguraVerbos, verbo.Descricao));
  Onde.Linha("");
  for (const Texto texto : {Texto::TvkAjudaDeVerbo, Texto::TvkArquivos, Texto::TvkListas, Texto::TvkEstado}) {
    Onde.Linha(Traduzir(texto));
  }
}

void AjudarComVerbo(const Verbo& Qual, Relato& Onde) {
  for (const std::string_view uso : Qual.Usos) {
    if (!uso.empty()) Onde.Linha(std::string(uso));
  }
  Onde.Linha("");
  Onde.Linha(Explicada(Qual.Nome, LarguraOpcoes, Qual.Descricao));
  for (const Opcao& opcao : Qual.Opcoes) {
    Onde.Linha(Explicada(std::string(opcao.Nome) + " " + std::string(opcao.Valor), LarguraOpcoes, opcao.Descricao));
  }
}

bool PedeAjuda(std::span<const Argument> Argumentos) {
  for (const Argument& cada : Argumentos) {
    if (cada.Utf8 == "--") return false;
    if (cada.Utf8 == "--ajuda") return true;
  }
  return false;
}

bool TemFonte(const Verbo& Qual, const Pedido& Feito) {
  const bool naOpcao = Feito.Tem("--lista") || Feito.Tem("--instalacao");
  return !Feito.Arquivos.empty() || (Qual.SemArquivos && naOpcao);
}

void FazerVerbo(const Verbo& Qual, std::span<const Argument> Argumentos, Relato& Onde) {
  if (PedeAjuda(Argumentos)) return AjudarComVerbo(Qual, Onde);
  const Pedido feito = LerPedido(Argumentos, Qual.Opcoes, Onde);
  if (Onde.Estado() == 2) return;
  if (TemFonte(Qual, feito)) return Qual.Fazer(feito, Onde);
  if (Onde.Estado() == 0) Onde.UsoErrado(Traduzir(Texto::FaltamArquivos));  // else all were refused
}

void Fazer(std::span<const Argument> Argumentos, Relato& Onde) {
  if (Argumentos.empty()) return Onde.UsoErrado(Traduzir(Texto::FaltaOVerbo));
  const std::string& primeiro = Argumentos[0].Utf8;
  if (primeiro == "--ajuda" || primeiro == "/?") return AjudarComTudo(Onde);
  if (primeiro == "--versao") return Onde.Linha("tvk " TOLVARIS_VERSION);
  const auto* const verbo = std::ranges::find(Verbos, primeiro, &Verbo::Nome);
  if (verbo == std::end(Verbos)) return Onde.UsoErrado(Traduzir(Texto::VerboDesconhecido, {primeiro}));
  FazerVerbo(*verbo, Argumentos.subspan(1), Onde);
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
