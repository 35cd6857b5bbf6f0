// How files are written, so that a failure leaves the old contents. Positions are counted from 0.
#pragma once

#include <cstdint>
#include <string>
#include <string_view>

#include "platform/files.h"

// A file's new contents while they are written: a file beside it, whose name has a random mark. It is deleted at the
// end of the object's life unless it has taken the other one's name.
class ArquivoAoLado {
 public:
  explicit ArquivoAoLado(std::string Caminho);
  ~ArquivoAoLado();
  ArquivoAoLado(const ArquivoAoLado&) = delete;
  ArquivoAoLado& operator=(const ArquivoAoLado&) = delete;

  platform::File& Arquivo() { return arquivo_; }           // not open when none could be made
  const std::string& Provisorio() const { return nome_; }  // the path of the file beside

  // Closes it and gives it the name, when its contents are complete and on the disk. False: it is still beside.
  bool TomarNome(platform::Existing Existente);

  void Desistir();  // deletes it now

 private:
  std::string caminho_, nome_;
  platform::File arquivo_;
  bool existe_;  // under its own name
};

// The whole new contents of a file. They are on the disk, beside the file, before they take its name; where there is no
// room or no leave for that, they are written into the file itself.
class Substituicao {
 public:
  // Writes them beside the file. The text is kept as it is given, not copied. With Keep they take the name only when
  // no file has it.
  Substituicao(const std::string& Caminho, std::string_view Conteudo,
               platform::Existing Existente = platform::Existing::Replace);

  bool EstaAoLado() const { return estado_ == Estado::AoLado; }
  const std::string& Provisorio() const { return aoLado_.Provisorio(); }

  // Makes them the file's contents; once. False: the file is as it was, or there is none.
  bool Concluir();

 private:
  enum class Estado { AoLado, SemLugar, Recusada };  // Recusada: the disk does not keep what it is given
  Estado Preparar();

  std::string caminho_;
  std::string_view conteudo_;
  platform::Existing existente_;
  ArquivoAoLado aoLado_;
  Estado estado_;
};

struct Gravacao {
  std::string_view Texto;
  std::int64_t Posicao;  // -1: at the end
  bool Cortar;           // the file is to end behind the text
};

// Writes into the file itself, which is created when missing; with Keep only then. When that fails the old contents are
// put back; only a power cut meanwhile can leave a mixture.
bool GravarNoLugar(const std::string& Caminho, const Gravacao& Pedido,
                   platform::Existing Existente = platform::Existing::Replace);

// Whether the file can be written: the one that is there, or else one beside it, which is made and deleted.
bool PodeGravar(const std::string& Caminho);

// Deletes what writing files in this directory (its path ends with a backslash) has left half done: when the program
// was ended or the power went. What another program may still be writing stays.
void ApagarRestos(const std::string& Diretorio);
