// Putting a game into the collection. Nothing here asks or tells: the caller does, by what comes back.
#pragma once

#include <functional>
#include <string>

#include "package/pacote.h"
#include "platform/files.h"

enum class Entrada { Feita, NaoLida, NaoGravada, Corrompida };

using EntrePassos = std::function<void()>;  // called between long steps

// Copies a ROM file into the ROM directory as it is, over one of its name.
Entrada PorRom(const std::string& Caminho, const EntrePassos& Pausa);

// What a package's ROM meets under its file name, which a game of another name can have. What cannot be seen or read
// counts as another ROM.
enum class Encontro { Nada, MesmaRom, OutraRom };
Encontro OQueEncontra(const Pacote& Novo);

// Writes a package's picture and ROM, which replace those that are there; with Keep the ROM takes the place of none. A
// package whose ROM has no checksum, since the file ends before it or within it, is NaoLida, and one whose checksum
// differs Corrompida, before anything changes. The new game is complete on the disk before the old one goes; when it
// cannot be written it is NaoGravada, and the old one stays.
Entrada PorPacote(const Pacote& Novo, platform::Existing RomExistente, const EntrePassos& Pausa);
