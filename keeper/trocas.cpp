#include "keeper/trocas.h"

#include <set>

#include "catalog/indice.h"
#include "collection/jogo.h"
#include "keeper/lista.h"
#include "keeper/motivos.h"
#include "platform/files.h"
#include "platform/text.h"
#include "support/caminhos.h"
#include "support/mod_Globais.h"
#include "support/textos.h"

namespace {

// Why a line cannot be, looked at by itself. A game's file can have a longer name than a DOS name has, but none that
// the catalogue cannot hold.
Motivos MotivosDaLinha(const Troca& Pedida, const NomesMostrados& Nomes) {
  if (!Nomes.contains(Pedida.NomeDOS)) return {Traduzir(Texto::NaoHaEsseJogo, {Pedida.NomeDOS})};
  if (Pedida.NomeDOS.find('=') != std::string::npos) {
    return {Traduzir(Texto::NomeDOSErrado, {Pedida.NomeDOS, Traduzir(Texto::NomeComCaractere, {"="})})};
  }
  return MotivosDoNome(Pedida.Novo);
}

// The DOS names by the shown names in upper case.
std::multimap<std::string, std::string> PorNome(const NomesMostrados& Nomes) {
  std::multimap<std::string, std::string> porNome;
  for (const auto& [nomeDOS, nome] : Nomes) porNome.emplace(platform::CharUpperBuffA(nome), nomeDOS);
  return porNome;
}

void RecusarRepetidos(const Trocas& Lidas, Relato& Onde) {
  const auto porNome = PorNome(Lidas.ComOutrosNomes);
  for (const Troca& troca : Lidas.Mudam) {
    const auto [primeiro, fim] = porNome.equal_range(platform::CharUpperBuffA(troca.Novo));
    for (auto outro = primeiro; outro != fim; ++outro) {
      if (outro->second == troca.NomeDOS) continue;
      Onde.Recusar(troca.Onde, Traduzir(Texto::NomeDeOutro, {troca.Novo, outro->second}));
      break;
    }
  }
}

}  // namespace

NomesMostrados NomesDaColecao(const TextoDoCatalogo& Catalogo) {
  const Indice indice(Catalogo ? std::string_view(*Catalogo) : std::string_view());
  NomesMostrados nomes;
  for (const auto& arquivo : platform::ListDirectory(DirRoms, PadraoRoms)) {
    const auto base = NomeBase(arquivo.Name);
    if (!base) continue;
    const std::string nomeDOS = platform::CharUpperBuffA(*base);
    nomes[nomeDOS] = std::string(indice.Nome(nomeDOS).value_or(*base));
  }
  return nomes;
}

Trocas LerTrocas(const std::string& Lista, const NomesMostrados& Nomes, Relato& Onde) {
  Trocas lidas;
  lidas.ComOutrosNomes = Nomes;
  std::set<std::string> vistos;
  for (const LinhaDaLista& linha : LerLista(Lista, {"dos", "nome"}, Onde)) {
    Troca troca{linha.Onde, platform::CharUpperBuffA(linha.Campo("dos")), "", linha.Campo("nome")};
    Motivos motivos = MotivosDaLinha(troca, Nomes);
    if (!vistos.insert(troca.NomeDOS).second) motivos = {Traduzir(Texto::NomeDOSRepetido, {troca.NomeDOS})};
    for (const std::string& motivo : motivos) Onde.Recusar(troca.Onde, motivo);
    if (!motivos.empty()) continue;
    troca.Velho = Nomes.at(troca.NomeDOS);
    lidas.ComOutrosNomes[troca.NomeDOS] = troca.Novo;
    if (troca.Velho == troca.Novo) {
      ++lidas.Iguais;
    } else {
      lidas.Mudam.push_back(std::move(troca));
    }
  }
  RecusarRepetidos(lidas, Onde);
  return lidas;
}
