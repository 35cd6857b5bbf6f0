#include "keeper/lista.h"

#include <algorithm>
#include <optional>

#include "keeper/arquivos.h"
#include "keeper/codificacao.h"
#include "keeper/csv.h"
#include "platform/text.h"
#include "support/brancos.h"
#include "support/textos.h"

namespace {

using Colunas = std::vector<std::string>;

std::string EmMinusculas(std::string texto) {
  for (char& letra : texto) {
    if (letra >= 'A' && letra <= 'Z') letra = static_cast<char>(letra - 'A' + 'a');
  }
  return texto;
}

std::string Lugar(const std::string& arquivo, std::size_t linha) { return arquivo + ":" + std::to_string(linha); }

Colunas LerColunas(LeitorCsv& tabela) {
  const auto primeira = tabela.Proxima();
  Colunas colunas;
  if (primeira) {
    for (const std::string& nome : primeira->Campos)
      colunas.push_back(EmMinusculas(std::string(SemBrancos(nome, " \t"))));
  }
  return colunas;
}

// Why a line cannot be used; the empty text when it can, and its fields are in `lida`.
std::string LerCampos(const std::vector<std::string>& utf8, const Colunas& colunas, LinhaDaLista& lida) {
  if (utf8.size() > colunas.size()) return Traduzir(Texto::CamposDemais);
  for (std::size_t i = 0; i < utf8.size(); ++i) {
    const auto campo = platform::FromUtf8Exactly(SemBrancos(utf8[i], " \t"));
    if (!campo) return colunas[i] + ": " + Traduzir(Texto::ForaDaPaginaDeCodigo);
    lida.Campos[colunas[i]] = *campo;
  }
  return "";
}

std::string FaltaExigida(const LinhaDaLista& lida, const Colunas& exigidas) {
  const auto vazia = std::ranges::find_if(exigidas, [&](const auto& nome) { return lida.Campo(nome).empty(); });
  return vazia == exigidas.end() ? "" : Traduzir(Texto::FaltaOCampo, {*vazia});
}

bool TemColunas(const std::string& arquivo, const Colunas& colunas, const Colunas& exigidas, Relato& onde) {
  const auto falta = std::ranges::find_if(
      exigidas, [&](const auto& nome) { return std::ranges::find(colunas, nome) == colunas.end(); });
  if (falta == exigidas.end()) return true;
  onde.Recusar(Lugar(arquivo, 1), Traduzir(Texto::FaltaAColuna, {*falta}));
  return false;
}

}  // namespace

std::string LinhaDaLista::Campo(const std::string& Nome) const {
  const auto achado = Campos.find(Nome);
  return achado == Campos.end() ? "" : achado->second;
}

std::vector<LinhaDaLista> LerLista(const std::string& Arquivo, const std::vector<std::string>& Exigidas, Relato& Onde) {
  const Leitura lida = LerTudo(Arquivo);
  if (!lida.Falta.empty()) {
    Onde.Recusar(Arquivo, lida.Falta);
    return {};
  }
  const std::string utf8 = EmUtf8(lida.Conteudo);
  LeitorCsv tabela(utf8);
  const Colunas colunas = LerColunas(tabela);
  std::vector<LinhaDaLista> linhas;
  if (tabela.LinhaErrada() == 0 && !TemColunas(Arquivo, colunas, Exigidas, Onde)) return {};
  while (const auto linha = tabela.Proxima()) {
    LinhaDaLista nova{Lugar(Arquivo, linha->Numero), {}};
    std::string falta = LerCampos(linha->Campos, colunas, nova);
    if (falta.empty()) falta = FaltaExigida(nova, Exigidas);
    if (falta.empty()) {
      linhas.push_back(std::move(nova));
    } else {
      Onde.Recusar(nova.Onde, falta);
    }
  }
  if (tabela.LinhaErrada() != 0) Onde.Recusar(Lugar(Arquivo, tabela.LinhaErrada()), Traduzir(Texto::AspasErradas));
  return linhas;
}
