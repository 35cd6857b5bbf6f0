#include "collection/saida.h"

#include <string_view>

#include "package/cls_CRC.h"
#include "package/pacote.h"
#include "support/caminhos.h"
#include "support/gravacao.h"
#include "support/mod_Arquivos.h"

namespace {

Saida Gravar(const Destino& alvo, std::string_view conteudo) {
  ApagarRestos(DiretorioDe(alvo.Caminho));
  return Substituicao(alvo.Caminho, conteudo, alvo.Existente).Concluir() ? Saida::Feita : Saida::NaoGravada;
}

// Puts all bytes of a file behind those of the text; false when not all of them could be read.
bool Acrescentar(std::string& texto, const std::string& caminho, std::int32_t tamanho) {
  const std::size_t antes = texto.size();
  AcrescentarArquivo(texto, caminho);
  return texto.size() - antes == static_cast<std::size_t>(tamanho);
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
  const std::int32_t tamanhoImagem = TamanhoArquivo(ArquivoImagem), tamanhoRom = TamanhoArquivo(Escolhido.Arquivo);
  std::string pacote;
  pacote.reserve(folga + static_cast<std::size_t>(tamanhoImagem) + static_cast<std::size_t>(tamanhoRom));
  if (!Acrescentar(pacote, ArquivoImagem, tamanhoImagem)) return Saida::SemPacote;
  const std::size_t inicioRom = pacote.size();
  if (!Acrescentar(pacote, Escolhido.Arquivo, tamanhoRom)) return Saida::SemPacote;
  Pausa();
  const auto soma = cls_CRC().CRC(std::string_view(pacote).substr(inicioRom));
  if (!soma) return Saida::SemPacote;
  pacote.insert(0, MontarPacote(Escolhido.Nome, Escolhido.DOSName, TextoCRC(*soma), tamanhoImagem, tamanhoRom, {}, {}));
  Pausa();
  return Gravar(Alvo, pacote);
}
