#include "keeper/pacotes.h"

#include <iterator>

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

// Reads one package after the other into the same memory.
class LeitorDePacotes {
 public:
  explicit LeitorDePacotes(const ComPacote& Fazer) : fazer_(Fazer) {}

  // Whatever goes wrong unexpectedly is a want of memory.
  Motivos LerEFazer(const std::string& Arquivo) {
    tamanho_ = 0;
    try {
      return Ler(Arquivo);
    } catch (...) {
      return {Traduzir(Texto::SemMemoria)};
    }
  }

  std::int64_t Tamanho() const { return tamanho_; }  // bytes of the last one that could be read

 private:
  Motivos Ler(const std::string& Arquivo) {
    const std::string falta = LerPara(conteudo_, Arquivo);
    if (!falta.empty()) return {falta};
    tamanho_ = std::ssize(conteudo_);
    const auto pacote = LerPacote(conteudo_);
    if (!pacote) return {Traduzir(MotivoDe(DefeitoDe(conteudo_)))};
    return fazer_({Arquivo, tamanho_, *pacote, conteudo_});
  }

  const ComPacote& fazer_;
  std::string conteudo_;
  std::int64_t tamanho_ = 0;
};

}  // namespace

void ParaCadaPacote(const Pedido& Feito, Relato& Onde, const ComPacote& Fazer, const DepoisDoPacote& Depois) {
  std::vector<std::string> pacotes;
  for (const std::string& argumento : Feito.Arquivos) AcrescentarPacotes(pacotes, argumento, Onde);
  LeitorDePacotes leitor(Fazer);
  Onde.Comecar(pacotes.size());
  for (const std::string& arquivo : pacotes) {
    const Motivos porque = leitor.LerEFazer(arquivo);
    for (const std::string& cada : porque) Onde.Recusar(arquivo, cada);
    if (Depois) Depois(arquivo, porque);
    Onde.Andar(leitor.Tamanho());
  }
  Onde.Terminar();
}
