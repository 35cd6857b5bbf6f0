#include "support/mod_Globais.h"

std::string DirPrograma;
std::string ArquivoIdioma;
std::string DirRoms;
std::string DirSaves;
std::string DirImgs;
std::string ArquivoEmulador;
std::string ArquivoCfgEmulador;
