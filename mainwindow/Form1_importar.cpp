// The import command: a ROM file is copied into the ROM directory as it is; a package brings name, picture and ROM.
#include "catalog/cls_DAT.h"
#include "mainwindow/Form1.h"
#include "mainwindow/arquivos_de_jogos.h"
#include "package/cls_CRC.h"
#include "package/pacote.h"
#include "platform/events.h"
#include "support/caminhos.h"
#include "support/gravacao.h"
#include "support/mensagens.h"
#include "support/mod_Arquivos.h"
#include "support/mod_CommonDialog.h"
#include "support/mod_Globais.h"
#include "support/textos.h"

namespace {

using platform::Existing;
using platform::RunPendingEvents;

enum class Desfecho { Adicionado, Desistencia, ErroDeLeitura, ErroDeGravacao, Corrompido };

struct Importacao {
  Desfecho Fim;
  std::string Nome = {};  // of the new game in the list
};

std::string PerguntarArquivo(const Form1& Dono) {
  using namespace std::string_literals;
  std::string Filtro = Traduzir(Texto::ArquivosSuportados) + "\0*.zip;*.smc;*.tvk\0"s;
  return AbrirArquivo(Dono, "", Traduzir(Texto::Adicionar), "", Filtro, platform::HideReadOnly);
}

Importacao ImportarRom(const std::string& Caminho, const std::string& Base) {
  const std::string Conteudo = LerArquivo(Caminho);
  if (Conteudo.empty()) return {Desfecho::ErroDeLeitura};
  RunPendingEvents();
  if (!GravarInteiro(DirRoms + UltimaParte(Caminho), Conteudo)) return {Desfecho::ErroDeGravacao};
  return {Desfecho::Adicionado, Base};
}

std::string ArquivoDaRom(const Pacote& Novo) { return DirRoms + Novo.DOSName + ".zip"; }

// Makes the new contents the files' own. What has to be written in place can fail, and goes first; what lies complete
// beside its file can only take the name.
bool TomarNomes(Substituicao& Figura, Substituicao& Rom) {
  return Figura.EstaAoLado() ? Rom.Concluir() && Figura.Concluir() : Figura.Concluir() && Rom.Concluir();
}

// Whether the ROM as it stands on the disk has the package's checksum.
Desfecho ConferirRom(const std::string& Arquivo, const Pacote& Novo) {
  const auto Soma = CRCDoArquivo(Arquivo);
  if (!Soma) return Desfecho::ErroDeLeitura;
  return *Soma == Novo.CRC ? Desfecho::Adicionado : Desfecho::Corrompido;
}

// A package whose ROM has no checksum, since the file ends before it or within it, is refused, and one that is damaged
// is told, before anything changes. The new game is complete on the disk before the old one goes.
Desfecho GravarJogo(const Pacote& Novo, Existing RomExistente) {
  cls_CRC Medida;
  const auto Soma = Medida.CRC(Novo.Rom);
  if (!Soma || Novo.Imagem.empty()) return Desfecho::ErroDeLeitura;
  if (TextoCRC(*Soma) != Novo.CRC) return Desfecho::Corrompido;
  const std::string ArquivoImagem = DirImgs + Novo.Nome + ".gif", ArquivoRom = ArquivoDaRom(Novo);
  Substituicao Figura(ArquivoImagem, Novo.Imagem), Rom(ArquivoRom, Novo.Rom, RomExistente);
  RunPendingEvents();
  const bool ConferidaAntes = Rom.EstaAoLado();
  Desfecho Fim = ConferidaAntes ? ConferirRom(Rom.Provisorio(), Novo) : Desfecho::Adicionado;
  if (Fim != Desfecho::Adicionado) return Fim;
  if (!TomarNomes(Figura, Rom)) return Desfecho::ErroDeLeitura;
  if (!ConferidaAntes) Fim = ConferirRom(ArquivoRom, Novo);
  if (Fim == Desfecho::Corrompido) {
    ApagarArquivo(ArquivoRom);
    ApagarArquivo(ArquivoImagem);
  }
  return Fim;
}

// What the package's ROM meets under its file name, which a game of another name can have. A file that cannot be seen
// counts as none, and nothing takes its place.
enum class Encontro { Nada, MesmaRom, OutraRom };

Encontro OQueEncontra(const Pacote& Novo) {
  const std::string Arquivo = ArquivoDaRom(Novo);
  const auto Tamanho = platform::FileSize(Arquivo);
  if (!Tamanho) return Encontro::Nada;
  return *Tamanho == 0 || LerArquivo(Arquivo) == Novo.Rom ? Encontro::MesmaRom : Encontro::OutraRom;
}

Importacao ImportarPacote(const Form1& Lista, const std::string& Caminho) {
  const std::string Conteudo = LerArquivo(Caminho);
  const auto Novo = LerPacote(Conteudo);
  if (!Novo) return {Desfecho::ErroDeLeitura};
  RunPendingEvents();
  const bool NaLista = Lista.InList1(Novo->Nome);
  const Encontro Encontrado = NaLista ? Encontro::OutraRom : OQueEncontra(*Novo);
  if (Encontrado == Encontro::OutraRom && MostrarMensagem(Mensagem::JogoJaExiste) != platform::Answer::Yes) {
    return {Desfecho::Desistencia};
  }
  const Desfecho Fim = GravarJogo(*Novo, Encontrado == Encontro::Nada ? Existing::Keep : Existing::Replace);
  if (Fim == Desfecho::Adicionado && !NaLista) Catalogo().RegistrarRom(Novo->Nome, Novo->DOSName);
  return {Fim, Novo->Nome};
}

Importacao Importar(const Form1& Lista, const std::string& Caminho) {
  if (Caminho.empty()) return {Desfecho::Desistencia};
  const auto Base = NomeBase(UltimaParte(Caminho));
  if (!ArquivoExiste(Caminho) || !Base) return {Desfecho::ErroDeLeitura};
  const std::string Tipo = TipoDoArquivo(Caminho);
  if (Tipo == "ZIP" || Tipo == "SMC") return ImportarRom(Caminho, *Base);
  if (Tipo == "TVK") return ImportarPacote(Lista, Caminho);
  return {Desfecho::Desistencia};
}

// Whatever goes wrong unexpectedly (a file larger than the memory) counts as a file that cannot be read.
Importacao ImportarSemExcecao(const Form1& Lista, const std::string& Caminho) {
  try {
    return Importar(Lista, Caminho);
  } catch (...) {
    return {Desfecho::ErroDeLeitura};
  }
}

void MostrarFracasso(Desfecho Fim) {
  switch (Fim) {
    case Desfecho::ErroDeLeitura:
      MostrarMensagem(Mensagem::ErroAoLer);
      return;
    case Desfecho::ErroDeGravacao:
      MostrarMensagem(Mensagem::ErroAoGravar);
      return;
    case Desfecho::Corrompido:
      MostrarMensagem(Mensagem::JogoCorrompido);
      return;
    case Desfecho::Adicionado:
    case Desfecho::Desistencia:
      return;
  }
}

}  // namespace

void Form1::Command4_Click() {
  Desativar(false);
  RunPendingEvents();
  const Importacao Feita = ImportarSemExcecao(*this, PerguntarArquivo(*this));
  if (Feita.Fim != Desfecho::Adicionado) {
    MostrarFracasso(Feita.Fim);
    Ativar(true);
    return;
  }
  MostrarMensagem(Mensagem::JogoAdicionado);
  CarregarLista(true);
  SelecionarNome(Feita.Nome);
}
