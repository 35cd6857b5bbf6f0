// tvk listar: what packages hold, as a table.
#include <cstdio>

#include "keeper/csv.h"
#include "keeper/figuras.h"
#include "keeper/pacotes.h"
#include "keeper/verbos.h"
#include "support/textos.h"

namespace {

// Texts of fixed columns, the numbers to the right.
std::string EmColunas(const std::string& Dos, const std::string& Figura, const std::string& TamanhoDaFigura,
                      const std::string& TamanhoDoJogo, const std::string& Soma, const std::string& Nome) {
  std::string linha(80, ' ');
  linha.resize(static_cast<std::size_t>(
      std::snprintf(linha.data(), linha.size(), "%-8.8s  %-4.4s %10.10s %11.11s %13.13s  ", Dos.c_str(), Figura.c_str(),
                    TamanhoDaFigura.c_str(), TamanhoDoJogo.c_str(), Soma.c_str())));
  return linha + Nome;
}

void PorCabecalho(bool Csv, Relato& Onde) {
  Onde.Linha(Csv ? LinhaCsv({"arquivo", "nome", "dos", "tamanho", "jogo", "figura", "soma", "tipo"})
                 : EmColunas(Traduzir(Texto::ColunaDOS), "", Traduzir(Texto::ColunaFigura), Traduzir(Texto::ColunaJogo),
                             Traduzir(Texto::ColunaSoma), Traduzir(Texto::ColunaNome)));
}

void PorLinha(const PacoteLido& Lido, bool Csv, Relato& Onde) {
  const Pacote& pacote = Lido.Conteudo;
  const std::string figura = std::to_string(pacote.Imagem.size()), jogo = std::to_string(pacote.Rom.size());
  const std::string tipo(TipoDaFigura(pacote.Imagem));
  Onde.Linha(Csv ? LinhaCsv({Lido.Arquivo, pacote.Nome, pacote.DOSName, std::to_string(Lido.Tamanho), jogo, figura,
                             pacote.CRC, tipo})
                 : EmColunas(pacote.DOSName, tipo, figura, jogo, pacote.CRC, pacote.Nome));
}

}  // namespace

void Listar(const Pedido& Feito, Relato& Onde) {
  const bool csv = Feito.Tem("--csv");
  PorCabecalho(csv, Onde);
  ParaCadaPacote(Feito, Onde, [&](const PacoteLido& Lido) {
    PorLinha(Lido, csv, Onde);
    return Motivos();
  });
}
