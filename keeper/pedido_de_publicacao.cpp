#include "keeper/pedido_de_publicacao.h"

#include <utility>

#include "keeper/arquivos.h"
#include "platform/text.h"
#include "repository/chave.h"
#include "support/textos.h"

namespace {

bool LerTitulo(const Pedido& Feito, Desejo& Lido, Relato& Onde) {
  if (!Feito.Tem("--titulo")) return true;
  const std::string titulo = platform::ToUtf8(Feito.Valor("--titulo"));
  if (titulo.empty() || !PodeSerValor("Titulo", titulo)) {
    Onde.UsoErrado(Traduzir(Texto::TituloErrado));
    return false;
  }
  Lido.Titulo = titulo;
  return true;
}

// One that is empty takes all of them away.
bool LerEspelhos(const Pedido& Feito, Desejo& Lido, Relato& Onde) {
  if (!Feito.Tem("--espelho")) return true;
  std::vector<std::string> espelhos;
  for (const std::string& endereco : Feito.Valores("--espelho")) {
    if (endereco.empty()) continue;
    espelhos.push_back(platform::ToUtf8(endereco));
    const bool serve = EhEspelho(espelhos.back()) && PodeSerValor("Espelho", espelhos.back());
    if (serve && espelhos.size() <= MaisEspelhos) continue;
    Onde.UsoErrado(serve ? Traduzir(Texto::EspelhosDemais) : Traduzir(Texto::EspelhoErrado, {endereco}));
    return false;
  }
  Lido.Espelhos = std::move(espelhos);
  return true;
}

bool LerValidade(const Pedido& Feito, Desejo& Lido, Relato& Onde) {
  constexpr std::int64_t maisDias = 36'500, segundosDoDia = 86'400;
  if (!Feito.Tem("--validade")) return true;
  const auto dias = LerNumero(Feito.Valor("--validade"), maisDias);
  if (!dias || *dias == 0) {
    Onde.UsoErrado(Traduzir(Texto::ValidadeErrada));
    return false;
  }
  Lido.Validade = *dias * segundosDoDia;
  return true;
}

bool TemExigidas(const Pedido& Feito, Relato& Onde) {
  for (const char* opcao : {"--chave", "--repositorio"}) {
    if (!Feito.Valor(opcao).empty()) continue;
    Onde.UsoErrado(Traduzir(Texto::FaltaAOpcao, {opcao}));
    return false;
  }
  return true;
}

// A key in the repository would be given to everybody.
std::optional<platform::SigningKey> LerChaveFora(const std::string& Arquivo, const Repositorio& Destino, Relato& Onde) {
  const Leitura lida = LerTudo(Arquivo);
  const auto chave = LerChave(lida.Conteudo);
  std::string motivo = lida.Falta;
  if (motivo.empty() && Destino.Contem(Arquivo)) motivo = Traduzir(Texto::ChaveNoRepositorio);
  if (motivo.empty() && !chave) motivo = Traduzir(Texto::NaoEhChave);
  if (!motivo.empty()) Onde.Recusar(Arquivo, motivo);
  return motivo.empty() ? chave : std::nullopt;
}

}  // namespace

std::optional<PedidoDePublicacao> LerPublicacao(const Pedido& Feito, Relato& Onde) {
  Desejo desejo;
  if (!TemExigidas(Feito, Onde) || !LerTitulo(Feito, desejo, Onde) || !LerEspelhos(Feito, desejo, Onde) ||
      !LerValidade(Feito, desejo, Onde)) {
    return std::nullopt;
  }
  const std::string diretorio = ComoDiretorio(Feito.Valor("--repositorio"));
  if (platform::GetFileAttributesA(diretorio.substr(0, diretorio.size() - 1)) && !EhDiretorio(diretorio)) {
    Onde.Recusar(Feito.Valor("--repositorio"), Traduzir(Texto::NaoEhDiretorio));
    return std::nullopt;
  }
  Repositorio destino(diretorio);
  const auto chave = LerChaveFora(CaminhoDoWindows(Feito.Valor("--chave")), destino, Onde);
  if (!chave) return std::nullopt;
  return PedidoDePublicacao{std::move(desejo),     *chave,
                            std::move(destino),    CaminhoDoWindows(Feito.Valor("--lista")),
                            Feito.Tem("--limpar"), Feito.Tem("--simular")};
}
