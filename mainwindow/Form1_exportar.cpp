// The export command: the selected game as a plain copy of its ROM file, or as a package.
#include "collection/saida.h"
#include "mainwindow/Form1.h"
#include "platform/events.h"
#include "support/caminhos.h"
#include "support/mensagens.h"
#include "support/mod_CommonDialog.h"
#include "support/textos.h"

namespace {

using platform::Existing;
using platform::RunPendingEvents;

struct Oferta {
  std::string Filtro, ExtensaoPadrao;  // as the save dialog takes them
};

void Oferecer(Oferta& Ofertas, const std::string& Rotulo, const std::string& Padrao) {
  Ofertas.Filtro.append(Rotulo).append(1, '\0').append(Padrao).append(1, '\0');
}

// What the game can be saved as. A package needs a picture and a catalogue entry.
Oferta TiposOferecidos(const Jogo& Escolhido, bool TemImagem) {
  Oferta ofertas;
  if (TemImagem && Escolhido.Catalogado) {
    Oferecer(ofertas, Traduzir(Texto::ArquivoTolvaris), "*.tvk");
    ofertas.ExtensaoPadrao = "tvk;";
  }
  const std::string tipo = TipoDoArquivo(Escolhido.Arquivo);
  if (tipo == "ZIP") {
    Oferecer(ofertas, Traduzir(Texto::ArquivoZip), "*.zip");
    ofertas.ExtensaoPadrao += "zip";
  } else if (tipo == "SMC") {
    Oferecer(ofertas, Traduzir(Texto::ArquivoSmc), "*.smc");
    ofertas.ExtensaoPadrao += "smc";
  } else {
    Oferecer(ofertas, tipo, "*.*");
    ofertas.ExtensaoPadrao += Escolhido.Arquivo.substr(Escolhido.Arquivo.size() - tipo.size());
  }
  return ofertas;
}

std::string PerguntarDestino(const Form1& Dono, const Jogo& Escolhido, bool TemImagem) {
  Oferta ofertas = TiposOferecidos(Escolhido, TemImagem);
  return SalvarArquivo(Dono, "", Traduzir(Texto::SalvarComo), ofertas.ExtensaoPadrao, SoDeNomeDeArquivo(Escolhido.Nome),
                       ofertas.Filtro, platform::HideReadOnly);
}

// Nothing: the person gave up.
std::optional<Saida> Salvar(const Form1& Dono, const Jogo& Escolhido, const std::string& ArquivoImagem) {
  const std::string caminho = PerguntarDestino(Dono, Escolhido, !ArquivoImagem.empty());
  if (caminho.empty()) return std::nullopt;
  const auto tamanho = platform::FileSize(caminho);
  if (tamanho > 0 && MostrarMensagem(Mensagem::ArquivoJaExiste) != platform::Answer::Yes) return std::nullopt;
  RunPendingEvents();
  const Destino destino{caminho, tamanho >= 0 ? Existing::Replace : Existing::Keep};
  return TipoDoArquivo(caminho) == "TVK" ? SalvarPacote(Escolhido, ArquivoImagem, destino, RunPendingEvents)
                                         : SalvarRom(Escolhido, destino, RunPendingEvents);
}

std::optional<Saida> SalvarSemExcecao(const Form1& Dono, const Jogo& Escolhido, const std::string& ArquivoImagem) {
  try {
    return Salvar(Dono, Escolhido, ArquivoImagem);
  } catch (...) {
    return Saida::SemPacote;
  }
}

Mensagem MensagemDe(Saida Fim) {
  switch (Fim) {
    case Saida::Feita:
      return Mensagem::ArquivoSalvo;
    case Saida::NaoLida:
      return Mensagem::ErroAoLer;
    case Saida::NaoGravada:
      return Mensagem::ErroAoGravar;
    default:
      return Mensagem::ErroAoSalvar;
  }
}

}  // namespace

void Form1::Command5_Click() {
  const auto escolhido = JogoSelecionado();
  if (!escolhido) return;
  Desativar(false);
  const auto fim = SalvarSemExcecao(*this, *escolhido, CaminhoImagem(IndiceJogo(escolhido->Nome)));
  if (fim == Saida::SemPacote) RunPendingEvents();
  if (fim) MostrarMensagem(MensagemDe(*fim));
  Ativar(true);
}
