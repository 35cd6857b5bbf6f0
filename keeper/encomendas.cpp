#include "keeper/encomendas.h"

#include "catalog/cls_DAT.h"
#include "collection/jogo.h"
#include "keeper/instalacao.h"
#include "keeper/lista.h"
#include "keeper/rom.h"
#include "platform/files.h"
#include "support/caminhos.h"
#include "support/mod_Globais.h"
#include "support/textos.h"

namespace {

std::string BaseDe(const std::string& rom) {
  const std::string nome = UltimaParte(rom);
  return NomeBase(nome).value_or(nome);
}

// Beside the ROM, under the game's name or the ROM's.
std::string FiguraAoLado(const std::string& rom, const std::string& nome) {
  const std::string diretorio = DiretorioDe(rom), figura = ImagemEm(diretorio, nome);
  return figura.empty() ? ImagemEm(diretorio, BaseDe(rom)) : figura;
}

Encomenda Completa(Encomenda encomenda) {
  if (encomenda.Nome.empty()) encomenda.Nome = BaseDe(encomenda.Rom);
  if (encomenda.Figura.empty()) encomenda.Figura = FiguraAoLado(encomenda.Rom, encomenda.Nome);
  return encomenda;
}

// The saved games of an installed game go by its file's name, and so does its DOS name.
std::vector<Encomenda> DaInstalacao(const std::string& diretorio, Relato& onde) {
  if (!UsarInstalacao(diretorio, onde)) return {};
  Catalogo().Carregar2();
  std::vector<Encomenda> encomendas;
  for (const auto& arquivo : platform::ListDirectory(DirRoms, PadraoRoms)) {
    const Jogo jogo = LerJogo(arquivo, "");
    encomendas.push_back({jogo.Arquivo, jogo.Arquivo, jogo.Nome, "", ImagemDoJogo(jogo.Nome)});
  }
  Catalogo().Fechar();
  if (encomendas.empty()) onde.Recusar(DirRoms, Traduzir(Texto::NenhumJogo));
  return encomendas;
}

// Paths of a list count from the list's own directory.
std::string Desde(const std::string& diretorio, const std::string& caminho) {
  const std::string pronto = ComBarras(caminho);
  const bool inteiro = pronto.empty() || pronto.starts_with('\\') || pronto.substr(1).starts_with(':');
  return inteiro ? pronto : diretorio + pronto;
}

std::vector<Encomenda> DaLista(const std::string& arquivo, Relato& onde) {
  const std::string diretorio = DiretorioDe(arquivo);
  std::vector<Encomenda> encomendas;
  for (const LinhaDaLista& linha : LerLista(arquivo, {"arquivo"}, onde)) {
    const auto campo = [&](const char* nome) { return linha.Campo(nome); };
    encomendas.push_back(Completa({linha.Onde, Desde(diretorio, campo("arquivo")), campo("nome"), campo("dos"),
                                   Desde(diretorio, campo("figura"))}));
  }
  return encomendas;
}

std::vector<Encomenda> DosArgumentos(const Pedido& feito) {
  std::vector<Encomenda> encomendas;
  for (const std::string& rom : feito.Arquivos) {
    encomendas.push_back(
        Completa({rom, rom, feito.Valor("--nome"), feito.Valor("--dos"), ComBarras(feito.Valor("--figura"))}));
  }
  return encomendas;
}

}  // namespace

std::vector<Encomenda> LerEncomendas(const Pedido& Feito, Relato& Onde) {
  if (Feito.Tem("--instalacao")) return DaInstalacao(Feito.Valor("--instalacao"), Onde);
  if (Feito.Tem("--lista")) return DaLista(ComBarras(Feito.Valor("--lista")), Onde);
  return DosArgumentos(Feito);
}
