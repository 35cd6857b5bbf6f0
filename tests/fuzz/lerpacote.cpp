// A libFuzzer target for the reader of packages. Each input is used twice: as a package's content, and as the five
// pieces of a package to be written and read back. scripts/fuzz builds and runs it.
#include <algorithm>
#include <array>
#include <cstdint>
#include <cstdlib>
#include <iterator>
#include <string>
#include <string_view>

#include "package/pacote.h"
#include "platform/text.h"

namespace {

constexpr std::size_t MaiorCabecalho = 10'240;

// What no text may hold that is to be read back as it was written.
constexpr std::array<std::string_view, 9> Reservados = {
    "NOME=", "NOMEDOS=", "CRC=", "IIMG=", "TIMG=", "IROM=", "TROM=", "\r\n", "|IMGROMDAT|"};

void Exigir(bool condicao) {
  if (!condicao) std::abort();
}

bool Livre(std::string_view texto) {
  const std::string maiusculas = platform::CharUpperBuffA(std::string(texto));
  return std::ranges::none_of(
      Reservados, [&](std::string_view reservado) { return maiusculas.find(reservado) != std::string::npos; });
}

// Writes these pieces and reads them: what comes back is what was written, or is refused where it has to be.
void EscreverELer(std::string_view nome, std::string_view dosName, std::string_view crc, std::string_view imagem,
                  std::string_view rom) {
  const std::string conteudo = MontarPacote(nome, dosName, crc, std::ssize(imagem), std::ssize(rom), imagem, rom);
  const auto lido = LerPacote(conteudo);
  if (!Livre(nome) || !Livre(dosName) || !Livre(crc)) return;
  const bool cabe = conteudo.size() - imagem.size() - rom.size() <= MaiorCabecalho;
  const bool inteiro = !imagem.empty() && !rom.empty() && NomeDeArquivo(nome) && NomeDeArquivo(dosName);
  Exigir(lido.has_value() == (cabe && inteiro));
  if (!lido) return;
  Exigir(lido->Nome == nome && lido->DOSName == dosName && lido->CRC == crc && lido->Imagem == imagem &&
         lido->Rom == rom);
}

// A block that is no part of the content is found when it is written.
void LerComoPacote(std::string_view conteudo) {
  const auto lido = LerPacote(conteudo);
  if (!lido) return;
  Exigir((lido->Nome + lido->DOSName).find_first_of(std::string_view("\\/:\r\n\0", 6)) == std::string::npos);
  EscreverELer(lido->Nome, lido->DOSName, lido->CRC, lido->Imagem, lido->Rom);
}

// The pieces end at line feeds, which no name holds; the last one is all the rest.
void LerComoPecas(std::string_view bytes) {
  std::array<std::string_view, 5> pecas;
  for (std::string_view& peca : pecas) {
    peca = &peca == &pecas.back() ? bytes : bytes.substr(0, bytes.find('\n'));
    bytes.remove_prefix(std::min(bytes.size(), peca.size() + 1));
  }
  EscreverELer(pecas[0], pecas[1], pecas[2], pecas[3], pecas[4]);
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* bytes, std::size_t quantos) {
  const std::string_view entrada(reinterpret_cast<const char*>(bytes), quantos);
  LerComoPacote(entrada);
  LerComoPecas(entrada);
  return 0;
}
