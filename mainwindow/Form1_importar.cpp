// The import command: a ROM file is copied into the ROM directory as it is; a package brings name, picture and ROM.
#include "catalog/cls_DAT.h"
#include "mainwindow/Form1.h"
#include "mainwindow/arquivos_de_jogos.h"
#include "mainwindow/mensagens.h"
#include "package/cls_CRC.h"
#include "package/pacote.h"
#include "platform/events.h"
#include "platform/text.h"
#include "support/mod_Arquivos.h"
#include "support/mod_CommonDialog.h"
#include "support/mod_Globais.h"
#include "support/mod_Traducao.h"

namespace {

using platform::RunPendingEvents;

enum class Desfecho { Adicionado, Desistencia, ErroDeLeitura, ErroDeGravacao, Corrompido };

struct Importacao {
  Desfecho Fim;
  std::string Nome = {};  // of the new game in the list
};

std::string PerguntarArquivo(const Form1& Dono) {
  using namespace std::string_literals;
  std::string Filtro = Traduzir("Arquivos suportados") + "\0*.zip;*.smc;*.tvk\0"s;
  return AbrirArquivo(Dono, "", Traduzir("Adicionar..."), "", Filtro, platform::HideReadOnly);
}

Importacao ImportarRom(const std::string& Caminho, const std::string& Base) {
  const std::string Conteudo = LerArquivo(Caminho);
  if (Conteudo.empty()) return {Desfecho::ErroDeLeitura};
  RunPendingEvents();
  if (!GravarInteiro(DirRoms + NomeDoArquivo(Caminho), Conteudo)) return {Desfecho::ErroDeGravacao};
  return {Desfecho::Adicionado, Base};
}

// The ROM as it was written must have the package's checksum. A damaged package is told before it can replace
// anything; a ROM that the disk holds differently is removed again, with its picture.
Desfecho GravarJogo(const Pacote& Novo) {
  cls_CRC Medida;
  if (const auto Soma = Medida.CRC(Novo.Rom); Soma && TextoCRC(*Soma) != Novo.CRC) return Desfecho::Corrompido;
  const std::string ArquivoImagem = DirImgs + Novo.Nome + ".gif";
  if (!GravarInteiro(ArquivoImagem, Novo.Imagem)) return Desfecho::ErroDeLeitura;
  RunPendingEvents();
  const std::string ArquivoRom = DirRoms + Novo.DOSName + ".zip";
  if (!GravarInteiro(ArquivoRom, Novo.Rom)) return Desfecho::ErroDeLeitura;
  RunPendingEvents();
  const auto Soma = CRCDoArquivo(ArquivoRom);
  if (!Soma) return Desfecho::ErroDeLeitura;
  if (*Soma == Novo.CRC) return Desfecho::Adicionado;
  ApagarArquivo(ArquivoRom);
  ApagarArquivo(ArquivoImagem);
  return Desfecho::Corrompido;
}

Importacao ImportarPacote(const Form1& Lista, const std::string& Caminho) {
  const std::string Conteudo = LerArquivo(Caminho);
  const auto Novo = LerPacote(Conteudo);
  if (!Novo) return {Desfecho::ErroDeLeitura};
  RunPendingEvents();
  const bool Substituir = Lista.InList1(Novo->Nome);
  if (Substituir && !ConfirmarSubstituicao("O jogo a ser adiciona já existe."_ansi)) return {Desfecho::Desistencia};
  const Desfecho Fim = GravarJogo(*Novo);
  if (Fim == Desfecho::Adicionado && !Substituir) Catalogo().RegistrarRom(Novo->Nome, Novo->DOSName);
  return {Fim, Novo->Nome};
}

Importacao Importar(const Form1& Lista, const std::string& Caminho) {
  if (Caminho.empty()) return {Desfecho::Desistencia};
  const auto Base = NomeBase(NomeDoArquivo(Caminho));
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

void ErroCorrompido() {
  platform::MessageBoxA(Traduzir("Houve uma diferença na medição dos códigos CRC."_ansi) + "\r\n" +
                            Traduzir("Essa mudança indica que o arquivo está corrompido."_ansi),
                        Traduzir("Erro"), platform::Buttons::Ok, platform::Icon::Critical);
}

void MostrarFracasso(Desfecho Fim) {
  switch (Fim) {
    case Desfecho::ErroDeLeitura:
      return ErroAoLer();
    case Desfecho::ErroDeGravacao:
      return ErroAoGravar();
    case Desfecho::Corrompido:
      return ErroCorrompido();
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
  MostrarAviso("Jogo adicionado com sucesso.", "Ok");
  CarregarLista(true);
  SelecionarNome(Feita.Nome);
}
