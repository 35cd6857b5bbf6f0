// The catalogue. The input's first two lines are a DOS name and a name, the rest is the file: the index must answer
// what the plain search does, and an entry that is registered must be found, without changing an answer that was there.
#include <algorithm>
#include <optional>
#include <string>

#include "catalog/busca.h"
#include "catalog/cls_DAT.h"
#include "platform/simulated/simulated.h"
#include "platform/text.h"
#include "tests/fuzz/target.h"

namespace {

using namespace platform::simulated;
using Found = std::optional<std::string_view>;

const std::string File = "C:\\Tolvaris\\tolvaris.dat";

void Compare(const Indice& index, std::string_view data, std::string_view wanted) {
  Require(index.Nome(wanted) == BuscarNome(data, wanted));
  Require(index.Chave(wanted) == BuscarChave(data, wanted));
}

// Looks up every piece between two marks of the text, and every two neighbours with the mark between them.
void CompareAll(std::string_view data) {
  const Indice index(data);
  std::size_t before = 0;
  for (std::size_t start = 0; start <= data.size();) {
    const std::size_t end = std::min(data.find_first_of("|=", start), data.size());
    Compare(index, data, data.substr(start, end - start));
    Compare(index, data, data.substr(before, end - before));
    before = start;
    start = end + 1;
  }
}

void Register(const std::string& name, const std::string& dosName, const std::string& data) {
  const std::string key = platform::CharUpperBuffA(dosName), entry = "|" + key + "=" + name + "|";
  const Found oldName = BuscarNome(data, key), oldKey = BuscarChave(data, name);
  PutFile(File, data);
  cls_DAT catalogue;
  catalogue.Carregar();
  catalogue.RegistrarRom(name, dosName);
  catalogue.Atualizar();
  const std::string after = Content(File).value();
  Require(after == (data.find(entry) == std::string::npos ? data + entry : data));

  Booleano found = Falso;
  const std::string nameNow = catalogue.DefineNome(dosName, found), keyNow = catalogue.DefineDOSName(name);
  Require(found == Verdadeiro);
  Require(nameNow == BuscarNome(after, key) && keyNow == BuscarChave(after, name));
  if (oldName) Require(nameNow == *oldName);
  if (oldKey) Require(keyNow == *oldKey);
  if ((name + key).find('|') != std::string::npos) return;
  if (!oldName) Require(nameNow == name);
  if (!BuscarChave(data + "|", name)) Require(keyNow == key);
}

}  // namespace

void Test(std::string_view input) {
  DirPrograma = "C:\\Tolvaris\\";
  const std::string dosName(TakeLine(input)), name(TakeLine(input));
  const Indice index(input);
  Compare(index, input, dosName);
  Compare(index, input, name);
  CompareAll(input);
  Register(name, dosName, std::string(input));
}
