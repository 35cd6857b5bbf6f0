// tvk chave: a new key for signing a repository.
#include "repository/chave.h"

#include "keeper/arquivos.h"
#include "keeper/verbos.h"
#include "support/textos.h"

void FazerChave(const Pedido& Feito, Relato& Onde) {
  if (Feito.Arquivos.size() != 1) return Onde.UsoErrado(Traduzir(Texto::SoUmArquivo));
  const std::string& arquivo = Feito.Arquivos.front();
  if (platform::GetFileAttributesA(arquivo)) return Onde.Recusar(arquivo, Traduzir(Texto::ChaveJaExiste));
  const auto chave = platform::MakeSigningKey();
  const auto impressao = chave ? ImpressaoDigital(chave->Public) : std::nullopt;
  if (!impressao) return Onde.Recusar(arquivo, Traduzir(Texto::ChaveNaoFeita));
  if (!GravarInteiro(arquivo, EscreverChave(*chave), platform::Existing::Keep)) {
    return Onde.Recusar(arquivo, Traduzir(Texto::NaoFoiGravado));
  }
  Onde.Linha(Traduzir(Texto::ImpressaoDaChave, {*impressao}));
  Onde.Linha(Traduzir(Texto::GuardeAChave));
  Onde.Linha(Traduzir(Texto::NaoDeAChave));
}
