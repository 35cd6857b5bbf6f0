#include "keeper/motivos.h"

#include <optional>

#include "package/cls_CRC.h"
#include "package/nomes.h"
#include "platform/text.h"
#include "repository/figura.h"
#include "support/textos.h"

namespace {

using Tipo = FaltaNoNome::Tipo;

std::string EmPalavras(const FaltaNoNome& Falta, Texto Longo) {
  switch (Falta.Qual) {
    case Tipo::Vazio:
      return Traduzir(Texto::NomeVazio);
    case Tipo::Longo:
      return Traduzir(Longo);
    case Tipo::Caractere:
      return Traduzir(Texto::NomeComCaractere, {platform::FromUtf8(Falta.Caractere)});
    case Tipo::Ponta:
      return Traduzir(Texto::NomeComPonta);
    default:
      return Traduzir(Texto::NomeDeDispositivo);
  }
}

}  // namespace

Motivos MotivosDoConteudo(const Pacote& Lido) {
  Motivos motivos;
  if (Lido.Imagem.empty()) motivos.push_back(Traduzir(Texto::CortadoAntesDaFigura));
  const auto soma = cls_CRC().CRC(Lido.Rom);
  if (Lido.Rom.empty()) {
    motivos.push_back(Traduzir(Texto::CortadoAntesDoJogo));
  } else if (!soma) {
    motivos.push_back(Traduzir(Texto::SemSoma));
  } else if (TextoCRC(*soma) != Lido.CRC) {
    motivos.push_back(Traduzir(Texto::OutraSoma));
  }
  return motivos;
}

Motivos MotivosDoNome(const std::string& Nome) {
  const FaltaNoNome nome = ConferirNome(platform::ToUtf8(Nome));
  if (nome.Qual == Tipo::Nenhuma) return {};
  return {Traduzir(Texto::NomeErrado, {Nome, EmPalavras(nome, Texto::NomeLongo)})};
}

Motivos MotivosDaFigura(std::string_view Figura) {
  switch (ConferirFigura(Figura, ExtensaoDaFigura(Figura))) {
    case FaltaNaFigura::Nenhuma:
      return {};
    case FaltaNaFigura::Grande:
      return {Traduzir(Texto::FiguraGrande)};
    case FaltaNaFigura::PontosDemais:
      return {Traduzir(Texto::FiguraDePontosDemais)};
    default:
      return {Traduzir(Texto::FiguraDeOutroTipo)};
  }
}

std::string MotivoDaRecusa(const Recusa& Porque) {
  switch (Porque.Qual) {
    case Recusa::Tipo::Grande:
      return Traduzir(Texto::MaiorQuePode);
    case Recusa::Tipo::VersaoNova:
      return Traduzir(Texto::DeVersaoNova);
    case Recusa::Tipo::AssinaturaErrada:
      return Traduzir(Texto::AssinaturaNaoConfere);
    case Recusa::Tipo::FaltaChave:
      return Traduzir(Texto::FaltaALinha, {Porque.Chave});
    default:
      return Traduzir(Texto::LinhaNaoServe, {std::to_string(Porque.Linha)});
  }
}

Motivos MotivosDosNomes(const std::string& Nome, const std::string& NomeDOS) {
  Motivos motivos = MotivosDoNome(Nome);
  const FaltaNoNome dos = ConferirNomeDOS(platform::ToUtf8(NomeDOS));
  if (dos.Qual != Tipo::Nenhuma) {
    motivos.push_back(Traduzir(Texto::NomeDOSErrado, {NomeDOS, EmPalavras(dos, Texto::NomeDOSLongo)}));
  }
  return motivos;
}
