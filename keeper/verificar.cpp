// tvk verificar: everything for which a package would be refused; nothing is written.
#include "keeper/conferencia.h"
#include "keeper/csv.h"
#include "keeper/verbos.h"
#include "support/textos.h"

namespace {

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
