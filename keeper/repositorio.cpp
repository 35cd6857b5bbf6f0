#include "keeper/repositorio.h"

#include <utility>

#include "keeper/argumentos.h"
#include "keeper/arquivos.h"
#include "keeper/motivos.h"
#include "platform/hash.h"
#include "platform/text.h"
#include "support/gravacao.h"
#include "support/mod_Arquivos.h"
#include "support/textos.h"

namespace {

// The directories of the files that are called as their hash, and how those end.
struct Pasta {
  std::string_view Nome, Padrao;
};
constexpr Pasta Pastas[] = {{"indice/", "*.txt"}, {"pacotes/", "*.tvk"}, {"figuras/", "*.gif;*.bmp;*.jpg"}};

bool TemNomeDeSoma(const std::string& Nome) {
  constexpr std::size_t extensao = 4;
  return Nome.size() > extensao && EhSoma(std::string_view(Nome).substr(0, Nome.size() - extensao));
}

}  // namespace

std::optional<Publicado> Repositorio::Ler(const platform::PublicKey& Chave, Relato& Onde) const {
  const std::string caminho = Caminho(NomeDaEntrada);
  if (!platform::FileSize(caminho) && !EhDiretorio(caminho)) return Publicado();
  const Leitura lida = LerTudo(caminho);
  const EntradaLida entrada = LerEntrada(lida.Conteudo);
  std::string motivo = lida.Falta;
  if (motivo.empty() && entrada.Porque.Qual != Recusa::Tipo::Nenhuma) motivo = MotivoDaRecusa(entrada.Porque);
  if (motivo.empty() && entrada.Entrada.Chave != Chave) motivo = Traduzir(Texto::DeOutraChave);
  if (!motivo.empty()) {
    Onde.Recusar(caminho, motivo);
    return std::nullopt;
  }
  auto jogos = LerJogos(entrada.Entrada.Indice, Onde);
  return jogos ? std::optional(Publicado{entrada.Entrada, std::move(*jogos)}) : std::nullopt;
}

std::optional<std::vector<JogoPublicado>> Repositorio::LerJogos(const ArquivoPublicado& Indice, Relato& Onde) const {
  const std::string caminho = Caminho(ArquivoDoIndice(Indice));
  const Leitura lido = LerTudo(caminho);
  const auto soma = platform::Sha256(lido.Conteudo);
  const bool inteiro = lido.Falta.empty() && soma && EmHexadecimal(*soma) == Indice.Soma;
  IndiceLido indice = LerIndice(lido.Conteudo);
  if (inteiro && indice.Porque.Qual == Recusa::Tipo::Nenhuma) return std::move(indice.Jogos);
  Onde.Recusar(caminho, lido.Falta.empty() ? Traduzir(Texto::IndiceDanificado) : lido.Falta);
  return std::nullopt;
}

bool Repositorio::Contem(const std::string& Caminho) const {
  const auto arquivo = platform::GetFinalPathNameA(Caminho), raiz = platform::GetFinalPathNameA(diretorio_);
  if (!arquivo) return true;
  if (!raiz) return platform::GetFileAttributesA(diretorio_).has_value();
  return platform::CharUpperBuffA(*arquivo).starts_with(platform::CharUpperBuffA(ComoDiretorio(*raiz)));
}

std::string Repositorio::Caminho(const std::string& Arquivo) const { return diretorio_ + CaminhoDoWindows(Arquivo); }

bool Repositorio::Tem(const std::string& Arquivo, std::string_view Conteudo) const {
  return TemConteudo(Caminho(Arquivo), Conteudo);
}

bool Repositorio::Por(const std::string& Arquivo, std::string_view Conteudo, platform::Existing Existente,
                      Relato& Onde) const {
  const std::string caminho = Caminho(Arquivo);
  if (TemConteudo(caminho, Conteudo) || GravarInteiro(caminho, Conteudo, Existente)) return true;
  Onde.Recusar(caminho, Traduzir(Texto::NaoFoiGravado));
  return false;
}

std::vector<std::string> Repositorio::Sobras(const std::set<std::string>& Usados) const {
  std::vector<std::string> sobras;
  for (const auto& [nome, padrao] : Pastas) {
    const std::string pasta(nome);
    for (const auto& arquivo : platform::ListDirectory(Caminho(pasta), std::string(padrao))) {
      if (TemNomeDeSoma(arquivo.Name) && !Usados.contains(pasta + arquivo.Name)) sobras.push_back(pasta + arquivo.Name);
    }
  }
  return sobras;
}

bool Repositorio::Apagar(const std::string& Arquivo, Relato& Onde) const {
  const std::string caminho = Caminho(Arquivo);
  if (platform::DeleteFileA(caminho)) return true;
  Onde.Recusar(caminho, Traduzir(Texto::NaoPodeSerApagado));
  return false;
}

void Repositorio::ApagarRestosDeEscrita() const {
  ApagarRestos(diretorio_);
  for (const Pasta& pasta : Pastas) ApagarRestos(Caminho(std::string(pasta.Nome)));
}
