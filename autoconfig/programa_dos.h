// Programs for DOS.
#pragma once

#include <string>

// Whether the file is a program for DOS or for 16-bit Windows: no 64-bit Windows starts them, and Tolvaris runs on no
// other. A file that is missing, cannot be read or is no program at all is none.
bool EhProgramaDoDos(const std::string& Caminho);
