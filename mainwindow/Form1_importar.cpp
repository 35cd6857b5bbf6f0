// The import command: asks for a file, and whether a game may be replaced, and tells what became of it.
#include "collection/entrada.h"
#include "mainwindow/Form1.h"
#include "package/pacote.h"
#include "platform/events.h"
#include "support/caminhos.h"
#include "support/mensagens.h"
#include "support/mod_Arquivos.h"
#include "support/mod_CommonDialog.h"
#include "support/textos.h"

namespace {

using platform::RunPendingEvents;

struct Importacao {
  std::optional<Entrada> Fim;  // nothing: the person gave up, or the file is none that can be imported
  std::string Nome = {};       // of the new game in the list
};

std::string PerguntarArquivo(const Form1& Dono) {
  using namespace std::string_literals;
  std::string filtro = Traduzir(Texto::ArquivosSuportados) + "\0*.zip;*.smc;*.tvk\0"s;
  return AbrirArquivo(Dono, "", Traduzir(Texto::Adicionar), "", filtro, platform::HideReadOnly);
}

Importacao ImportarPacote(const Form1& Lista, const std::string& Caminho) {
  const std::string conteudo = LerArquivo(Caminho);
  const auto novo = LerPacote(conteudo);
  if (!novo) return {Entrada::NaoLida};
  RunPendingEvents();
  const auto substituir = [] { return MostrarMensagem(Mensagem::JogoJaExiste) == platform::Answer::Yes; };
  const Entrada fim = PorJogo(*novo, Lista.InList1(novo->Nome), substituir, RunPendingEvents);
  if (fim == Entrada::Negada) return {};
  return {fim == Entrada::SemCatalogo ? Entrada::Feita : fim, novo->Nome};  // listed by its file's name
}

Importacao Importar(const Form1& Lista, const std::string& Caminho) {
  if (Caminho.empty()) return {};
  const auto base = NomeBase(UltimaParte(Caminho));
  if (!ArquivoExiste(Caminho) || !base) return {Entrada::NaoLida};
  const std::string tipo = TipoDoArquivo(Caminho);
  if (tipo == "ZIP" || tipo == "SMC") return {PorRom(Caminho, RunPendingEvents), *base};
  if (tipo == "TVK") return ImportarPacote(Lista, Caminho);
  return {};
}

// Whatever goes wrong unexpectedly (a file larger than the memory) counts as a file that cannot be read.
Importacao ImportarSemExcecao(const Form1& Lista, const std::string& Caminho) {
  try {
    return Importar(Lista, Caminho);
  } catch (...) {
    return {Entrada::NaoLida};
  }
}

bool EhPacote(const std::string& Caminho) { return TipoDoArquivo(Caminho) == "TVK"; }

// Of a package, what cannot be written is told like what cannot be read.
Mensagem MensagemDe(Entrada Fim, bool DePacote) {
  switch (Fim) {
    case Entrada::Feita:
      return Mensagem::JogoAdicionado;
    case Entrada::NaoGravada:
      return DePacote ? Mensagem::ErroAoLer : Mensagem::ErroAoGravar;
    case Entrada::Corrompida:
      return Mensagem::JogoCorrompido;
    default:
      return Mensagem::ErroAoLer;
  }
}

}  // namespace

void Form1::Command4_Click() {
  Desativar(false);
  RunPendingEvents();
  const std::string caminho = PerguntarArquivo(*this);
  const Importacao feita = ImportarSemExcecao(*this, caminho);
  if (feita.Fim) MostrarMensagem(MensagemDe(*feita.Fim, EhPacote(caminho)));
  if (feita.Fim != Entrada::Feita) {
    Ativar(true);
    return;
  }
  CarregarLista(true);
  SelecionarNome(feita.Nome);
}
