#include "keeper/arquivos.h"

#include <algorithm>
#include <array>
#include <memory>

#include "support/caminhos.h"
#include "support/gravacao.h"
#include "support/mod_Arquivos.h"
#include "support/textos.h"

namespace {

Leitura Falta(Texto Qual) { return {"", Traduzir(Qual)}; }

}  // namespace

Leitura LerTudo(const std::string& Caminho) {
  if (EhDiretorio(Caminho)) return Falta(Texto::EhUmDiretorio);
  platform::File arquivo(Caminho, platform::Access::Read);
  if (!arquivo.IsOpen() && !platform::GetFileAttributesA(Caminho)) return Falta(Texto::NaoExiste);
  const std::int64_t tamanho = arquivo.Size();
  if (tamanho > MaiorArquivo) return Falta(Texto::GrandeDemais);
  auto conteudo = tamanho < 0 ? std::nullopt : LerInteiro(arquivo);
  if (!conteudo || static_cast<std::int64_t>(conteudo->size()) != tamanho) return Falta(Texto::NaoPodeSerLido);
  if (tamanho == 0) return Falta(Texto::EstaVazio);
  return {std::move(*conteudo), ""};
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
