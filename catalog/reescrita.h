// The catalogue written anew as a whole, for who gives other names to games that it has. Who only adds entries appends
// them (cls_DAT).
#pragma once

#include <optional>
#include <string>
#include <string_view>
#include <vector>

struct NomeNovo {
  std::string DOSName;  // in upper case, without "|" and "="
  std::string Nome;     // without "|" and "="
};

// The catalogue's text after these DOS names, none of them twice, have got these names: lookups of either give the
// other, and all other names and DOS names are found as before, but where one of the names was another entry's too.
std::string ComNomes(std::string_view Dados, const std::vector<NomeNovo>& Novos);

using TextoDoCatalogo = std::optional<std::string>;  // nothing: there is no file

// Reads the file, which no other program has open at that moment. False: one has, or it cannot be read or written.
bool LerSozinho(TextoDoCatalogo& Texto);

// Puts the new text, whole, in the old one's place, or deletes the file. False, and nothing has changed: a program has
// the file open, the text is no longer the old one, or the new one cannot be written.
bool TrocarCatalogo(const TextoDoCatalogo& Antes, const TextoDoCatalogo& Depois);
