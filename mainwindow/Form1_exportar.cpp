// The export command: the selected game as a plain copy of its ROM file, or as a package.
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
#include "support/textos.h"

namespace {

using platform::Existing;
using platform::RunPendingEvents;

enum class Desfecho { Salvo, Desistencia, ErroDeLeitura, ErroDeGravacao, ErroInesperado };

struct Alvo {
  std::string Caminho;
  Existing Existente;
};

struct Oferta {
  std::string Filtro, ExtensaoPadrao;  // as the save dialog takes them
};

void Oferecer(Oferta& Ofertas, const std::string& Rotulo, const std::string& Padrao) {
  Ofertas.Filtro.append(Rotulo).append(1, '\0').append(Padrao).append(1, '\0');
}

// What the game can be saved as. A package needs a picture and a catalogue entry.
Oferta TiposOferecidos(const Jogo& Escolhido, bool TemImagem) {
  Oferta Ofertas;
  if (TemImagem && Escolhido.Catalogado) {
    Oferecer(Ofertas, Traduzir(Texto::ArquivoTolvaris), "*.tvk");
    Ofertas.ExtensaoPadrao = "tvk;";
  }
  const std::string Tipo = TipoDoArquivo(Escolhido.Arquivo);
  if (Tipo == "ZIP") {
    Oferecer(Ofertas, Traduzir(Texto::ArquivoZip), "*.zip");
    Ofertas.ExtensaoPadrao += "zip";
  } else if (Tipo == "SMC") {
    Oferecer(Ofertas, Traduzir(Texto::ArquivoSmc), "*.smc");
    Ofertas.ExtensaoPadrao += "smc";
  } else {
    Oferecer(Ofertas, Tipo, "*.*");
    Ofertas.ExtensaoPadrao += Escolhido.Arquivo.substr(Escolhido.Arquivo.size() - Tipo.size());
  }
  return Ofertas;
}

std::string PerguntarDestino(const Form1& Dono, const Jogo& Escolhido, bool TemImagem) {
  Oferta Ofertas = TiposOferecidos(Escolhido, TemImagem);
  return SalvarArquivo(Dono, "", Traduzir(Texto::SalvarComo), Ofertas.ExtensaoPadrao, Escolhido.Nome, Ofertas.Filtro,
                       platform::HideReadOnly);
}

// Over a file only when it was asked for: one that could not be seen then, or came since, stays.
Desfecho Gravar(const Alvo& Destino, std::string_view Conteudo) {
  ApagarRestos(DiretorioDe(Destino.Caminho));
  return Substituicao(Destino.Caminho, Conteudo, Destino.Existente).Concluir() ? Desfecho::Salvo
                                                                               : Desfecho::ErroDeGravacao;
}

Desfecho SalvarCopia(const Jogo& Escolhido, const Alvo& Destino) {
  const std::string Conteudo = LerArquivo(Escolhido.Arquivo);
  if (Conteudo.empty()) return Desfecho::ErroDeLeitura;
  RunPendingEvents();
  return Gravar(Destino, Conteudo);
}

// The ROM is read once, to where the package has it, and the header is then put before the blocks: texts of many
// megabytes cost more than reading the file.
Desfecho SalvarPacote(const Jogo& Escolhido, const std::string& ArquivoImagem, const Alvo& Destino) {
  constexpr std::size_t Folga = 1024;  // a longer header costs a copy, no more
  const std::int32_t TamanhoImagem = TamanhoArquivo(ArquivoImagem), TamanhoRom = TamanhoArquivo(Escolhido.Arquivo);
  std::string Pacote;
  Pacote.reserve(Folga + static_cast<std::size_t>(TamanhoImagem) + static_cast<std::size_t>(TamanhoRom));
  AcrescentarArquivo(Pacote, ArquivoImagem);
  const std::size_t InicioRom = Pacote.size();
  if (InicioRom != static_cast<std::size_t>(TamanhoImagem)) return Desfecho::ErroInesperado;
  AcrescentarArquivo(Pacote, Escolhido.Arquivo);
  if (Pacote.size() - InicioRom != static_cast<std::size_t>(TamanhoRom)) return Desfecho::ErroInesperado;
  RunPendingEvents();
  cls_CRC Medida;
  const auto Soma = Medida.CRC(std::string_view(Pacote).substr(InicioRom));
  if (!Soma) return Desfecho::ErroInesperado;
  Pacote.insert(0, MontarPacote(Escolhido.Nome, Escolhido.DOSName, TextoCRC(*Soma), TamanhoImagem, TamanhoRom, {}, {}));
  RunPendingEvents();
  return Gravar(Destino, Pacote);
}

Desfecho Salvar(const Form1& Dono, const Jogo& Escolhido, const std::string& ArquivoImagem) {
  const std::string Caminho = PerguntarDestino(Dono, Escolhido, !ArquivoImagem.empty());
  if (Caminho.empty()) return Desfecho::Desistencia;
  const auto Tamanho = platform::FileSize(Caminho);
  if (Tamanho > 0 && MostrarMensagem(Mensagem::ArquivoJaExiste) != platform::Answer::Yes) return Desfecho::Desistencia;
  RunPendingEvents();
  const Alvo Destino{Caminho, Tamanho ? Existing::Replace : Existing::Keep};
  return TipoDoArquivo(Caminho) == "TVK" ? SalvarPacote(Escolhido, ArquivoImagem, Destino)
                                         : SalvarCopia(Escolhido, Destino);
}

Desfecho SalvarSemExcecao(const Form1& Dono, const Jogo& Escolhido, const std::string& ArquivoImagem) {
  try {
    return Salvar(Dono, Escolhido, ArquivoImagem);
  } catch (...) {
    return Desfecho::ErroInesperado;
  }
}

void MostrarDesfecho(Desfecho Fim) {
  switch (Fim) {
    case Desfecho::Salvo:
      MostrarMensagem(Mensagem::ArquivoSalvo);
      return;
    case Desfecho::ErroDeLeitura:
      MostrarMensagem(Mensagem::ErroAoLer);
      return;
    case Desfecho::ErroDeGravacao:
      MostrarMensagem(Mensagem::ErroAoGravar);
      return;
    case Desfecho::ErroInesperado:
      RunPendingEvents();
      MostrarMensagem(Mensagem::ErroAoSalvar);
      return;
    case Desfecho::Desistencia:
      return;
  }
}

}  // namespace

void Form1::Command5_Click() {
  const auto Escolhido = JogoSelecionado();
  if (!Escolhido) return;
  Desativar(false);
  MostrarDesfecho(SalvarSemExcecao(*this, *Escolhido, CaminhoImagem(IndiceJogo(Escolhido->Nome))));
  Ativar(true);
}
