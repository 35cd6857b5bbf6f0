// Where the program is installed, and the paths of its settings.
#pragma once

#include <array>
#include <string>

#include "support/cls_REG.h"
#include "support/mod_Globais.h"

// Sets DirPrograma.
void DefinirDirPrograma();

// Sets ArquivoIdioma to "language.ini" beside the program, or to the empty text when there is none.
void EscolherIdioma();

// The paths of the settings, as they are stored there: a leading backslash stands for DirPrograma; empty: not set.
struct Ajustes {
  std::string RomDir, SaveDir, ImgDir;  // directories
  std::string EmuExe, EmuCFG;           // the emulator's program and configuration files
};

struct AjusteDeCaminho {
  const char* Nome;
  std::string Ajustes::*Texto;
  std::string* Destino;  // what the program makes of it
  const char* Padrao;    // the text that counts while it is not set
  bool EhDiretorio;      // it ends with a backslash
};

// In the order in which they are written: only with the last one is the program configured.
inline constexpr std::array<AjusteDeCaminho, 5> AjustesDeCaminhos = {
    {{"RomDir", &Ajustes::RomDir, &DirRoms, "\\Roms\\", true},
     {"SaveDir", &Ajustes::SaveDir, &DirSaves, "\\Saves\\", true},
     {"ImgDir", &Ajustes::ImgDir, &DirImgs, "\\Imgs\\", true},
     {"EmuExe", &Ajustes::EmuExe, &ArquivoEmulador, "", false},
     {"EmuCFG", &Ajustes::EmuCFG, &ArquivoCfgEmulador, "", false}}};

// The paths that stand in the settings.
Ajustes LerAjustes(const cls_REG& Registro);

// Sets the program's directories and the emulator's two files from the settings. A directory that is not set is one of
// the program's own; a file that is not set is empty.
void LerCaminhos(const cls_REG& Registro);

// The path that a text of the settings stands for.
std::string CaminhoConfigurado(const std::string& Texto);
