#include "keeper/arquivos.h"

#include <algorithm>
#include <array>
#include <memory>
#include <new>

#include "support/caminhos.h"
#include "support/gravacao.h"
#include "support/mod_Arquivos.h"
#include "support/textos.h"

namespace {

Texto PorQueNaoAbre(const std::string& Caminho) {
  const auto atributos = platform::GetFileAttributesA(Caminho);
  if (!atributos) return Texto::NaoExiste;
  return (*atributos & platform::AttributeDirectory) != 0 ? Texto::EhUmDiretorio : Texto::NaoPodeSerLido;
}

bool DarTamanho(std::string& Texto, std::int64_t Tamanho) {
  try {
    Texto.resize(static_cast<std::size_t>(Tamanho));
    return true;
  } catch (const std::bad_alloc&) {
    return false;
  }
}

}  // namespace

std::string LerPara(std::string& Conteudo, const std::string& Caminho) {
  platform::File arquivo(Caminho, platform::Access::Read);
  if (!arquivo.IsOpen()) return Traduzir(PorQueNaoAbre(Caminho));
  const std::int64_t tamanho = arquivo.Size();
  if (tamanho > MaiorArquivo) return Traduzir(Texto::GrandeDemais);
  if (tamanho == 0) return Traduzir(Texto::EstaVazio);
  if (tamanho > 0 && !DarTamanho(Conteudo, tamanho)) return Traduzir(Texto::SemMemoria);
  const bool lido = tamanho > 0 && arquivo.Read(0, Conteudo.data(), Conteudo.size()) == tamanho;
  return lido ? "" : Traduzir(Texto::NaoPodeSerLido);
}

Leitura LerTudo(const std::string& Caminho) {
  Leitura lida;
  lida.Falta = LerPara(lida.Conteudo, Caminho);
  if (!lida.Falta.empty()) lida.Conteudo.clear();
  return lida;
}

Escrita GravarSeMuda(const std::string& Caminho, std::string_view Conteudo, platform::Existing Existente) {
  if (TemConteudo(Caminho, Conteudo)) return Escrita::Igual;
  if (Existente == platform::Existing::Keep && platform::GetFileAttributesA(Caminho)) return Escrita::Outro;
  CriarCaminho(Caminho);
  return Substituicao(Caminho, Conteudo, Existente).Concluir() ? Escrita::Feita : Escrita::Falhou;
}

bool TemConteudo(const std::string& Caminho, std::string_view Conteudo) {
  using Pedaco = std::array<char, 65'536>;
  platform::File arquivo(Caminho, platform::Access::Read);
  if (arquivo.Size() != static_cast<std::int64_t>(Conteudo.size())) return false;
  const auto pedaco = std::make_unique_for_overwrite<Pedaco>();
  for (std::size_t posicao = 0; posicao < Conteudo.size(); posicao += pedaco->size()) {
    const std::string_view parte = Conteudo.substr(posicao, pedaco->size());
    const std::int64_t lidos = arquivo.Read(static_cast<std::int64_t>(posicao), pedaco->data(), parte.size());
    if (lidos != static_cast<std::int64_t>(parte.size())) return false;
    if (!std::equal(parte.begin(), parte.end(), pedaco->begin())) return false;
  }
  return true;
}

bool GravarInteiro(const std::string& Caminho, std::string_view Conteudo, platform::Existing Existente) {
  CriarCaminho(Caminho);
  ArquivoAoLado novo(Caminho);
  return novo.Arquivo().Write(0, Conteudo) && novo.Arquivo().Flush() && novo.TomarNome(Existente);
}

bool EhDiretorio(const std::string& Caminho) {
  return (platform::GetFileAttributesA(Caminho).value_or(0) & platform::AttributeDirectory) != 0;
}
