// tvk publicar: packages into a repository. What readers are led to is there, whole, before they are led to it.
#include <algorithm>
#include <iterator>
#include <utility>

#include "keeper/arquivos.h"
#include "keeper/conferencia.h"
#include "keeper/fichas.h"
#include "keeper/motivos.h"
#include "keeper/pedido_de_publicacao.h"
#include "keeper/verbos.h"
#include "platform/clock.h"
#include "platform/hash.h"
#include "platform/text.h"
#include "repository/chave.h"
#include "repository/figura.h"
#include "support/textos.h"

namespace {

// A package that is to be published, without its bytes: only one of them is in memory at a time.
struct Colhido {
  std::string Arquivo;
  JogoPublicado Jogo;
  bool Esta;  // with its picture in the repository already
};

std::optional<ArquivoPublicado> ComoArquivo(std::string_view Bytes) {
  const auto soma = platform::Sha256(Bytes);
  if (!soma) return std::nullopt;
  return ArquivoPublicado{EmHexadecimal(*soma), std::ssize(Bytes)};
}

// Brings the packages of one run together, and what is known of them.
class Editora {
 public:
  Editora(const PedidoDePublicacao& Pedido, Publicado Antes, Relato& Onde)
      : pedido_(Pedido), destino_(Pedido.Destino), antes_(std::move(Antes)), onde_(Onde) {}

  void Colher(const Pedido& Feito) {
    Fichas fichas = pedido_.Lista.empty() ? Fichas(antes_.Jogos) : Fichas(pedido_.Lista, onde_);
    Conferencia conferencia;
    ParaCadaPacote(Feito, onde_, [&](const PacoteLido& Lido) {
      Motivos motivos = conferencia.Conferir(Lido);
      if (motivos.empty()) motivos = ColherUm(Lido, fichas);
      return motivos;
    });
    if (onde_.Recusados() == 0) fichas.RecusarSobras(onde_);
  }

  // What the collected packages make of the repository. False, and told, when they cannot be published.
  bool Planejar() {
    for (const Colhido& colhido : colhidos_) jogos_.push_back(colhido.Jogo);
    textoDoIndice_ = EscreverIndice(jogos_);
    const Recusa recusa = LerIndice(textoDoIndice_).Porque;
    const auto indice = ComoArquivo(textoDoIndice_);
    const auto impressao = ImpressaoDigital(pedido_.Chave.Public);
    if (recusa.Qual != Recusa::Tipo::Nenhuma || !indice || !impressao) {
      const bool recusado = recusa.Qual != Recusa::Tipo::Nenhuma;
      onde_.Recusar(destino_.Caminho("indice/"), recusado ? MotivoDaRecusa(recusa) : Traduzir(Texto::NaoAssinado));
      return false;
    }
    impressao_ = *impressao;
    mudados_ = Diferencas(antes_.Jogos, jogos_);
    return PlanejarEntrada(*indice);
  }

  // Packages and pictures first, then the index, and the entry last.
  bool Gravar() {
    onde_.Comecar(colhidos_.size());
    const bool gravados = std::ranges::all_of(colhidos_, [&](const Colhido& Qual) { return GravarUm(Qual); });
    onde_.Terminar();
    return gravados && Por(ArquivoDoIndice(nova_.Indice), textoDoIndice_) && GravarEntrada();
  }

  void Contar() const {
    for (const JogoMudado& mudado : mudados_) {
      constexpr std::size_t largura = 9;
      std::string linha = Traduzir(PalavraDe(mudado.Como));
      linha.resize(std::max(linha.size() + 1, largura), ' ');
      onde_.Linha(linha + EmColunaDOS(mudado.NomeDOS) + platform::FromUtf8(mudado.Nome));
    }
    const auto quantos = [&](Novidade Como) {
      return std::to_string(std::ranges::count(mudados_, Como, &JogoMudado::Como));
    };
    onde_.Linha(Traduzir(Texto::JogosNoRepositorio, {std::to_string(jogos_.size()), quantos(Novidade::Novo),
                                                     quantos(Novidade::Mudou), quantos(Novidade::Saiu)}));
  }

  void Concluir() const {
    const std::string validade = TextoDoInstante(fica_ ? antes_.Entrada->Validade : nova_.Validade);
    if (pedido_.Simular) {
      onde_.Linha(Traduzir(Texto::NadaFoiGravado));
    } else if (fica_) {
      onde_.Linha(Traduzir(Texto::EntradaFicou, {validade}));
    } else {
      onde_.Linha(Traduzir(Texto::EntradaPublicada, {std::to_string(nova_.Serie), validade}));
    }
    onde_.Linha(Traduzir(Texto::ImpressaoDaChave, {impressao_}));
  }

  // What neither this index nor the one before it names; the latter has its readers still.
  void Limpar() const {
    std::set<std::string> usados = ArquivosDe(nova_.Indice, jogos_);
    if (antes_.Entrada) usados.merge(ArquivosDe(antes_.Entrada->Indice, antes_.Jogos));
    for (const std::string& sobra : destino_.Sobras(usados)) {
      if (!pedido_.Simular && !destino_.Apagar(sobra, onde_)) continue;
      onde_.Linha(Traduzir(Texto::ArquivoApagado, {destino_.Caminho(sobra)}));
    }
    if (!pedido_.Simular) destino_.ApagarRestosDeEscrita();
  }

