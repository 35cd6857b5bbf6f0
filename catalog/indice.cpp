#include "catalog/indice.h"

#include <algorithm>
#include <bit>
#include <new>

#include "catalog/busca.h"

namespace {

// A hash of the characters from the end of a text to its beginning, so that the one pass from the text's end to its
// beginning that builds the index has the hash of every run that it needs, however long the runs are.
constexpr std::uint64_t Fator = 0x100000001B3;

std::uint64_t Juntar(std::uint64_t Hash, char Caractere) {
  return (Hash + static_cast<unsigned char>(Caractere) + 1) * Fator;
}

std::uint64_t HashDe(std::string_view Texto) {
  std::uint64_t hash = 0;
  for (std::size_t i = Texto.size(); i-- > 0;) hash = Juntar(hash, Texto[i]);
  return hash;
}

// Whether "texto" and the character "fim" stand at the position.
bool EstaEm(std::string_view Dados, std::size_t Posicao, std::string_view Texto, char Fim) {
  return Dados.size() - Posicao > Texto.size() && Dados[Posicao + Texto.size()] == Fim &&
         Dados.compare(Posicao, Texto.size(), Texto) == 0;
}

// The position behind the first mark of a chain that is followed by the text and by "fim".
std::optional<std::size_t> Achar(const CadeiasDePosicoes& Cadeias, std::uint64_t Hash, std::string_view Dados,
                                 std::string_view Texto, char Fim) {
  for (auto elo = Cadeias.Primeiro(Hash); elo != CadeiasDePosicoes::Fim; elo = Cadeias.Proximo(elo, Hash)) {
    const std::size_t inicio = Cadeias.Posicao(elo) + 1;
    if (EstaEm(Dados, inicio, Texto, Fim)) return inicio;
  }
  return std::nullopt;
}

std::size_t Contar(std::string_view Dados, char Caractere) {
  std::size_t quantos = 0;
  for (auto i = Dados.find(Caractere); i != std::string_view::npos; i = Dados.find(Caractere, i + 1)) ++quantos;
  return quantos;
}

}  // namespace

void CadeiasDePosicoes::Reservar(std::size_t Capacidade) {
  const std::size_t baldes = std::bit_ceil(std::max<std::size_t>(Capacidade, 2));
  primeiros_.assign(baldes, Fim);
  elos_.reserve(Capacidade);
  deslocamento_ = 64 - std::countr_zero(baldes);
}

// The upper bits of a product depend on all bits of the hash.
std::size_t CadeiasDePosicoes::Balde(std::uint64_t Hash) const {
  return static_cast<std::size_t>((Hash * 0x9E3779B97F4A7C15) >> deslocamento_);
}

void CadeiasDePosicoes::PorNaFrente(std::uint64_t Hash, std::size_t Posicao) {
  std::uint32_t& primeiro = primeiros_[Balde(Hash)];
  elos_.push_back({static_cast<std::uint32_t>(Posicao), primeiro, static_cast<std::uint32_t>(Hash)});
  primeiro = static_cast<std::uint32_t>(elos_.size() - 1);
}

std::uint32_t CadeiasDePosicoes::Avancar(std::uint32_t Atual, std::uint64_t Hash) const {
  while (Atual != Fim && elos_[Atual].Hash != static_cast<std::uint32_t>(Hash)) Atual = elos_[Atual].Proximo;
  return Atual;
}

Indice::Indice(std::string_view Dados) : dados_(Dados) {
  if (Dados.size() >= CadeiasDePosicoes::Fim) return;
  try {
    Montar();
    montado_ = true;
  } catch (const std::bad_alloc&) {
    chaves_ = {};
    nomes_ = {};
  }
}

// A key is what lies between a "|" and a "=" with neither of the two between; a name is what lies between any "=" and
// the next "|", so that one entry with several "=" has several names.
void Indice::Montar() {
  const std::size_t iguais = Contar(dados_, '=');  // each ends at most one key, and begins at most one name
  chaves_.Reservar(iguais);
  nomes_.Reservar(iguais);
  bool igualDepois = false;                  // the next mark behind the position is a "="
  bool barraDepois = false;                  // a "|" lies behind the position
  std::uint64_t ateMarca = 0, ateBarra = 0;  // hashes of what lies between the position and them
  for (std::size_t i = dados_.size(); i-- > 0;) {
    const char c = dados_[i];
    if (c == '|') {
      if (igualDepois) chaves_.PorNaFrente(ateMarca, i);
      igualDepois = false;
      barraDepois = true;
      ateBarra = 0;
      continue;
    }
    if (c == '=') {
      if (barraDepois) nomes_.PorNaFrente(ateBarra, i);
      igualDepois = true;
      ateMarca = 0;
    } else {
      ateMarca = Juntar(ateMarca, c);
    }
    ateBarra = Juntar(ateBarra, c);
  }
}

// A wanted key with a "=" in it begins with the key that the index knows.
std::optional<std::string_view> Indice::Nome(std::string_view Chave) const {
  if (!montado_ || Chave.find('|') != std::string_view::npos) return BuscarNome(dados_, Chave);
  const auto inicio = Achar(chaves_, HashDe(Chave.substr(0, Chave.find('='))), dados_, Chave, '=');
  if (!inicio) return std::nullopt;
  return NomeEm(dados_, *inicio + Chave.size() + 1);
}

std::optional<std::string_view> Indice::Chave(std::string_view Nome) const {
  if (!montado_ || Nome.find('|') != std::string_view::npos) return BuscarChave(dados_, Nome);
  const auto inicio = Achar(nomes_, HashDe(Nome), dados_, Nome, '|');
  if (!inicio) return std::nullopt;
  return ChaveAntesDe(dados_, *inicio - 1);
}
