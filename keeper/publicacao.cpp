#include "keeper/publicacao.h"

#include <algorithm>
#include <map>

namespace {

constexpr std::int64_t ValidadeUsual = std::int64_t{365} * 86'400;  // seconds

std::int64_t Duracao(const EntradaDoRepositorio& Qual) { return Qual.Validade - Qual.Publicado; }

std::int64_t DuracaoDe(const std::optional<EntradaDoRepositorio>& Anterior, const Desejo& Pedido) {
  if (Pedido.Validade) return *Pedido.Validade;
  return Anterior && Duracao(*Anterior) > 0 ? Duracao(*Anterior) : ValidadeUsual;
}

using PorNomeDOS = std::map<std::string, const JogoPublicado*>;

PorNomeDOS Ordenados(const std::vector<JogoPublicado>& Jogos) {
  PorNomeDOS ordenados;
  for (const JogoPublicado& jogo : Jogos) ordenados[jogo.NomeDOS] = &jogo;
  return ordenados;
}

}  // namespace

std::optional<EntradaDoRepositorio> NovaEntrada(const std::optional<EntradaDoRepositorio>& Anterior,
                                                const Desejo& Pedido, const ArquivoPublicado& Indice,
                                                std::int64_t Agora) {
  EntradaDoRepositorio nova = Anterior.value_or(EntradaDoRepositorio());
  nova.Titulo = Pedido.Titulo.value_or(nova.Titulo);
  if (nova.Titulo.empty()) return std::nullopt;
  nova.Espelhos = Pedido.Espelhos.value_or(nova.Espelhos);
  nova.Serie = std::max(Agora, nova.Serie + 1);
  nova.Publicado = Agora;
  nova.Validade = Agora + DuracaoDe(Anterior, Pedido);
  nova.Indice = Indice;
  return nova;
}

bool PodeFicar(const std::optional<EntradaDoRepositorio>& Anterior, const EntradaDoRepositorio& Nova,
               std::int64_t Agora) {
  if (!Anterior || Anterior->Validade - Agora <= Duracao(*Anterior) / 2) return false;
  return Anterior->Titulo == Nova.Titulo && Anterior->Espelhos == Nova.Espelhos && Anterior->Indice == Nova.Indice &&
         Duracao(*Anterior) == Duracao(Nova);
}

std::vector<JogoMudado> Diferencas(const std::vector<JogoPublicado>& Antes, const std::vector<JogoPublicado>& Depois) {
  const PorNomeDOS antes = Ordenados(Antes), depois = Ordenados(Depois);
  std::vector<JogoMudado> mudados;
  for (const auto& [nomeDOS, jogo] : depois) {
    const auto igual = antes.find(nomeDOS);
    if (igual == antes.end()) {
      mudados.push_back({Novidade::Novo, nomeDOS, jogo->Nome});
    } else if (*igual->second != *jogo) {
      mudados.push_back({Novidade::Mudou, nomeDOS, jogo->Nome});
    }
  }
  for (const auto& [nomeDOS, jogo] : antes) {
    if (!depois.contains(nomeDOS)) mudados.push_back({Novidade::Saiu, nomeDOS, jogo->Nome});
  }
  std::ranges::stable_sort(mudados, {}, &JogoMudado::NomeDOS);
  return mudados;
}

std::set<std::string> ArquivosDe(const ArquivoPublicado& Indice, const std::vector<JogoPublicado>& Jogos) {
  std::set<std::string> arquivos = {ArquivoDoIndice(Indice)};
  for (const JogoPublicado& jogo : Jogos) {
    arquivos.insert(ArquivoDoPacote(jogo));
    if (!jogo.ExtensaoDaFigura.empty()) arquivos.insert(ArquivoDaFigura(jogo));
  }
  return arquivos;
}
