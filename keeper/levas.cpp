#include "keeper/levas.h"

#include <cstdint>
#include <optional>
#include <set>

#include "collection/jogo.h"
#include "package/pacote.h"
#include "platform/files.h"
#include "platform/text.h"
#include "support/mod_Globais.h"
#include "support/textos.h"

namespace {

using platform::CharUpperBuffA;

struct Leva {
  const Troca& Qual;
  FiguraMudada Figura;
};

bool Oculto(const std::string& Caminho) {
  constexpr std::uint32_t fora = platform::AttributeHidden | platform::AttributeSystem;  // of listings
  return (platform::GetFileAttributesA(Caminho).value_or(0) & fora) != 0;
}

// The name of a picture file as the disk has it; empty when there is none, and nothing when that cannot be told. A
// short name leads to another's file.
std::optional<std::string> NoDisco(const std::string& Nome) {
  const std::string caminho = DirImgs + Nome;
  if (!platform::FileSize(caminho)) return "";
  const auto entrada = platform::ListPath(caminho);
  if (!entrada) return Oculto(caminho) ? std::optional(Nome) : std::nullopt;
  return CharUpperBuffA(entrada->Name) == CharUpperBuffA(Nome) ? entrada->Name : "";
}

// Names in upper case that games keep.
std::set<std::string> NomesQueFicam(const Trocas& Pedidas) {
  std::set<std::string> mudam, ficam;
  for (const Troca& troca : Pedidas.Mudam) mudam.insert(troca.NomeDOS);
  for (const auto& [nomeDOS, nome] : Pedidas.ComOutrosNomes) {
    if (!mudam.contains(nomeDOS)) ficam.insert(CharUpperBuffA(nome));
  }
  return ficam;
}

std::vector<Leva> Achar(const Trocas& Pedidas, Relato& Onde) {
  std::vector<Leva> levas;
  std::set<std::string> fora = NomesQueFicam(Pedidas);
  for (const Troca& troca : Pedidas.Mudam) {
    if (!NomeSeguro(troca.Velho) || !fora.insert(CharUpperBuffA(troca.Velho)).second) continue;
    for (const char* extensao : ExtensoesDeImagem) {
      const auto nome = NoDisco(troca.Velho + extensao);
      if (!nome) Onde.Recusar(DirImgs + troca.Velho + extensao, Traduzir(Texto::NaoPodeSerLido));
      if (!nome.value_or("").empty()) {
        levas.push_back({troca, {*nome, "", troca.Novo + nome->substr(troca.Velho.size()), {}}});
      }
    }
  }
  return levas;
}

// Another picture of the new name would be shown in place of this one, or be lost.
void RecusarOcupados(const std::vector<Leva>& Levas, Relato& Onde) {
  std::set<std::string> saem, vistos;
  for (const Leva& leva : Levas) saem.insert(CharUpperBuffA(leva.Figura.De));
  for (const Leva& leva : Levas) {
    if (!vistos.insert(leva.Qual.NomeDOS).second) continue;
    for (const char* extensao : ExtensoesDeImagem) {
      const std::string nome = leva.Qual.Novo + extensao;
      if (saem.contains(CharUpperBuffA(nome)) || !platform::GetFileAttributesA(DirImgs + nome)) continue;
      Onde.Recusar(leva.Qual.Onde, Traduzir(Texto::JaHaFigura, {DirImgs + nome}));
    }
  }
}

void PorProvisorios(std::vector<Leva>& Levas, const std::string& Inicio) {
  std::set<std::string> esperados;
  for (const Leva& leva : Levas) esperados.insert(CharUpperBuffA(leva.Figura.Para));
  std::size_t quantos = 0;
  for (Leva& leva : Levas) {
    const std::string& nome = leva.Figura.De;
    if (!esperados.contains(CharUpperBuffA(nome))) continue;
    leva.Figura.Provisorio = Inicio + "." + std::to_string(++quantos) + nome.substr(nome.size() - 4);
  }
}

}  // namespace

std::vector<FiguraMudada> FigurasQueMudam(const Trocas& Pedidas, const std::string& Provisorio, Relato& Onde) {
  std::vector<Leva> levas = Achar(Pedidas, Onde);
  RecusarOcupados(levas, Onde);
  PorProvisorios(levas, Provisorio);
  std::vector<FiguraMudada> figuras;
  for (Leva& leva : levas) {
    const std::string caminho = DirImgs + leva.Figura.De;
    const auto impressao = ImpressaoDe(caminho);
    if (!impressao) Onde.Recusar(caminho, Traduzir(Texto::NaoPodeSerLido));
    leva.Figura.Conteudo = impressao.value_or(Impressao());
    figuras.push_back(std::move(leva.Figura));
  }
  return figuras;
}
