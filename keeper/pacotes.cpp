#include "keeper/pacotes.h"

#include "keeper/arquivos.h"
#include "support/textos.h"

namespace {

void AcrescentarPacotes(std::vector<std::string>& pacotes, const std::string& argumento, Relato& onde) {
  if (!EhDiretorio(argumento)) {
    pacotes.push_back(argumento);
    return;
  }
  AcrescentarListados(pacotes, ComoDiretorio(argumento), "*.tvk", argumento, Texto::NenhumPacote, onde);
}

Texto MotivoDe(DefeitoDoPacote defeito) {
  switch (defeito) {
    case DefeitoDoPacote::SemChave:
      return Texto::CabecalhoIncompleto;
    case DefeitoDoPacote::NumeroErrado:
      return Texto::NumeroErrado;
    case DefeitoDoPacote::NomeInseguro:
      return Texto::NomeInseguro;
    default:
      return Texto::NaoEhPacote;
  }
}

Motivos LerEFazer(const std::string& arquivo, std::int64_t& tamanho, const ComPacote& fazer) {
  const Leitura lido = LerTudo(arquivo);
  tamanho = static_cast<std::int64_t>(lido.Conteudo.size());
  if (!lido.Falta.empty()) return {lido.Falta};
  const auto pacote = LerPacote(lido.Conteudo);
  if (!pacote) return {Traduzir(MotivoDe(DefeitoDe(lido.Conteudo)))};
  return fazer({arquivo, tamanho, *pacote});
}

// Whatever goes wrong unexpectedly is a want of memory.
Motivos SemExcecao(const std::string& arquivo, std::int64_t& tamanho, const ComPacote& fazer) {
  try {
    return LerEFazer(arquivo, tamanho, fazer);
  } catch (...) {
    return {Traduzir(Texto::SemMemoria)};
  }
}

}  // namespace

void ParaCadaPacote(const Pedido& Feito, Relato& Onde, const ComPacote& Fazer, const DepoisDoPacote& Depois) {
  std::vector<std::string> pacotes;
  for (const std::string& argumento : Feito.Arquivos) AcrescentarPacotes(pacotes, argumento, Onde);
  Onde.Comecar(pacotes.size());
  for (const std::string& arquivo : pacotes) {
    std::int64_t tamanho = 0;
    const Motivos porque = SemExcecao(arquivo, tamanho, Fazer);
    for (const std::string& cada : porque) Onde.Recusar(arquivo, cada);
    if (Depois) Depois(arquivo, porque);
    Onde.Andar(tamanho);
  }
  Onde.Terminar();
}
