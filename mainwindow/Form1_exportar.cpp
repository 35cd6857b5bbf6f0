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

void Oferecer(Oferta& ofertas, const std::string& rotulo, const std::string& padrao) {
  ofertas.Filtro.append(rotulo).append(1, '\0').append(padrao).append(1, '\0');
}

// What the game can be saved as. A package needs a picture and a catalogue entry.
Oferta TiposOferecidos(const Jogo& escolhido, bool temImagem) {
  Oferta ofertas;
  if (temImagem && escolhido.Catalogado) {
    Oferecer(ofertas, Traduzir(Texto::ArquivoTolvaris), "*.tvk");
    ofertas.ExtensaoPadrao = "tvk;";
  }
  const std::string tipo = TipoDoArquivo(escolhido.Arquivo);
  if (tipo == "ZIP") {
    Oferecer(ofertas, Traduzir(Texto::ArquivoZip), "*.zip");
    ofertas.ExtensaoPadrao += "zip";
  } else if (tipo == "SMC") {
    Oferecer(ofertas, Traduzir(Texto::ArquivoSmc), "*.smc");
    ofertas.ExtensaoPadrao += "smc";
  } else {
    Oferecer(ofertas, tipo, "*.*");
    ofertas.ExtensaoPadrao += escolhido.Arquivo.substr(escolhido.Arquivo.size() - tipo.size());
  }
  return ofertas;
}

std::string PerguntarDestino(const Form1& dono, const Jogo& escolhido, bool temImagem) {
  Oferta ofertas = TiposOferecidos(escolhido, temImagem);
  return SalvarArquivo(dono, "", Traduzir(Texto::SalvarComo), ofertas.ExtensaoPadrao, escolhido.Nome, ofertas.Filtro,
                       platform::HideReadOnly);
}

// Nothing: the person gave up.
std::optional<Saida> Salvar(const Form1& dono, const Jogo& escolhido, const std::string& arquivoImagem) {
  const std::string caminho = PerguntarDestino(dono, escolhido, !arquivoImagem.empty());
  if (caminho.empty()) return std::nullopt;
  const auto tamanho = platform::FileSize(caminho);
  if (tamanho > 0 && MostrarMensagem(Mensagem::ArquivoJaExiste) != platform::Answer::Yes) return std::nullopt;
  RunPendingEvents();
  const Destino destino{caminho, tamanho >= 0 ? Existing::Replace : Existing::Keep};
  return TipoDoArquivo(caminho) == "TVK" ? SalvarPacote(escolhido, arquivoImagem, destino, RunPendingEvents)
                                         : SalvarRom(escolhido, destino, RunPendingEvents);
}

std::optional<Saida> SalvarSemExcecao(const Form1& dono, const Jogo& escolhido, const std::string& arquivoImagem) {
  try {
    return Salvar(dono, escolhido, arquivoImagem);
  } catch (...) {
    return Saida::SemPacote;
  }
}

Mensagem MensagemDe(Saida fim) {
  switch (fim) {
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
