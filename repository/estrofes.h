// The syntax of a repository's two text files: lines "Chave: valor", in stanzas with an empty line between them. What
// comes from a repository is hostile until it has been read here.
#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

// Why a file is refused.
struct Recusa {
  enum class Tipo {
    Nenhuma,
    Grande,        // it is longer than such a file may be
    VersaoNova,    // it is for a newer program
    NaoEhTexto,    // no UTF-8, a control character, or a mark at the beginning
    LinhaLonga,    // more than 4,096 bytes
    LinhaErrada,   // no "Chave: valor", or without its end
    LinhaVazia,    // one that does not stand between two stanzas, or is not alone there
    LinhasDemais,  // more than 32 in one stanza
    LinhaAMais,    // behind what has to be the last one
    ChaveRepetida,
    FaltaChave,
    ValorErrado,
    ForaDeOrdem,
    NomeRepetido,
    AssinaturaErrada,
  };
  Tipo Qual = Tipo::Nenhuma;
  std::size_t Linha = 0;   // from 1; 0: the whole file
  std::string Chave = {};  // of the line, or the one that is missing

  bool operator==(const Recusa&) const = default;
};

struct Campo {
  std::size_t Linha;              // from 1
  std::string_view Chave, Valor;  // parts of the content
};

struct Estrofe {
  std::vector<Campo> Campos;  // not empty

  // Nothing when the stanza has no such key.
  std::optional<Campo> Achar(std::string_view Chave) const;
};

// A file's stanzas one after the other. Keys are ASCII letters, values are not empty, and only `Espelho` may stand
// twice in a stanza. The content has to last as long as its stanzas.
class LeitorDeEstrofes {
 public:
  // Refuses a content that is longer than this, in bytes, and one that is no plain text.
  LeitorDeEstrofes(std::string_view Conteudo, std::size_t Maior);

  // The next one; nothing at the end, and for good where the content is refused.
  std::optional<Estrofe> Proxima();

  const Recusa& Porque() const { return porque_; }

 private:
  std::optional<std::string_view> ProximaLinha();
  bool Acrescentar(Estrofe& Atual, std::string_view Texto);
  void Recusar(Recusa::Tipo Qual, std::string_view Chave = {});

  std::string_view resto_;
  std::size_t linha_ = 0;  // that was read last
  Recusa porque_;
};

// Whether a text can be the value of this key: of one line that is not too long, and without control characters.
bool PodeSerValor(std::string_view Chave, std::string_view Utf8);
