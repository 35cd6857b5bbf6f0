#include "collection/entrada.h"

#include "catalog/cls_DAT.h"
#include "collection/jogo.h"
#include "package/cls_CRC.h"
#include "support/caminhos.h"
#include "support/gravacao.h"
#include "support/mod_Arquivos.h"
#include "support/mod_Globais.h"

namespace {

using platform::Existing;

std::string ArquivoDaRom(const Pacote& Novo) { return DirRoms + Novo.DOSName + ".zip"; }

// Makes the new contents the files' own. What has to be written in place can fail, and goes first; what lies complete
// beside its file can only take the name.
bool TomarNomes(Substituicao& Figura, Substituicao& Rom) {
  return Figura.EstaAoLado() ? Rom.Concluir() && Figura.Concluir() : Figura.Concluir() && Rom.Concluir();
}

// Whether the ROM as it stands on the disk has the package's checksum.
Entrada ConferirRom(const std::string& Arquivo, const Pacote& Novo) {
  platform::File aberto(Arquivo, platform::Access::Read);
  const auto soma = cls_CRC().CRC(aberto);
  if (!soma) return Entrada::NaoLida;
  return TextoCRC(*soma) == Novo.CRC ? Entrada::Feita : Entrada::Corrompida;
}

// The same of the package as it was read.
Entrada ConferirPacote(const Pacote& Novo) {
  const auto soma = cls_CRC().CRC(Novo.Rom);
  if (!soma || Novo.Imagem.empty()) return Entrada::NaoLida;
  return TextoCRC(*soma) == Novo.CRC ? Entrada::Feita : Entrada::Corrompida;
}

}  // namespace

Entrada PorRom(const std::string& Caminho, const EntrePassos& Pausa) {
  const std::string conteudo = LerArquivo(Caminho);
  if (conteudo.empty()) return Entrada::NaoLida;
  Pausa();
  const std::string destino = DirRoms + UltimaParte(Caminho);
  return GravarArquivo(destino, conteudo, 1, true) == 1 ? Entrada::Feita : Entrada::NaoGravada;
}

Entrada PorJogo(const Pacote& Novo, bool NaLista, const std::function<bool()>& Substituir, const EntrePassos& Pausa) {
  const Encontro encontrado = NaLista ? Encontro::OutraRom : OQueEncontra(Novo);
  if (encontrado == Encontro::OutraRom && !Substituir()) return Entrada::Negada;
  const Entrada fim = PorPacote(Novo, encontrado == Encontro::Nada ? Existing::Keep : Existing::Replace, Pausa);
  if (fim != Entrada::Feita || NaLista) return fim;
  return Catalogo().RegistrarRom(Novo.Nome, Novo.DOSName) ? Entrada::Feita : Entrada::SemCatalogo;
}

bool JaEsta(const Pacote& Novo) {
  Booleano encontrado = Falso;
  const bool catalogado = Catalogo().DefineNome(Novo.DOSName, encontrado) == Novo.Nome && encontrado != Falso;
  return catalogado && LerArquivo(ArquivoDaRom(Novo)) == Novo.Rom && LerArquivo(ImagemDoJogo(Novo.Nome)) == Novo.Imagem;
}

Encontro OQueEncontra(const Pacote& Novo) {
  const std::string arquivo = ArquivoDaRom(Novo);
  const auto tamanho = platform::FileSize(arquivo);
  if (!tamanho) return Encontro::Nada;
  return *tamanho == 0 || LerArquivo(arquivo) == Novo.Rom ? Encontro::MesmaRom : Encontro::OutraRom;
}

Entrada PorPacote(const Pacote& Novo, Existing RomExistente, const EntrePassos& Pausa) {
  Entrada fim = ConferirPacote(Novo);
  if (fim != Entrada::Feita) return fim;
  const std::string arquivoImagem = DirImgs + Novo.Nome + ".gif", arquivoRom = ArquivoDaRom(Novo);
  Substituicao figura(arquivoImagem, Novo.Imagem), rom(arquivoRom, Novo.Rom, RomExistente);
  Pausa();
  const bool conferidaAntes = rom.EstaAoLado();
  if (conferidaAntes) fim = ConferirRom(rom.Provisorio(), Novo);
  if (fim != Entrada::Feita) return fim;
  if (!TomarNomes(figura, rom)) return Entrada::NaoGravada;
  if (!conferidaAntes) fim = ConferirRom(arquivoRom, Novo);
  if (fim == Entrada::Corrompida) {
    ApagarArquivo(arquivoRom);
    ApagarArquivo(arquivoImagem);
  }
  return fim;
}
