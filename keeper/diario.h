// A change as the file has it with which it can be taken back.
#pragma once

#include <optional>
#include <string>
#include <string_view>

#include "keeper/mudanca.h"

// A line that says what the file is, one with the lengths of the catalogue's two texts and the number of pictures, one
// for each picture, both texts, and a checksum of all that.
std::string EmTexto(const Mudanca& Qual);

// Nothing when the text is no such file, or not as it was written, or a name in it would leave the picture directory.
std::optional<Mudanca> DeTexto(std::string_view Texto);
