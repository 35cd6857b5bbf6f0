#include "keeper/mudanca.h"

#include <cstddef>

#include "catalog/cls_DAT.h"
#include "package/crc32.h"
#include "support/mod_Arquivos.h"
#include "support/mod_Globais.h"

namespace {

bool Mover(const std::string& De, const std::string& Para) {
  return platform::MoveFileExA(DirImgs + De, DirImgs + Para, platform::Existing::Keep);
}

// The last one first, and none behind one that fails: what is done stays a beginning of the steps.
bool Voltar(const std::vector<Movimento>& Passos, std::size_t Feitos) {
  while (Feitos > 0) {
    const Movimento& passo = Passos[--Feitos];
    if (!Mover(passo.Para, passo.De)) return false;
  }
  return true;
}

}  // namespace

std::optional<Impressao> ImpressaoDe(const std::string& Caminho) {
  platform::File arquivo(Caminho, platform::Access::Read);
  const auto conteudo = LerInteiro(arquivo);
  if (!conteudo) return std::nullopt;
  return Impressao{std::ssize(*conteudo), ~CRC32::Atualizar(CRC32::Inicial, *conteudo)};
}

std::vector<Movimento> MovimentosDe(const Mudanca& Qual) {
  std::vector<Movimento> passos;
  for (const FiguraMudada& cada : Qual.Figuras) {
    if (!cada.Provisorio.empty()) passos.push_back({cada.De, cada.Provisorio});
  }
  for (const FiguraMudada& cada : Qual.Figuras) {
    if (cada.Provisorio.empty()) passos.push_back({cada.De, cada.Para});
  }
  for (const FiguraMudada& cada : Qual.Figuras) {
    if (!cada.Provisorio.empty()) passos.push_back({cada.Provisorio, cada.Para});
  }
  return passos;
}

std::optional<Tropeco> Mudar(const std::vector<Movimento>& Passos, const TextoDoCatalogo& Antes,
                             const TextoDoCatalogo& Depois) {
  std::size_t feitos = 0;
  while (feitos < Passos.size() && Mover(Passos[feitos].De, Passos[feitos].Para)) ++feitos;
  const bool todos = feitos == Passos.size();
  if (todos && (Antes == Depois || TrocarCatalogo(Antes, Depois))) return std::nullopt;
  return Tropeco{todos ? CaminhoCatalogo() : DirImgs + Passos[feitos].De, Voltar(Passos, feitos)};
}
