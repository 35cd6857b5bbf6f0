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
std::vector<Argument> LinhasDe(std::string_view Utf8) {
  std::vector<Argument> linhas;
  while (!Utf8.empty()) {
    const std::size_t fim = std::min(Utf8.find('\n'), Utf8.size());
    const std::string linha(SemBrancos(Utf8.substr(0, fim), " \t\r"));
    Utf8.remove_prefix(std::min(fim + 1, Utf8.size()));
    if (!linha.empty()) linhas.push_back({linha, platform::FromUtf8Exactly(linha)});
  }
  return linhas;
}

std::vector<Argument> ArgumentosDe(const Argument& Nome, Relato& Onde) {
  if (!Nome.Ansi) return {Nome};  // said where all are looked at
  const Leitura lista = LerTudo(CaminhoDoWindows(Nome.Ansi->substr(1)));
  if (!lista.Falta.empty()) Onde.Recusar(Nome.Ansi->substr(1), lista.Falta);
  return LinhasDe(EmUtf8(lista.Conteudo));
}

bool TemCuringa(const std::string& Caminho) { return UltimaParte(Caminho).find_first_of("*?") != std::string::npos; }

// A ";" would part two patterns.
std::string ComoPadrao(std::string Nome) {
  std::ranges::replace(Nome, ';', '?');
  return Nome;
}

void AcrescentarArquivos(std::vector<std::string>& Arquivos, const std::string& Caminho, Relato& Onde) {
  if (!TemCuringa(Caminho)) {
    Arquivos.push_back(Caminho);
    return;
  }
  AcrescentarListados(Arquivos, DiretorioDe(Caminho), ComoPadrao(UltimaParte(Caminho)), Caminho, Texto::NenhumArquivo,
                      Onde);
}

// Goes through the arguments of a verb.
class Leitor {
 public:
  Leitor(std::span<const Argument> Argumentos, std::span<const Opcao> Opcoes, Relato& Onde)
      : argumentos_(Argumentos), opcoes_(Opcoes), onde_(Onde) {}

  Pedido Ler() {
    while (atual_ < argumentos_.size()) LerUm(argumentos_[atual_++]);
    return std::move(pedido_);
  }

 private:
  void LerUm(const Argument& Argumento) {
    if (!Argumento.Ansi) {
      onde_.RecusarUtf8(Argumento.Utf8, Traduzir(Texto::ForaDaPaginaDeCodigo));
    } else if (!soArquivos_ && *Argumento.Ansi == FimDasOpcoes) {
      soArquivos_ = true;
    } else if (!soArquivos_ && Argumento.Ansi->size() > 1 && Argumento.Ansi->starts_with('-')) {
      LerOpcao(*Argumento.Ansi);
    } else {
      AcrescentarArquivos(pedido_.Arquivos, CaminhoDoWindows(*Argumento.Ansi), onde_);
    }
  }

  void LerOpcao(const std::string& Nome) {
    const auto opcao = std::ranges::find(opcoes_, Nome, &Opcao::Nome);
    if (opcao == opcoes_.end()) return onde_.UsoErrado(Traduzir(Texto::OpcaoDesconhecida, {Nome}));
    if (pedido_.Tem(Nome) && !opcao->Varias) return onde_.UsoErrado(Traduzir(Texto::OpcaoRepetida, {Nome}));
    auto& valores = pedido_.Opcoes[opcao->Nome];
    if (opcao->Valor.empty()) return;
    if (atual_ == argumentos_.size()) return onde_.UsoErrado(Traduzir(Texto::FaltaOValor, {Nome}));
    const Argument& dado = argumentos_[atual_++];
    if (!dado.Ansi) return onde_.UsoErrado(Nome + ": " + Traduzir(Texto::ForaDaPaginaDeCodigo));
    valores.push_back(*dado.Ansi);
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
  return achado == Opcoes.end() || achado->second.empty() ? nenhum : achado->second.front();
}

std::vector<std::string> Pedido::Valores(std::string_view Nome) const {
  const auto achado = Opcoes.find(Nome);
  return achado == Opcoes.end() ? std::vector<std::string>() : achado->second;
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

void AcrescentarListados(std::vector<std::string>& Arquivos, const std::string& Diretorio, const std::string& Padrao,
                         const std::string& Nomeado, Texto SeNenhum, Relato& Onde) {
  const auto achados = platform::ListDirectory(Diretorio.empty() ? ".\\" : Diretorio, Padrao);
  if (achados.empty()) Onde.Recusar(Nomeado, Traduzir(SeNenhum));
  for (const auto& cada : achados) {
    if (cada.IsExact) {
      Arquivos.push_back(Diretorio + cada.Name);
    } else {
      Onde.Recusar(Diretorio + cada.Name, Traduzir(Texto::ForaDaPaginaDeCodigo));
    }
  }
}

std::string CaminhoDoWindows(std::string Caminho) {
  std::ranges::replace(Caminho, '/', '\\');
  return Caminho;
}

std::string ComoDiretorio(const std::string& Caminho) {
  const std::string diretorio = CaminhoDoWindows(Caminho);
  return diretorio.empty() || diretorio.ends_with(':') ? diretorio : ComBarra(diretorio);
}
