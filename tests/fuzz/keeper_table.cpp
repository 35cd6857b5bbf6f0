// The reader of keepers' tables, and what is made of archives of others. Each input is used as both, and as the fields
// of a line that is written and read back.
#include <algorithm>
#include <array>
#include <string>

#include "keeper/csv.h"
#include "keeper/zip.h"
#include "tests/fuzz/target.h"

namespace {

// Lines come in order, each with a field; their fields are no longer than the content.
void ReadAsTable(std::string_view content) {
  LeitorCsv table(content);
  std::size_t before = 0, bytes = 0;
  while (const auto line = table.Proxima()) {
    Require(line->Numero > before && !line->Campos.empty());
    before = line->Numero;
    for (const std::string& field : line->Campos) bytes += field.size();
  }
  Require(bytes <= content.size());
  Require(table.LinhaErrada() == 0 || table.LinhaErrada() > before);
  Require(!table.Proxima());
}

// The fields end at line feeds; the last one is all the rest, line ends included.
void WriteAndRead(std::string_view input) {
  std::array<std::string_view, 3> fields;
  for (std::string_view& field : fields) field = TakeLine(input);
  const std::string content = "a,b,c,d\r\n" + LinhaCsv({fields[0], fields[1], fields[2], input}) + "\r\n";
  LeitorCsv table(content);
  Require(table.Proxima().has_value());
  const auto line = table.Proxima();
  Require(line && line->Numero == 2 && line->Campos.size() == 4);
  Require(std::equal(fields.begin(), fields.end(), line->Campos.begin()) && line->Campos[3] == input);
  Require(!table.Proxima() && table.LinhaErrada() == 0);
}

// An archive that is taken stays one with a longer comment.
void ReadAsArchive(std::string_view content) {
  const auto end = FimDoZip(content);
  Require(!end || *end + 22 <= content.size());
  std::string longer(content);
  if (!AlongarComentario(longer)) return;
  Require(end && longer.size() == content.size() + 1 && FimDoZip(longer).has_value());
}

}  // namespace

void Test(std::string_view input) {
  ReadAsTable(input);
  WriteAndRead(input);
  ReadAsArchive(input);
}
