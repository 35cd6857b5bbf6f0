// The program-wide texts. Start-up sets them; directories end with a backslash.
#pragma once

#include <cstdint>
#include <string>

// A truth value that is kept in a record or passed by reference: 16 bits.
using Booleano = std::int16_t;
inline constexpr Booleano Verdadeiro = -1;
inline constexpr Booleano Falso = 0;

extern std::string DirPrograma;         // the program's own directory
extern std::string ArquivoIdioma;       // the translation file, or empty: texts are shown as they are
extern std::string DirRoms;             // the games
extern std::string DirSaves;            // the emulator's save files
extern std::string DirImgs;             // the games' pictures
extern std::string ArquivoEmulador;     // the emulator's program file
extern std::string ArquivoCfgEmulador;  // the emulator's configuration file
