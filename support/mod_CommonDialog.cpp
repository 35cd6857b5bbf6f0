#include "support/mod_CommonDialog.h"

#include <algorithm>
#include <string_view>

#include "platform/files.h"
#include "platform/messages.h"
#include "platform/text.h"
#include "support/brancos.h"
#include "support/caminhos.h"

namespace {

using namespace std::string_view_literals;

constexpr std::size_t TamanhoDoCaminho = 255;  // of the chosen path, with its closing NUL
constexpr std::string_view TodosOsArquivos = "Todos os arquivos (*.*)\0*.*\0"sv;

using Dialogo = bool (*)(platform::OpenFileName&);

// The name with blanks behind it, so that the buffer is filled.
std::string ComBrancos(const std::string& Nome) {
  constexpr std::size_t maximo = TamanhoDoCaminho - 1;
  return Nome + std::string(Nome.size() < maximo ? maximo - Nome.size() : 1, ' ');
}

std::string Perguntar(Dialogo Mostrar, platform::OpenFileName Pedido, std::string& Filtro) {
  if (Filtro.empty()) Filtro = TodosOsArquivos;
  Pedido.Filter = Filtro;
  Pedido.File = ComBrancos(Pedido.File);
  Pedido.FileSize = TamanhoDoCaminho;
  if (!Mostrar(Pedido)) return "";
  const std::string_view escolhido = Pedido.File;
  return std::string(SemBrancos(escolhido.substr(0, escolhido.find('\0')), " "));
}

// True for a file that the disk lists under this name, in whatever letter case.
bool Listado(const std::string& Caminho) {
  const auto entrada = platform::ListPath(Caminho);
  const std::string nome = UltimaParte(Caminho);
  return entrada && platform::CharUpperBuffA(entrada->Name) == platform::CharUpperBuffA(nome);
}

// Several extensions are given with ";" between them. Some dialogs append the first, others all.
std::string ComUmaExtensao(const std::string& Caminho, const std::string& Extensoes) {
  const std::size_t demais = Extensoes.size() - std::min(Extensoes.find(';'), Extensoes.size());
  return Caminho.ends_with("." + Extensoes) ? Caminho.substr(0, Caminho.size() - demais) : Caminho;
}

}  // namespace

std::string AbrirArquivo(const platform::Window& Dono, const std::string& DiretorioInicial, const std::string& Titulo,
                         const std::string& NomeInicial, std::string& Filtro, std::uint8_t Flags) {
  platform::OpenFileName pedido;
  pedido.Owner = &Dono;
  pedido.InitialDirectory = DiretorioInicial;
  pedido.Title = Titulo;
  pedido.File = NomeInicial;
  pedido.Flags = Flags;
  const std::string caminho = Perguntar(platform::GetOpenFileNameA, pedido, Filtro);
  return Listado(caminho) ? caminho : "";
}

std::string SalvarArquivo(const platform::Window& Dono, const std::string& DiretorioInicial, const std::string& Titulo,
                          const std::string& ExtensaoPadrao, const std::string& NomeInicial, std::string& Filtro,
                          std::uint8_t Flags) {
  platform::OpenFileName pedido;
  pedido.Owner = &Dono;
  pedido.InitialDirectory = DiretorioInicial;
  pedido.Title = Titulo;
  pedido.DefaultExtension = ExtensaoPadrao;
  pedido.File = NomeInicial;
  pedido.Flags = Flags;
  return ComUmaExtensao(Perguntar(platform::GetSaveFileNameA, pedido, Filtro), ExtensaoPadrao);
}
