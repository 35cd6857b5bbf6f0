#include "keeper/pacotes.h"

#include "keeper/arquivos.h"
#include "support/textos.h"

namespace {

void AcrescentarPacotes(std::vector<std::string>& Pacotes, const std::string& Argumento, Relato& Onde) {
  if (!EhDiretorio(Argumento)) {
    Pacotes.push_back(Argumento);
    return;
  }
  AcrescentarListados(Pacotes, ComoDiretorio(Argumento), "*.tvk", Argumento, Texto::NenhumPacote, Onde);
}

Texto MotivoDe(DefeitoDoPacote Defeito) {
  switch (Defeito) {
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

Motivos LerEFazer(const std::string& Arquivo, std::int64_t& Tamanho, const ComPacote& Fazer) {
  const Leitura lido = LerTudo(Arquivo);
  Tamanho = static_cast<std::int64_t>(lido.Conteudo.size());
  if (!lido.Falta.empty()) return {lido.Falta};
  const auto pacote = LerPacote(lido.Conteudo);
  if (!pacote) return {Traduzir(MotivoDe(DefeitoDe(lido.Conteudo)))};
  return Fazer({Arquivo, Tamanho, *pacote, lido.Conteudo});
}

// Whatever goes wrong unexpectedly is a want of memory.
Motivos SemExcecao(const std::string& Arquivo, std::int64_t& Tamanho, const ComPacote& Fazer) {
  try {
    return LerEFazer(Arquivo, Tamanho, Fazer);
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
