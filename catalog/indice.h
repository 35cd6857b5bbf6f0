// An index over the catalogue's text that answers as the search from the first character does (catalog/busca.h),
// in a time that does not grow with the text. It keeps positions only; the text must stay as it is meanwhile.
#pragma once

#include <cstddef>
#include <cstdint>
#include <optional>
#include <string_view>
#include <vector>

// Positions of a text under the hash of what follows each of them, in chains that the text's end is put into first, so
// that each chain is in ascending order.
class CadeiasDePosicoes {
 public:
  void Reservar(std::size_t Capacidade);
  void PorNaFrente(std::uint64_t Hash, std::size_t Posicao);

  // The first link of the hash, and the next one of the same hash behind a link; Fim: there is none.
  std::uint32_t Primeiro(std::uint64_t Hash) const { return Avancar(primeiros_[Balde(Hash)], Hash); }
  std::uint32_t Proximo(std::uint32_t Atual, std::uint64_t Hash) const { return Avancar(elos_[Atual].Proximo, Hash); }
  std::size_t Posicao(std::uint32_t Atual) const { return elos_[Atual].Posicao; }
  static constexpr std::uint32_t Fim = 0xFFFFFFFF;

 private:
  struct Elo {
    std::uint32_t Posicao, Proximo;
    std::uint32_t Hash;  // its lower bits: links of other hashes are passed without a look at the text far away
  };
  std::size_t Balde(std::uint64_t Hash) const;
  std::uint32_t Avancar(std::uint32_t Atual, std::uint64_t Hash) const;

  std::vector<std::uint32_t> primeiros_;
  std::vector<Elo> elos_;
  int deslocamento_ = 64;
};

class Indice {
 public:
  // Takes a time in proportion to the length of the text, whatever is in it. Without the memory for an index, lookups
  // search the text.
  explicit Indice(std::string_view Dados);

  // The answers of BuscarNome and BuscarChave.
  std::optional<std::string_view> Nome(std::string_view Chave) const;
  std::optional<std::string_view> Chave(std::string_view Nome) const;

 private:
  void Montar();

  std::string_view dados_;
  bool montado_ = false;
  CadeiasDePosicoes chaves_;  // of each "|" that a key follows
  CadeiasDePosicoes nomes_;   // of each "=" that a name follows
};
