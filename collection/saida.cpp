#include "collection/saida.h"

#include <string_view>

#include "package/cls_CRC.h"
#include "package/pacote.h"
#include "support/caminhos.h"
#include "support/gravacao.h"
#include "support/mod_Arquivos.h"

namespace {

Saida Gravar(const Destino& Alvo, std::string_view Conteudo) {
  ApagarRestos(DiretorioDe(Alvo.Caminho));
  return Substituicao(Alvo.Caminho, Conteudo, Alvo.Existente).Concluir() ? Saida::Feita : Saida::NaoGravada;
}

}  // namespace

Saida SalvarRom(const Jogo& Escolhido, const Destino& Alvo, const EntrePassos& Pausa) {
  const std::string conteudo = LerArquivo(Escolhido.Arquivo);
  if (conteudo.empty()) return Saida::NaoLida;
  Pausa();
  return Gravar(Alvo, conteudo);
}

// The ROM is read once, to where the package has it, and the header is then put before the blocks: texts of many
// megabytes cost more than reading the file.
Saida SalvarPacote(const Jogo& Escolhido, const std::string& ArquivoImagem, const Destino& Alvo,
                   const EntrePassos& Pausa) {
  constexpr std::size_t folga = 1024;  // a longer header costs a copy, no more
  std::string pacote;
  pacote.reserve(folga + static_cast<std::size_t>(TamanhoArquivo(ArquivoImagem)) +
                 static_cast<std::size_t>(TamanhoArquivo(Escolhido.Arquivo)));
  if (!ArquivoImagem.empty() && !AcrescentarArquivo(pacote, ArquivoImagem)) return Saida::SemPacote;
  const std::size_t tamanhoImagem = pacote.size();
  if (!AcrescentarArquivo(pacote, Escolhido.Arquivo)) return Saida::SemPacote;
  const std::size_t tamanhoRom = pacote.size() - tamanhoImagem;
  Pausa();
  const auto soma = cls_CRC().CRC(std::string_view(pacote).substr(tamanhoImagem));
  if (!soma) return Saida::SemPacote;
  pacote.insert(
      0, MontarPacote(Escolhido.Nome, Escolhido.DOSName, TextoCRC(*soma), static_cast<std::int32_t>(tamanhoImagem),
                      static_cast<std::int32_t>(tamanhoRom), {}, {}));
  Pausa();
  return Gravar(Alvo, pacote);
}
