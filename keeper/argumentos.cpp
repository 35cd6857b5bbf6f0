#include "keeper/argumentos.h"

#include <algorithm>
#include <iterator>
#include <optional>

#include "keeper/arquivos.h"
#include "keeper/codificacao.h"
#include "platform/files.h"
#include "platform/text.h"
#include "support/brancos.h"
#include "support/caminhos.h"

namespace {

using platform::Argument;

constexpr std::string_view FimDasOpcoes = "--";

// The lines of a list, without the blanks around them and without the empty ones.
std::vector<Argument> LinhasDe(std::string_view utf8) {
  std::vector<Argument> linhas;
  while (!utf8.empty()) {
    const std::size_t fim = std::min(utf8.find('\n'), utf8.size());
    const std::string linha(SemBrancos(utf8.substr(0, fim), " \t\r"));
    utf8.remove_prefix(std::min(fim + 1, utf8.size()));
    if (!linha.empty()) linhas.push_back({linha, platform::FromUtf8Exactly(linha)});
  }
  return linhas;
}

std::vector<Argument> ArgumentosDe(const Argument& nome, Relato& onde) {
  if (!nome.Ansi) return {nome};  // said where all are looked at
  const Leitura lista = LerTudo(ComBarras(nome.Ansi->substr(1)));
  if (!lista.Falta.empty()) onde.Recusar(nome.Ansi->substr(1), lista.Falta);
  return LinhasDe(EmUtf8(lista.Conteudo));
}

bool TemCuringa(const std::string& caminho) { return UltimaParte(caminho).find_first_of("*?") != std::string::npos; }

// A ";" would part two patterns.
std::string ComoPadrao(std::string nome) {
  std::ranges::replace(nome, ';', '?');
  return nome;
}

void AcrescentarArquivos(std::vector<std::string>& arquivos, const std::string& caminho, Relato& onde) {
  if (!TemCuringa(caminho)) {
    arquivos.push_back(caminho);
    return;
  }
  AcrescentarListados(arquivos, DiretorioDe(caminho), ComoPadrao(UltimaParte(caminho)), caminho, Texto::NenhumArquivo,
                      onde);
}

// Goes through the arguments of a verb.
class Leitor {
 public:
  Leitor(std::span<const Argument> argumentos, std::span<const Opcao> opcoes, Relato& onde)
      : argumentos_(argumentos), opcoes_(opcoes), onde_(onde) {}

  Pedido Ler() {
    while (atual_ < argumentos_.size()) LerUm(argumentos_[atual_++]);
    return std::move(pedido_);
  }

 private:
  void LerUm(const Argument& argumento) {
    if (!argumento.Ansi) {
      onde_.RecusarUtf8(argumento.Utf8, Traduzir(Texto::ForaDaPaginaDeCodigo));
    } else if (!soArquivos_ && *argumento.Ansi == FimDasOpcoes) {
      soArquivos_ = true;
    } else if (!soArquivos_ && argumento.Ansi->size() > 1 && argumento.Ansi->starts_with('-')) {
      LerOpcao(*argumento.Ansi);
    } else {
      AcrescentarArquivos(pedido_.Arquivos, ComBarras(*argumento.Ansi), onde_);
    }
  }

  void LerOpcao(const std::string& nome) {
    const auto opcao = std::ranges::find(opcoes_, nome, &Opcao::Nome);
    if (opcao == opcoes_.end()) return onde_.UsoErrado(Traduzir(Texto::OpcaoDesconhecida, {nome}));
    if (pedido_.Tem(nome)) return onde_.UsoErrado(Traduzir(Texto::OpcaoRepetida, {nome}));
    std::string& valor = pedido_.Opcoes[opcao->Nome];
    if (opcao->Valor.empty()) return;
    if (atual_ == argumentos_.size()) return onde_.UsoErrado(Traduzir(Texto::FaltaOValor, {nome}));
    const Argument& dado = argumentos_[atual_++];
    if (!dado.Ansi) return onde_.UsoErrado(nome + ": " + Traduzir(Texto::ForaDaPaginaDeCodigo));
    valor = *dado.Ansi;
  }

  std::span<const Argument> argumentos_;
  std::span<const Opcao> opcoes_;
  Relato& onde_;
  Pedido pedido_;
  std::size_t atual_ = 0;
  bool soArquivos_ = false;
};

}  // namespace

const std::string& Pedido::Valor(std::string_view Nome) const {
  static const std::string nenhum;
  const auto achado = Opcoes.find(Nome);
  return achado == Opcoes.end() ? nenhum : achado->second;
}

std::vector<Argument> ComListas(const std::vector<Argument>& Argumentos, Relato& Onde) {
  std::vector<Argument> todos;
  bool procurar = true;
  for (const Argument& cada : Argumentos) {
    if (cada.Utf8 == FimDasOpcoes) procurar = false;
    if (procurar && cada.Utf8.size() > 1 && cada.Utf8.starts_with('@')) {
      std::ranges::move(ArgumentosDe(cada, Onde), std::back_inserter(todos));
    } else {
      todos.push_back(cada);
    }
  }
  return todos;
}

Pedido LerPedido(std::span<const Argument> Argumentos, std::span<const Opcao> Opcoes, Relato& Onde) {
  return Leitor(Argumentos, Opcoes, Onde).Ler();
}

// A listing has a "?", which no name has, where the code page lacks a character.
void AcrescentarListados(std::vector<std::string>& Arquivos, const std::string& Diretorio, const std::string& Padrao,
                         const std::string& Nomeado, Texto SeNenhum, Relato& Onde) {
  const auto achados = platform::ListDirectory(Diretorio.empty() ? ".\\" : Diretorio, Padrao);
  if (achados.empty()) Onde.Recusar(Nomeado, Traduzir(SeNenhum));
  for (const auto& cada : achados) {
    if (cada.Name.find('?') == std::string::npos) {
      Arquivos.push_back(Diretorio + cada.Name);
    } else {
      Onde.Recusar(Diretorio + cada.Name, Traduzir(Texto::ForaDaPaginaDeCodigo));
    }
  }
}

std::string ComBarras(std::string Caminho) {
  std::ranges::replace(Caminho, '/', '\\');
  return Caminho;
}

std::string ComoDiretorio(const std::string& Caminho) {
  const std::string diretorio = ComBarras(Caminho);
  const bool inteiro = diretorio.empty() || diretorio.ends_with('\\') || diretorio.ends_with(':');
  return inteiro ? diretorio : diretorio + '\\';
}
