// tvk criar: packages of games.
#include <iterator>
#include <optional>
#include <set>

#include "keeper/arquivos.h"
#include "keeper/encomendas.h"
#include "keeper/figuras.h"
#include "keeper/motivos.h"
#include "keeper/nome_dos.h"
#include "keeper/rom.h"
#include "keeper/verbos.h"
#include "package/cls_CRC.h"
#include "platform/text.h"
#include "support/caminhos.h"
#include "support/gravacao.h"
#include "support/textos.h"

namespace {

// Packs one game after the other; of those that are done it keeps the names.
class Oficina {
 public:
  Oficina(std::string Saida, Relato& Onde) : saida_(std::move(Saida)), onde_(Onde) {}

  // Whatever goes wrong unexpectedly is a want of memory.
  void Fazer(const Encomenda& Pedida) {
    lidos_ = 0;
    try {
      for (const std::string& motivo : Empacotar(Pedida)) onde_.Recusar(Pedida.Onde, motivo);
    } catch (...) {
      onde_.Recusar(Pedida.Onde, Traduzir(Texto::SemMemoria));
    }
    onde_.Andar(lidos_);
  }

  void Resumir() const {
    onde_.Linha(Traduzir(Texto::PacotesFeitos, {std::to_string(gravados_), std::to_string(iguais_)}));
  }

 private:
  Motivos Empacotar(const Encomenda& Pedida) {
    const auto nomeDOS = NomeDOSDe(Pedida);
    if (!nomeDOS) return {Traduzir(Texto::SemNomeDOS)};
    Motivos motivos = MotivosDosNomes(Pedida.Nome, *nomeDOS);
    if (motivos.empty()) motivos = Repetidos(Pedida.Nome, *nomeDOS);
    if (!EhRom(Pedida.Rom)) motivos.push_back(Traduzir(Texto::NaoEhJogo));
    if (!motivos.empty()) return motivos;
    const FiguraPronta figura = PrepararFigura(Pedida.Figura, Pedida.Nome);
    if (!figura.Falta.empty()) return {figura.Falta};
    return Montar(Pedida, *nomeDOS, figura.Conteudo);
  }

  Motivos Montar(const Encomenda& Pedida, const std::string& NomeDOS, const std::string& Figura) {
    Leitura lida = LerTudo(Pedida.Rom);
    if (!lida.Falta.empty()) return {ComArquivo(Pedida, lida.Falta)};
    lidos_ = static_cast<std::int64_t>(lida.Conteudo.size());
    const RomPronta rom = PrepararRom(Pedida.Rom, std::move(lida.Conteudo));
    if (!rom.Falta.empty()) return {ComArquivo(Pedida, rom.Falta)};
    const auto soma = cls_CRC().CRC(rom.Zip);
    if (!soma) return {Traduzir(Texto::SemSoma)};
    return Gravar(
        Pedida.Nome, NomeDOS,
        MontarPacote(Pedida.Nome, NomeDOS, TextoCRC(*soma), std::ssize(Figura), std::ssize(rom.Zip), Figura, rom.Zip));
  }

  Motivos Gravar(const std::string& Nome, const std::string& NomeDOS, const std::string& Pacote) {
    const std::string arquivo = saida_ + Nome + ".tvk";
    switch (GravarSeMuda(arquivo, Pacote, platform::Existing::Replace)) {
      case Escrita::Igual:
        ++iguais_;
        return {};
      case Escrita::Feita:
        ++gravados_;
        onde_.Linha(EmColunaDOS(NomeDOS) + arquivo);
        return {};
      default:
        return {Traduzir(Texto::NaoPodeSerGravado, {arquivo})};
    }
  }

  static std::optional<std::string> NomeDOSDe(const Encomenda& Pedida) {
    if (!Pedida.NomeDOS.empty()) return platform::CharUpperBuffA(Pedida.NomeDOS);
    const std::string nome = UltimaParte(Pedida.Rom);
    return FazerNomeDOS(NomeBase(nome).value_or(nome));
  }

  Motivos Repetidos(const std::string& Nome, const std::string& NomeDOS) {
    Motivos motivos;
    if (!nomes_.insert(platform::CharUpperBuffA(Nome)).second) {
      motivos.push_back(Traduzir(Texto::NomeRepetido, {Nome}));
    }
    if (!nomesDOS_.insert(NomeDOS).second) motivos.push_back(Traduzir(Texto::NomeDOSRepetido, {NomeDOS}));
    return motivos;
  }

  // A list's line does not say by itself which file is meant.
  static std::string ComArquivo(const Encomenda& Pedida, const std::string& Falta) {
    return Pedida.Onde == Pedida.Rom ? Falta : Pedida.Rom + ": " + Falta;
  }

  std::string saida_;
  Relato& onde_;
  std::set<std::string> nomes_, nomesDOS_;  // the former in upper case
  std::size_t gravados_ = 0, iguais_ = 0;
  std::int64_t lidos_ = 0;  // bytes of the game at hand
};

// The options that say something of one game, and those that name games, do not go together.
bool FazSentido(const Pedido& Feito, Relato& Onde) {
  const bool deUm = Feito.Tem("--nome") || Feito.Tem("--dos") || Feito.Tem("--figura");
  const int fontes = Feito.Tem("--instalacao") + Feito.Tem("--lista") + !Feito.Arquivos.empty();
  if (fontes > 1 || (deUm && Feito.Arquivos.size() != 1)) {
    Onde.UsoErrado(Traduzir(fontes > 1 ? Texto::FontesDemais : Texto::SoParaUmJogo));
    return false;
  }
  return true;
}

}  // namespace

void Criar(const Pedido& Feito, Relato& Onde) {
  if (!FazSentido(Feito, Onde)) return;
  const std::string saida = ComoDiretorio(Feito.Valor("--saida"));
  ApagarRestos(saida.empty() ? ".\\" : saida);
  const auto encomendas = LerEncomendas(Feito, Onde);
  Oficina oficina(saida, Onde);
  Onde.Comecar(encomendas.size());
  for (const Encomenda& encomenda : encomendas) oficina.Fazer(encomenda);
  Onde.Terminar();
  oficina.Resumir();
}
