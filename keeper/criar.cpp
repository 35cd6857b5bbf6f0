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
  Oficina(std::string saida, Relato& onde) : saida_(std::move(saida)), onde_(onde) {}

  // Whatever goes wrong unexpectedly is a want of memory.
  void Fazer(const Encomenda& encomenda) {
    lidos_ = 0;
    try {
      for (const std::string& motivo : Empacotar(encomenda)) onde_.Recusar(encomenda.Onde, motivo);
    } catch (...) {
      onde_.Recusar(encomenda.Onde, Traduzir(Texto::SemMemoria));
    }
    onde_.Andar(lidos_);
  }

  void Resumir() const {
    onde_.Linha(Traduzir(Texto::PacotesFeitos, {std::to_string(gravados_), std::to_string(iguais_)}));
  }

 private:
  Motivos Empacotar(const Encomenda& encomenda) {
    const auto nomeDOS = NomeDOSDe(encomenda);
    if (!nomeDOS) return {Traduzir(Texto::SemNomeDOS)};
    Motivos motivos = MotivosDosNomes(encomenda.Nome, *nomeDOS);
    if (motivos.empty()) motivos = Repetidos(encomenda.Nome, *nomeDOS);
    if (!EhRom(encomenda.Rom)) motivos.push_back(Traduzir(Texto::NaoEhJogo));
    if (!motivos.empty()) return motivos;
    const FiguraPronta figura = PrepararFigura(encomenda.Figura, encomenda.Nome);
    if (!figura.Falta.empty()) return {figura.Falta};
    return Montar(encomenda, *nomeDOS, figura.Conteudo);
  }

  Motivos Montar(const Encomenda& encomenda, const std::string& nomeDOS, const std::string& figura) {
    Leitura lida = LerTudo(encomenda.Rom);
    if (!lida.Falta.empty()) return {ComArquivo(encomenda, lida.Falta)};
    lidos_ = static_cast<std::int64_t>(lida.Conteudo.size());
    const RomPronta rom = PrepararRom(encomenda.Rom, std::move(lida.Conteudo));
    if (!rom.Falta.empty()) return {ComArquivo(encomenda, rom.Falta)};
    const auto soma = cls_CRC().CRC(rom.Zip);
    if (!soma) return {Traduzir(Texto::SemSoma)};
    return Gravar(encomenda.Nome, nomeDOS,
                  MontarPacote(encomenda.Nome, nomeDOS, TextoCRC(*soma), std::ssize(figura), std::ssize(rom.Zip),
                               figura, rom.Zip));
  }

  Motivos Gravar(const std::string& nome, const std::string& nomeDOS, const std::string& pacote) {
    const std::string arquivo = saida_ + nome + ".tvk";
    switch (GravarSeMuda(arquivo, pacote, platform::Existing::Replace)) {
      case Escrita::Igual:
        ++iguais_;
        return {};
      case Escrita::Feita:
        ++gravados_;
        onde_.Linha(EmColunaDOS(nomeDOS) + arquivo);
        return {};
      default:
        return {Traduzir(Texto::NaoPodeSerGravado, {arquivo})};
    }
  }

  static std::optional<std::string> NomeDOSDe(const Encomenda& encomenda) {
    if (!encomenda.NomeDOS.empty()) return platform::CharUpperBuffA(encomenda.NomeDOS);
    const std::string nome = UltimaParte(encomenda.Rom);
    return FazerNomeDOS(NomeBase(nome).value_or(nome));
  }

  Motivos Repetidos(const std::string& nome, const std::string& nomeDOS) {
    Motivos motivos;
    if (!nomes_.insert(platform::CharUpperBuffA(nome)).second) {
      motivos.push_back(Traduzir(Texto::NomeRepetido, {nome}));
    }
    if (!nomesDOS_.insert(nomeDOS).second) motivos.push_back(Traduzir(Texto::NomeDOSRepetido, {nomeDOS}));
    return motivos;
  }

  // A list's line does not say by itself which file is meant.
  static std::string ComArquivo(const Encomenda& encomenda, const std::string& falta) {
    return encomenda.Onde == encomenda.Rom ? falta : encomenda.Rom + ": " + falta;
  }

  std::string saida_;
  Relato& onde_;
  std::set<std::string> nomes_, nomesDOS_;  // the former in upper case
  std::size_t gravados_ = 0, iguais_ = 0;
  std::int64_t lidos_ = 0;  // bytes of the game at hand
};

// The options that say something of one game, and those that name games, do not go together.
bool FazSentido(const Pedido& feito, Relato& onde) {
  const bool deUm = feito.Tem("--nome") || feito.Tem("--dos") || feito.Tem("--figura");
  const int fontes = feito.Tem("--instalacao") + feito.Tem("--lista") + !feito.Arquivos.empty();
  if (fontes > 1 || (deUm && feito.Arquivos.size() != 1)) {
    onde.UsoErrado(Traduzir(fontes > 1 ? Texto::FontesDemais : Texto::SoParaUmJogo));
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
