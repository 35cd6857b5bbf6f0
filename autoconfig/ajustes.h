// The settings that this program fills in, and what they become.
#pragma once

#include <array>
#include <optional>
#include <string>

#include "support/cls_REG.h"
#include "support/mensagens.h"

// As the settings hold them: a leading backslash stands for the program's directory; empty: not set.
struct Ajustes {
  std::string RomDir, SaveDir, ImgDir;  // directories, with a backslash at their end
  std::string EmuExe, EmuCFG;           // the emulator's program and configuration files
};

struct NomeDeAjuste {
  const char* Nome;
  std::string Ajustes::*Texto;
};

// In the order in which they are written: only with the last one is the program configured.
inline constexpr std::array<NomeDeAjuste, 5> NomesDosAjustes = {{{"RomDir", &Ajustes::RomDir},
                                                                 {"SaveDir", &Ajustes::SaveDir},
                                                                 {"ImgDir", &Ajustes::ImgDir},
                                                                 {"EmuExe", &Ajustes::EmuExe},
                                                                 {"EmuCFG", &Ajustes::EmuCFG}}};

Ajustes LerAjustes(const cls_REG& Registro);

// Writes what differs from the settings. False when they do not hold all of it afterwards.
bool GravarAjustes(const cls_REG& Registro, const Ajustes& Novos);

// What the settings become for an emulator, or with the empty text for none. What is set stays, but for the emulator's
// two files when the person has chosen another one.
Ajustes AjustesPara(const std::string& Emulador, const Ajustes& Atuais, bool Outro);

// A path for the settings: inside the program's directory it is written with the leading backslash.
std::string CaminhoRelativo(const std::string& Caminho);

// The emulator's path for the settings. The play command begins its command line with it, without quotes: where it has
// blanks it is written in 8.3 form, if the disk gives one without.
std::string AjusteDoEmulador(const std::string& Emulador);

// Whether such a command line would end the emulator's path too early.
bool TemBranco(const std::string& Caminho);

// The configuration file that the emulator reads, in its directory.
std::string ConfiguracaoDoEmulador(const std::string& Emulador);

// The message that says what keeps a text from being used as a setting; nothing when nothing does.
std::optional<Mensagem> Impedimento(const std::string& Texto);
