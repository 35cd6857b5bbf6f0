#include "repository/indice.h"

#include <algorithm>
#include <set>
#include <utility>

#include "package/nomes.h"
#include "repository/figura.h"

namespace {

using Tipo = Recusa::Tipo;

using Figura = std::pair<ArquivoPublicado, std::string>;

// In the order in which they are written.
constexpr std::pair<std::string_view, std::string JogoPublicado::*> Textos[] = {
    {"Autor", &JogoPublicado::Autor},
    {"Licenca", &JogoPublicado::Licenca},
    {"Descricao", &JogoPublicado::Descricao},
    {"Versao", &JogoPublicado::Versao},
};

std::optional<std::string> LerNome(std::string_view Texto) {
  return ConferirNome(Texto).Qual == FaltaNoNome::Tipo::Nenhuma ? LerTexto(Texto) : std::nullopt;
}

std::optional<std::string> LerNomeDOS(std::string_view Texto) {
  return ConferirNomeDOS(Texto).Qual == FaltaNoNome::Tipo::Nenhuma ? LerTexto(Texto) : std::nullopt;
}

std::optional<Figura> LerFigura(std::string_view Texto) {
  const std::size_t branco = Texto.rfind(' ');
  const std::string_view extensao = branco == std::string_view::npos ? "" : Texto.substr(branco + 1);
  if (!EhExtensaoDeFigura(extensao)) return std::nullopt;
  const auto arquivo = LerArquivoPublicado(Texto.substr(0, branco), MaiorFigura);
  if (!arquivo) return std::nullopt;
  return Figura(*arquivo, extensao);
}

Recusa LerJogo(const Estrofe& Qual, JogoPublicado& Jogo) {
  Recusa porque;
  LeitorDeValores valores(Qual, porque);
  valores.Exigido("Nome", Jogo.Nome, LerNome);
  valores.Exigido("NomeDOS", Jogo.NomeDOS, LerNomeDOS);
  valores.Exigido("Pacote", Jogo.Pacote,
                  [](std::string_view Texto) { return LerArquivoPublicado(Texto, MaiorPacote); });
  Figura figura;
  valores.Opcional("Figura", figura, LerFigura);
  Jogo.Figura = std::move(figura.first);
  Jogo.ExtensaoDaFigura = std::move(figura.second);
  for (const auto& [chave, texto] : Textos) valores.Opcional(chave, Jogo.*texto, LerTexto);
  return porque;
}

// What an index must not have twice, and the order that it must have.
class Sequencia {
 public:
  Recusa Conferir(const Estrofe& Qual, const JogoPublicado& Jogo) {
    const auto recusar = [&](Tipo Motivo, const char* Chave) {
      return Recusa{Motivo, Qual.Achar(Chave)->Linha, Chave};
    };
    if (!nomes_.insert(SemCaixa(Jogo.Nome)).second) return recusar(Tipo::NomeRepetido, "Nome");
    if (!nomesDOS_.insert(Jogo.NomeDOS).second) return recusar(Tipo::NomeRepetido, "NomeDOS");
    if (Jogo.Nome < ultimo_) return recusar(Tipo::ForaDeOrdem, "Nome");
    ultimo_ = Jogo.Nome;
    return {};
  }

 private:
  std::set<std::string> nomes_, nomesDOS_;  // a DOS name has no small letters
  std::string ultimo_;
};

void PorLinha(std::string& Texto, std::string_view Chave, const std::string& Valor) {
  if (!Valor.empty()) Texto.append(Chave).append(": ").append(Valor) += '\n';
}

}  // namespace

IndiceLido LerIndice(std::string_view Conteudo) {
  IndiceLido lido;
  Sequencia sequencia;
  LeitorDeEstrofes leitor(Conteudo, MaiorIndice);
  while (const auto estrofe = leitor.Proxima()) {
    JogoPublicado jogo;
    lido.Porque = LerJogo(*estrofe, jogo);
    if (lido.Porque.Qual == Tipo::Nenhuma) lido.Porque = sequencia.Conferir(*estrofe, jogo);
    if (lido.Porque.Qual != Tipo::Nenhuma) return lido;
    lido.Jogos.push_back(std::move(jogo));
  }
  lido.Porque = leitor.Porque();
  return lido;
}

std::string EscreverIndice(std::vector<JogoPublicado> Jogos) {
  std::ranges::sort(Jogos, {}, &JogoPublicado::Nome);
  std::string texto;
  for (const JogoPublicado& jogo : Jogos) {
    if (!texto.empty()) texto += '\n';
    PorLinha(texto, "Nome", jogo.Nome);
    PorLinha(texto, "NomeDOS", jogo.NomeDOS);
    PorLinha(texto, "Pacote", TextoDoArquivo(jogo.Pacote));
    if (!jogo.ExtensaoDaFigura.empty()) {
      PorLinha(texto, "Figura", TextoDoArquivo(jogo.Figura) + " " + jogo.ExtensaoDaFigura);
    }
    for (const auto& [chave, valor] : Textos) PorLinha(texto, chave, jogo.*valor);
  }
  return texto;
}

// In UTF-8 the code page's small letters with two bytes are one, three or 32 away from their capitals.
std::string SemCaixa(std::string_view Utf8) {
  constexpr std::pair<std::string_view, std::string_view> outras[] = {{"š", "Š"}, {"œ", "Œ"}, {"ž", "Ž"}, {"ÿ", "Ÿ"}};
  std::string texto(Utf8);
  for (std::size_t i = 0; i < texto.size(); ++i) {
    const bool latina =
        i > 0 && texto[i - 1] == '\xC3' && texto[i] >= '\xA0' && texto[i] < '\xBF' && texto[i] != '\xB7';
    if (latina || (texto[i] >= 'a' && texto[i] <= 'z')) texto[i] = static_cast<char>(texto[i] - 0x20);
    for (const auto& [pequena, grande] : outras) {
      if (std::string_view(texto).substr(i).starts_with(pequena)) texto.replace(i, pequena.size(), grande);
    }
  }
  return texto;
}

std::string ArquivoDoPacote(const JogoPublicado& Jogo) { return "pacotes/" + Jogo.Pacote.Soma + ".tvk"; }

std::string ArquivoDaFigura(const JogoPublicado& Jogo) {
  return "figuras/" + Jogo.Figura.Soma + "." + Jogo.ExtensaoDaFigura;
}
