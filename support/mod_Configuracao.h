// Where the program is installed, and the paths of its settings.
#pragma once

#include <string>

#include "support/cls_REG.h"

// Sets DirPrograma.
void DefinirDirPrograma();

// Sets ArquivoIdioma to "language.ini" beside the program, or to the empty text when there is none.
void EscolherIdioma();

// Sets the directories and the emulator's two files from the settings RomDir, SaveDir, ImgDir, EmuExe and EmuCFG. A
// directory that is not set is one of the program's own; a file that is not set is empty.
void LerCaminhos(const cls_REG& Registro);

// A path of the settings: the default, as it is, when the text is empty; a leading backslash of the text stands for
// DirPrograma.
std::string CaminhoConfigurado(const std::string& Texto, const std::string& Padrao);
