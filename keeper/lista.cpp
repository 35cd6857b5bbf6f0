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

using NomesDeColunas = std::vector<std::string>;

std::string EmMinusculas(std::string Texto) {
  for (char& letra : Texto) {
    if (letra >= 'A' && letra <= 'Z') letra = static_cast<char>(letra - 'A' + 'a');
  }
  return Texto;
}

std::string Lugar(const std::string& Arquivo, std::size_t Linha) { return Arquivo + ":" + std::to_string(Linha); }

NomesDeColunas LerColunas(LeitorCsv& Tabela) {
  const auto primeira = Tabela.Proxima();
  NomesDeColunas colunas;
  if (primeira) {
    for (const std::string& nome : primeira->Campos)
      colunas.push_back(EmMinusculas(std::string(SemBrancos(nome, " \t"))));
  }
  return colunas;
}

// Why a line cannot be used; the empty text when it can, and its fields are in `lida`.
std::string LerCampos(const std::vector<std::string>& Utf8, const NomesDeColunas& Colunas, LinhaDaLista& Lida) {
  if (Utf8.size() > Colunas.size()) return Traduzir(Texto::CamposDemais);
  for (std::size_t i = 0; i < Utf8.size(); ++i) {
    const auto campo = platform::FromUtf8Exactly(SemBrancos(Utf8[i], " \t"));
    if (!campo) return Colunas[i] + ": " + Traduzir(Texto::ForaDaPaginaDeCodigo);
    Lida.Campos[Colunas[i]] = *campo;
  }
  return "";
}

std::string FaltaExigida(const LinhaDaLista& Lida, const NomesDeColunas& Exigidas) {
  const auto vazia = std::ranges::find_if(Exigidas, [&](const auto& Nome) { return Lida.Campo(Nome).empty(); });
  return vazia == Exigidas.end() ? "" : Traduzir(Texto::FaltaOCampo, {*vazia});
}

bool TemColunas(const std::string& Arquivo, const NomesDeColunas& Colunas, const NomesDeColunas& Exigidas,
                Relato& Onde) {
  const auto falta = std::ranges::find_if(
      Exigidas, [&](const auto& Nome) { return std::ranges::find(Colunas, Nome) == Colunas.end(); });
  if (falta == Exigidas.end()) return true;
  Onde.Recusar(Lugar(Arquivo, 1), Traduzir(Texto::FaltaAColuna, {*falta}));
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
  const NomesDeColunas colunas = LerColunas(tabela);
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
