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

std::string BaseDe(const std::string& Rom) {
  const std::string nome = UltimaParte(Rom);
  return NomeBase(nome).value_or(nome);
}

// Beside the ROM, under the game's name or the ROM's.
std::string FiguraAoLado(const std::string& Rom, const std::string& Nome) {
  const std::string diretorio = DiretorioDe(Rom), figura = ImagemEm(diretorio, Nome);
  return figura.empty() ? ImagemEm(diretorio, BaseDe(Rom)) : figura;
}

Encomenda Completa(Encomenda Pedida) {
  if (Pedida.Nome.empty()) Pedida.Nome = BaseDe(Pedida.Rom);
  if (Pedida.Figura.empty()) Pedida.Figura = FiguraAoLado(Pedida.Rom, Pedida.Nome);
  return Pedida;
}

// The saved games of an installed game go by its file's name, and so does its DOS name.
std::vector<Encomenda> DaInstalacao(const std::string& Diretorio, Relato& Onde) {
  if (!UsarInstalacao(Diretorio, Onde)) return {};
  Catalogo().Carregar2();
  std::vector<Encomenda> encomendas;
  for (const auto& arquivo : platform::ListDirectory(DirRoms, PadraoRoms)) {
    const Jogo jogo = LerJogo(arquivo, "");
    encomendas.push_back({jogo.Arquivo, jogo.Arquivo, jogo.Nome, "", ImagemDoJogo(jogo.Nome)});
  }
  Catalogo().Fechar();
  if (encomendas.empty()) Onde.Recusar(DirRoms, Traduzir(Texto::NenhumJogo));
  return encomendas;
}

// Paths of a list count from the list's own directory.
std::string Desde(const std::string& Diretorio, const std::string& Caminho) {
  const std::string pronto = CaminhoDoWindows(Caminho);
  const bool inteiro = pronto.empty() || pronto.starts_with('\\') || pronto.substr(1).starts_with(':');
  return inteiro ? pronto : Diretorio + pronto;
}

std::vector<Encomenda> DaLista(const std::string& Arquivo, Relato& Onde) {
  const std::string diretorio = DiretorioDe(Arquivo);
  std::vector<Encomenda> encomendas;
  for (const LinhaDaLista& linha : LerLista(Arquivo, {"arquivo"}, Onde)) {
    const auto campo = [&](const char* Nome) { return linha.Campo(Nome); };
    encomendas.push_back(Completa({linha.Onde, Desde(diretorio, campo("arquivo")), campo("nome"), campo("dos"),
                                   Desde(diretorio, campo("figura"))}));
  }
  return encomendas;
}

std::vector<Encomenda> DosArgumentos(const Pedido& Feito) {
  std::vector<Encomenda> encomendas;
  for (const std::string& rom : Feito.Arquivos) {
    encomendas.push_back(
        Completa({rom, rom, Feito.Valor("--nome"), Feito.Valor("--dos"), CaminhoDoWindows(Feito.Valor("--figura"))}));
  }
  return encomendas;
}

}  // namespace

std::vector<Encomenda> LerEncomendas(const Pedido& Feito, Relato& Onde) {
  if (Feito.Tem("--instalacao")) return DaInstalacao(Feito.Valor("--instalacao"), Onde);
  if (Feito.Tem("--lista")) return DaLista(CaminhoDoWindows(Feito.Valor("--lista")), Onde);
  return DosArgumentos(Feito);
}
