// Programs as the search for emulators tells them apart.
#pragma once

#include <string>

// A program for DOS that has so much of a header that it could say where the one for Windows is.
inline const std::string DosProgram = "MZ" + std::string(58, '\0') + std::string("\x40\0\0\0", 4);
inline const std::string WindowsProgram = DosProgram + std::string("PE\0\0", 4);