 private:
  bool PlanejarEntrada(const ArquivoPublicado& Indice) {
    const std::int64_t agora = std::max<std::int64_t>(platform::SystemTime(), 0);
    const auto nova = NovaEntrada(antes_.Entrada, pedido_.Entrada, Indice, agora);
    if (!nova) {
      onde_.UsoErrado(Traduzir(Texto::FaltaOTitulo));
      return false;
    }
    nova_ = *nova;
    fica_ = PodeFicar(antes_.Entrada, nova_, agora);
    return true;
  }

  Motivos ColherUm(const PacoteLido& Lido, Fichas& Textos) {
    const auto pacote = ComoArquivo(Lido.Bytes), figura = ComoArquivo(Lido.Conteudo.Imagem);
    if (!pacote || !figura) return {Traduzir(Texto::NaoAssinado)};
    JogoPublicado jogo;
    jogo.Nome = platform::ToUtf8(Lido.Conteudo.Nome);
    jogo.NomeDOS = platform::ToUtf8(Lido.Conteudo.DOSName);
    jogo.Pacote = *pacote;
    jogo.Figura = *figura;
    jogo.ExtensaoDaFigura = ExtensaoDaFigura(Lido.Conteudo.Imagem);
    Textos.Preencher(jogo);
    const bool esta =
        destino_.Tem(ArquivoDoPacote(jogo), Lido.Bytes) && destino_.Tem(ArquivoDaFigura(jogo), Lido.Conteudo.Imagem);
    colhidos_.push_back({Lido.Arquivo, std::move(jogo), esta});
    return {};
  }

  bool GravarUm(const Colhido& Qual) {
    const bool gravado = Qual.Esta || Copiar(Qual);
    onde_.Andar(Qual.Esta ? 0 : Qual.Jogo.Pacote.Tamanho);
    return gravado;
  }

  // The file is read once more, and must be what it was.
  bool Copiar(const Colhido& Qual) {
    const Leitura lida = LerTudo(Qual.Arquivo);
    const auto pacote = LerPacote(lida.Conteudo);
    if (!pacote || ComoArquivo(lida.Conteudo) != Qual.Jogo.Pacote) {
      onde_.Recusar(Qual.Arquivo, lida.Falta.empty() ? Traduzir(Texto::MudouAoPublicar) : lida.Falta);
      return false;
    }
    return Por(ArquivoDoPacote(Qual.Jogo), lida.Conteudo) && Por(ArquivoDaFigura(Qual.Jogo), pacote->Imagem);
  }

  // Over one of that name, which then is damaged.
  bool Por(const std::string& Arquivo, std::string_view Conteudo) {
    return destino_.Por(Arquivo, Conteudo, platform::Existing::Replace, onde_);
  }

  // One that came meanwhile, where there was none, is somebody else's.
  bool GravarEntrada() {
    if (fica_) return true;
    const auto texto = AssinarEntrada(nova_, pedido_.Chave);
    if (!texto) onde_.Recusar(destino_.Caminho(NomeDaEntrada), Traduzir(Texto::NaoAssinado));
    const auto existente = antes_.Entrada ? platform::Existing::Replace : platform::Existing::Keep;
    return texto && destino_.Por(NomeDaEntrada, *texto, existente, onde_);
  }

  static Texto PalavraDe(Novidade Como) {
    constexpr Texto palavras[] = {Texto::JogoNovo, Texto::JogoMudou, Texto::JogoSaiu};
    return palavras[static_cast<int>(Como)];
  }

  const PedidoDePublicacao& pedido_;
  const Repositorio& destino_;
  const Publicado antes_;
  Relato& onde_;
  std::vector<Colhido> colhidos_;
  std::vector<JogoPublicado> jogos_;
  std::vector<JogoMudado> mudados_;
  std::string textoDoIndice_, impressao_;
  EntradaDoRepositorio nova_;
  bool fica_ = false;  // the entry that is there
};

void FazerPublicacao(const Pedido& Feito, Relato& Onde) {
  const auto pedido = LerPublicacao(Feito, Onde);
  auto antes = pedido ? pedido->Destino.Ler(pedido->Chave.Public, Onde) : std::nullopt;
  if (!antes) return;
  Editora editora(*pedido, std::move(*antes), Onde);
  editora.Colher(Feito);
  const bool feita = Onde.Recusados() == 0 && editora.Planejar() && (pedido->Simular || editora.Gravar());
  if (!feita) return Onde.Linha(Traduzir(Texto::NadaFoiPublicado));
  editora.Contar();
  if (pedido->Limpar) editora.Limpar();
  editora.Concluir();
}

}  // namespace

// Whatever goes wrong unexpectedly is a want of memory.
void Publicar(const Pedido& Feito, Relato& Onde) {
  try {
    FazerPublicacao(Feito, Onde);
  } catch (...) {
    Onde.Recusar(Feito.Valor("--repositorio"), Traduzir(Texto::SemMemoria));
  }
}
