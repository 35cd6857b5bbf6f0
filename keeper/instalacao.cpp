#include "keeper/instalacao.h"

#include "keeper/arquivos.h"
#include "support/mod_Arquivos.h"
#include "support/mod_Configuracao.h"
#include "support/mod_Globais.h"
#include "support/textos.h"

bool UsarInstalacao(const std::string& Diretorio, Relato& Onde) {
  const std::string raiz = ComoDiretorio(Diretorio);
  if (raiz.empty() || !EhDiretorio(raiz)) {
    Onde.Recusar(Diretorio, Traduzir(Texto::NaoEhDiretorio));
    return false;
  }
  DirPrograma = raiz;
  DirRoms = raiz + "Roms\\";
  DirImgs = raiz + "Imgs\\";
  return true;
}

bool UsarConfigurada(Relato& Onde) {
  const std::string menu = DirPrograma + "tolvaris.exe";
  if (!ArquivoExiste(menu)) {
    Onde.Recusar(menu, Traduzir(Texto::SemMenu));
    return false;
  }
  LerCaminhos(cls_REG());
  return true;
}

bool TemUmArquivoEInstalacao(const Pedido& Feito, Relato& Onde) {
  if (!Feito.Tem("--instalacao")) {
    Onde.UsoErrado(Traduzir(Texto::FaltaAOpcao, {"--instalacao"}));
    return false;
  }
  if (Feito.Arquivos.size() == 1) return true;
  Onde.UsoErrado(Traduzir(Texto::SoUmArquivo));
  return false;
}
