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
  std::string Ver(const std::string& Nome, const std::string& Arquivo) {
    const auto [visto, novo] = vistos_.emplace(platform::CharUpperBuffA(Nome), Arquivo);
    return novo ? "" : visto->second;
  }

 private:
  std::map<std::string, std::string> vistos_;
};

class Conferencia {
 public:
  Motivos Conferir(const PacoteLido& Lido) {
    const Pacote& pacote = Lido.Conteudo;
    Motivos motivos = MotivosDoConteudo(pacote);
    std::ranges::move(MotivosDosNomes(pacote.Nome, pacote.DOSName), std::back_inserter(motivos));
    const std::string mesmoNome = nomes_.Ver(pacote.Nome, Lido.Arquivo);
    if (!mesmoNome.empty()) motivos.push_back(Traduzir(Texto::NomeDeOutro, {pacote.Nome, mesmoNome}));
    const std::string mesmoDOS = nomesDOS_.Ver(pacote.DOSName, Lido.Arquivo);
    if (!mesmoDOS.empty()) motivos.push_back(Traduzir(Texto::NomeDOSDeOutro, {pacote.DOSName, mesmoDOS}));
    return motivos;
  }

 private:
  NomesVistos nomes_, nomesDOS_;
};

void PorLinhas(const std::string& Arquivo, const Motivos& Porque, Relato& Onde) {
  if (Porque.empty()) Onde.Linha(LinhaCsv({Arquivo, "ok", ""}));
  for (const std::string& motivo : Porque) Onde.Linha(LinhaCsv({Arquivo, "recusado", motivo}));
}

}  // namespace

void Verificar(const Pedido& Feito, Relato& Onde) {
  const bool csv = Feito.Tem("--csv");
  Conferencia conferencia;
  std::size_t bons = 0, maus = 0;
  if (csv) Onde.Linha(LinhaCsv({"arquivo", "resultado", "motivo"}));
  ParaCadaPacote(
      Feito, Onde, [&](const PacoteLido& Lido) { return conferencia.Conferir(Lido); },
      [&](const std::string& Arquivo, const Motivos& Porque) {
        ++(Porque.empty() ? bons : maus);
        if (csv) PorLinhas(Arquivo, Porque, Onde);
      });
  if (!csv) Onde.Linha(Traduzir(Texto::PacotesVerificados, {std::to_string(bons), std::to_string(maus)}));
}
