// The catalogue: which name belongs to which DOS name. It is one text file in the program's directory, which stays
// open, and which other programs may read and write meanwhile. Entries are only ever appended to it, except where no
// program has it open (catalog/reescrita.h).
#pragma once

#include <optional>
#include <string>

#include "catalog/indice.h"
#include "platform/files.h"
#include "support/mod_Globais.h"

// The path of its file.
std::string CaminhoCatalogo();

class cls_DAT {
 public:
  cls_DAT() = default;
  cls_DAT(const cls_DAT&) = delete;
  cls_DAT& operator=(const cls_DAT&) = delete;
  cls_DAT(cls_DAT&&) = delete;  // the index points into the text
  cls_DAT& operator=(cls_DAT&&) = delete;
  ~cls_DAT() = default;

  // Opens the file where it is not open yet, and reads it; without a readable file the catalogue is empty. Carregar,
  // for who adds to the catalogue, creates a missing file; Carregar2, for who only looks names up, leaves it missing
  // and needs no leave to write.
  void Carregar();
  void Carregar2();

  // Reads the file again; a file that has become empty, or cannot be read, leaves the catalogue as it was.
  void Atualizar();

  // Closes the file and empties the catalogue until it is loaded again.
  void Fechar();

  // The name of a DOS name, whose letter case does not matter, or the DOS name itself. `Encontrado` says which.
  std::string DefineNome(const std::string& DOSName, Booleano& Encontrado) const;

  // The DOS name of a name, in upper case, or the name itself. The name's letter case matters.
  std::string DefineDOSName(const std::string& Nome) const;

  // Appends an entry to the file, unless the catalogue as last read has the very same. Lookups find it after the next
  // Atualizar. An entry that cannot be written whole leaves the file as it was. False: it may not be on the disk.
  bool RegistrarRom(const std::string& Nome, const std::string& DOSName);

 private:
  void AbrirLeitura(const std::string& Caminho);
  void AbrirLeituraGravacao(const std::string& Caminho);
  void Ler();
  void Esquecer();
  const Indice& IndiceDosDados() const;

  platform::File numArquivo_;
  std::string dados_;                     // the file as it was last read
  bool aberto_ = false;                   // an open has been tried, whether or not it succeeded
  mutable std::optional<Indice> indice_;  // of dados_, made at the first lookup after a load
};

// The program's catalogue, created on first use.
cls_DAT& Catalogo();
