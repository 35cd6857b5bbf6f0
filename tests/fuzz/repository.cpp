// The readers of a repository's entry and index. Each input is used as both, with and without its lines' usual
// beginning, and as the texts of an index that is written and read back.
#include <algorithm>
#include <array>
#include <string>

#include "package/nomes.h"
#include "repository/base64.h"
#include "repository/chave.h"
#include "repository/entrada.h"
#include "repository/indice.h"
#include "tests/fuzz/target.h"

namespace {

constexpr std::string_view Hash = "0123456789abcdef0123456789abcdef0123456789abcdef0123456789abcdef";

bool IsTaken(const Recusa& why) { return why.Qual == Recusa::Tipo::Nenhuma; }

// The file has as many lines as a refusal says.
void RequirePlace(const Recusa& why, std::string_view content) {
  Require(why.Linha <= static_cast<std::size_t>(std::ranges::count(content, '\n')) + 1);
}

// What is taken has one form only, but for unknown lines.
void ReadAsEntry(std::string_view content) {
  const EntradaLida read = LerEntradaSemAssinatura(content);
  RequirePlace(read.Porque, content);
  if (!IsTaken(read.Porque)) return;
  const EntradaDoRepositorio& entry = read.Entrada;
  Require(content.size() <= MaiorEntrada && !entry.Titulo.empty() && entry.Serie <= MaiorSerie);
  Require(EhSoma(entry.Indice.Soma) && entry.Espelhos.size() <= MaisEspelhos && entry.Chave[0] == 4);
  Require(LerInstante(TextoDoInstante(entry.Validade)) == entry.Validade);
  Require(!IsTaken(LerEntradaSemAssinatura(content.substr(0, content.size() - 1)).Porque));
  Require(!IsTaken(LerEntradaSemAssinatura(std::string(content) + "A: b\n").Porque));
}

// Names are free of what leads elsewhere, in order and each its own game's; what is written is read back.
void ReadAsIndex(std::string_view content) {
  const IndiceLido read = LerIndice(content);
  RequirePlace(read.Porque, content);
  if (!IsTaken(read.Porque)) return;
  const JogoPublicado* before = nullptr;
  for (const JogoPublicado& game : read.Jogos) {
    Require((game.Nome + game.NomeDOS).find_first_of("\\/:|=\r\n") == std::string::npos);
    Require(game.NomeDOS.size() <= 8 && EhSoma(game.Pacote.Soma) && game.Pacote.Tamanho <= MaiorPacote);
    Require(!before || (before->Nome < game.Nome && SemCaixa(before->Nome) != SemCaixa(game.Nome)));
    before = &game;
  }
  const IndiceLido again = LerIndice(EscreverIndice(read.Jogos));
  Require(IsTaken(again.Porque) && again.Jogos == read.Jogos);
}

// The pieces end at line feeds. An index of good texts is taken, and one of any other is refused: no text becomes a
// line of its own.
void WriteAndRead(std::string_view input) {
  std::array<std::string, 4> pieces;
  for (std::string& piece : pieces) piece = TakeLine(input);
  const std::array<std::string, 2> names = {pieces[0], pieces[1]};
  const JogoPublicado game{names[0],  names[1],  {std::string(Hash), 1}, {}, "",
                           pieces[2], pieces[3], std::string(input),     ""};
  const bool goodNames = PodeSerValor("Nome", names[0]) && PodeSerValor("NomeDOS", names[1]) &&
                         ConferirNome(names[0]).Qual == FaltaNoNome::Tipo::Nenhuma &&
                         ConferirNomeDOS(names[1]).Qual == FaltaNoNome::Tipo::Nenhuma;
  const bool goodTexts =
      PodeSerValor("Autor", pieces[2]) && PodeSerValor("Licenca", pieces[3]) && PodeSerValor("Descricao", input);
  const IndiceLido read = LerIndice(EscreverIndice({game}));
  if (goodTexts) {
    Require(IsTaken(read.Porque) == goodNames);
    Require(!goodNames || read.Jogos == std::vector{game});
  } else {
    Require(read.Jogos != std::vector{game});
  }
}

}  // namespace

void Test(std::string_view input) {
  ReadAsEntry(input);
  ReadAsIndex(input);
  WriteAndRead(input);
  const auto bytes = DeBase64(input);
  Require(!bytes || EmBase64(*bytes) == input);
  Require(DeBase64(EmBase64(input)) == input);
  const auto key = LerChave(input);
  Require(!key || LerChave(EscreverChave(*key)) == key);
}
