// Putting a game into the collection. Nothing here asks or tells: the caller does, by what comes back.
#pragma once

#include <functional>
#include <string>

#include "package/pacote.h"
#include "platform/files.h"

enum class Entrada {
  Feita,
  NaoLida,
  NaoGravada,
  Corrompida,
  Negada,       // the game that is there was not to be replaced
  SemCatalogo,  // done, but for the entry of the catalogue
};

using EntrePassos = std::function<void()>;  // called between long steps

// Copies a ROM file into the ROM directory as it is, over one of its name.
Entrada PorRom(const std::string& Caminho, const EntrePassos& Pausa);

// Puts a package's game into the collection: its files, and its entry of the catalogue unless the list shows the name
// already. `Substituir` is asked before another game is replaced, one of the same name or one that has its file's name.
Entrada PorJogo(const Pacote& Novo, bool NaLista, const std::function<bool()>& Substituir, const EntrePassos& Pausa);

// Whether the collection has this very game: name, DOS name, ROM and the picture that is shown.
bool JaEsta(const Pacote& Novo);

// What a package's ROM meets under its file name, which a game of another name can have. What cannot be seen or read
// counts as another ROM.
enum class Encontro { Nada, MesmaRom, OutraRom };
Encontro OQueEncontra(const Pacote& Novo);

// Writes a package's picture and ROM, which replace those that are there; with Keep the ROM takes the place of none. A
// package whose ROM has no checksum, since the file ends before it or within it, is NaoLida, and one whose checksum
// differs Corrompida, before anything changes. The new game is complete on the disk before the old one goes; when it
// cannot be written it is NaoGravada, and the old one stays.
Entrada PorPacote(const Pacote& Novo, platform::Existing RomExistente, const EntrePassos& Pausa);
