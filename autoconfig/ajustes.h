// The settings that this program fills in, and what they become.
#pragma once

#include <optional>
#include <string>

#include "support/cls_REG.h"
#include "support/mensagens.h"
#include "support/mod_Configuracao.h"

// Writes what differs from the settings. False when they do not hold all of it afterwards.
bool GravarAjustes(const cls_REG& Registro, const Ajustes& Novos);

// What the settings become for an emulator, or with the empty text for none. What is set stays, but for the emulator's
// two files when the person has chosen another one; a directory without its last backslash gets it.
Ajustes AjustesPara(const std::string& Emulador, const Ajustes& Atuais, bool Outro);

// A path for the settings: inside the program's directory it is written with the leading backslash.
std::string CaminhoRelativo(const std::string& Caminho);

// The configuration file that the emulator reads, in its directory.
std::string ConfiguracaoDoEmulador(const std::string& Emulador);

// The message that says what keeps a text from being used as a setting; nothing when nothing does.
std::optional<Mensagem> Impedimento(const std::string& Texto);
