// tvk verificar: everything for which a package would be refused; nothing is written.
#include <algorithm>
#include <iterator>
#include <map>

#include "keeper/csv.h"
#include "keeper/motivos.h"
#include "keeper/pacotes.h"
#include "keeper/verbos.h"
#include "platform/text.h"
#include "support/textos.h"

namespace {

// Which file had a name first, letter case aside.
class NomesVistos {
 public:
  // The file that had it before, or the empty text.
  std::string Ver(const std::string& nome, const std::string& arquivo) {
    const auto [visto, novo] = vistos_.emplace(platform::CharUpperBuffA(nome), arquivo);
    return novo ? "" : visto->second;
  }

 private:
  std::map<std::string, std::string> vistos_;
};

class Conferencia {
 public:
  Motivos Conferir(const PacoteLido& lido) {
    const Pacote& pacote = lido.Conteudo;
    Motivos motivos = MotivosDoConteudo(pacote);
    std::ranges::move(MotivosDosNomes(pacote.Nome, pacote.DOSName), std::back_inserter(motivos));
    const std::string mesmoNome = nomes_.Ver(pacote.Nome, lido.Arquivo);
    if (!mesmoNome.empty()) motivos.push_back(Traduzir(Texto::NomeDeOutro, {pacote.Nome, mesmoNome}));
    const std::string mesmoDOS = nomesDOS_.Ver(pacote.DOSName, lido.Arquivo);
    if (!mesmoDOS.empty()) motivos.push_back(Traduzir(Texto::NomeDOSDeOutro, {pacote.DOSName, mesmoDOS}));
    return motivos;
  }

 private:
  NomesVistos nomes_, nomesDOS_;
};

void PorLinhas(const std::string& arquivo, const Motivos& porque, Relato& onde) {
  if (porque.empty()) onde.Linha(LinhaCsv({arquivo, "ok", ""}));
  for (const std::string& motivo : porque) onde.Linha(LinhaCsv({arquivo, "recusado", motivo}));
}

}  // namespace

void Verificar(const Pedido& Feito, Relato& Onde) {
  const bool csv = Feito.Tem("--csv");
  Conferencia conferencia;
  std::size_t bons = 0, maus = 0;
  if (csv) Onde.Linha(LinhaCsv({"arquivo", "resultado", "motivo"}));
  ParaCadaPacote(
      Feito, Onde, [&](const PacoteLido& lido) { return conferencia.Conferir(lido); },
      [&](const std::string& arquivo, const Motivos& porque) {
        ++(porque.empty() ? bons : maus);
        if (csv) PorLinhas(arquivo, porque, Onde);
      });
  if (!csv) Onde.Linha(Traduzir(Texto::PacotesVerificados, {std::to_string(bons), std::to_string(maus)}));
}
