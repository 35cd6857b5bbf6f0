// tvk listar: what packages hold, as a table.
#include <cstdio>

#include "keeper/csv.h"
#include "keeper/figuras.h"
#include "keeper/pacotes.h"
#include "keeper/verbos.h"
#include "support/textos.h"

namespace {

// Texts of fixed columns, the numbers to the right.
std::string EmColunas(const std::string& dos, const std::string& figura, const std::string& tamanhoDaFigura,
                      const std::string& tamanhoDoJogo, const std::string& soma, const std::string& nome) {
  std::string linha(80, ' ');
  linha.resize(static_cast<std::size_t>(
      std::snprintf(linha.data(), linha.size(), "%-8.8s  %-4.4s %10.10s %11.11s %13.13s  ", dos.c_str(), figura.c_str(),
                    tamanhoDaFigura.c_str(), tamanhoDoJogo.c_str(), soma.c_str())));
  return linha + nome;
}

void PorCabecalho(bool csv, Relato& onde) {
  onde.Linha(csv ? LinhaCsv({"arquivo", "nome", "dos", "tamanho", "jogo", "figura", "soma", "tipo"})
                 : EmColunas(Traduzir(Texto::ColunaDOS), "", Traduzir(Texto::ColunaFigura), Traduzir(Texto::ColunaJogo),
                             Traduzir(Texto::ColunaSoma), Traduzir(Texto::ColunaNome)));
}

void PorLinha(const PacoteLido& lido, bool csv, Relato& onde) {
  const Pacote& pacote = lido.Conteudo;
  const std::string figura = std::to_string(pacote.Imagem.size()), jogo = std::to_string(pacote.Rom.size());
  const std::string tipo(TipoDaFigura(pacote.Imagem));
  onde.Linha(csv ? LinhaCsv({lido.Arquivo, pacote.Nome, pacote.DOSName, std::to_string(lido.Tamanho), jogo, figura,
                             pacote.CRC, tipo})
                 : EmColunas(pacote.DOSName, tipo, figura, jogo, pacote.CRC, pacote.Nome));
}

}  // namespace

void Listar(const Pedido& Feito, Relato& Onde) {
  const bool csv = Feito.Tem("--csv");
  PorCabecalho(csv, Onde);
  ParaCadaPacote(Feito, Onde, [&](const PacoteLido& lido) {
    PorLinha(lido, csv, Onde);
    return Motivos();
  });
}
