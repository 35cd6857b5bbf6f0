// Starting other programs.
#pragma once

#include <cstdint>
#include <string>

// The text as one argument of a command line: in quotes when there is a blank in it, else as it is.
std::string Argumento(const std::string& Texto);

// Starts the program at the beginning of the command line, which is passed on as it stands; false when it cannot be
// started. One that must run as an administrator is started once the person has agreed. `Prioridade` says how the
// program shares the processor with others, for one that should give way or must not wait: 1 idle, 2 normal, 3 high,
// 4 realtime, any other number normal. An empty `Diretorio` becomes the command line up to its last backslash, without
// what stands before the absolute path that this lies in. With `Esperar` it returns when the program has ended; pending
// events run at least every `Intervalo` milliseconds meanwhile.
bool ExecutarPrograma(const std::string& Comando, std::uint32_t Intervalo, bool Esperar, int Prioridade,
                      std::string& Diretorio);
