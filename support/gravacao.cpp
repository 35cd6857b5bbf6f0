#include "support/gravacao.h"

#include <algorithm>
#include <new>
#include <random>
#include <utility>

namespace {

using platform::Existing;

constexpr std::string_view Terminacao = ".novo~";  // none of the program's lists shows such a file
constexpr std::size_t TamanhoMarca = 8;
constexpr std::string_view Digitos = "0123456789abcdef";

// "Jogo.zip" becomes "Jogo.zip.0f3a99c2.novo~", so that no two programs write the same file, and none of the person's.
std::string ComMarca(const std::string& Caminho) {
  std::uint32_t acaso = std::random_device{}();
  std::string marca(TamanhoMarca, '0');
  for (char& digito : marca) {
    digito = Digitos[acaso & 0xF];
    acaso >>= 4;
  }
  return Caminho + "." + marca + std::string(Terminacao);
}

bool TemMarca(std::string_view Nome) {
  constexpr std::size_t fim = 1 + TamanhoMarca + Terminacao.size();
  if (Nome.size() <= fim || !Nome.ends_with(Terminacao)) return false;
  const std::string_view marca = Nome.substr(Nome.size() - fim + 1, TamanhoMarca);
  return Nome[Nome.size() - fim] == '.' && marca.find_first_not_of(Digitos) == std::string_view::npos;
}

// Where a text goes in a file of a known length.
struct Trecho {
  std::int64_t Posicao, Fim;   // of the text
  std::int64_t Antes, Depois;  // the file's lengths
};

Trecho TrechoDe(const Gravacao& Pedido, std::int64_t Tamanho) {
  const std::int64_t posicao = Pedido.Posicao < 0 ? Tamanho : Pedido.Posicao;
  const std::int64_t fim = posicao + static_cast<std::int64_t>(Pedido.Texto.size());
  return {posicao, fim, Tamanho, Pedido.Cortar ? fim : std::max(fim, Tamanho)};
}

// What the file has where the text goes. Nothing that can be put back is better than a file that cannot be written:
// without the memory for it, or when it cannot be read, it is the empty text.
std::string Guardar(platform::File& Arquivo, const Trecho& Onde) {
  const std::int64_t ate = Onde.Depois < Onde.Antes ? Onde.Antes : std::min(Onde.Fim, Onde.Antes);
  if (ate <= Onde.Posicao) return "";
  try {
    std::string guardado(static_cast<std::size_t>(ate - Onde.Posicao), '\0');
    const std::int64_t lidos = Arquivo.Read(Onde.Posicao, guardado.data(), guardado.size());
    guardado.resize(static_cast<std::size_t>(std::max<std::int64_t>(lidos, 0)));
    return guardado;
  } catch (const std::bad_alloc&) {
    return "";
  }
}

// The room is reserved before the first byte is written: a full disk says so while the old contents still stand.
bool Reservar(platform::File& Arquivo, const Trecho& Onde) {
  return Onde.Depois <= Onde.Antes || Arquivo.SetSize(Onde.Depois);
}

bool Escrever(platform::File& Arquivo, std::string_view Texto, const Trecho& Onde) {
  if (!Arquivo.Write(Onde.Posicao, Texto)) return false;
  if (Onde.Depois < Onde.Antes && !Arquivo.SetSize(Onde.Depois)) return false;
  return Arquivo.Flush();
}

void PorDeVolta(platform::File& Arquivo, std::string_view Guardado, const Trecho& Onde) {
  if (!Guardado.empty()) Arquivo.Write(Onde.Posicao, Guardado);
  Arquivo.SetSize(Onde.Antes);
  Arquivo.Flush();
}

bool EscreverOuDesfazer(platform::File& Arquivo, const Gravacao& Pedido, std::int64_t Tamanho) {
  const Trecho trecho = TrechoDe(Pedido, Tamanho);
  const std::string guardado = Guardar(Arquivo, trecho);
  if (!Reservar(Arquivo, trecho)) return false;
  if (Escrever(Arquivo, Pedido.Texto, trecho)) return true;
  PorDeVolta(Arquivo, guardado, trecho);
  return false;
}

}  // namespace

ArquivoAoLado::ArquivoAoLado(std::string Caminho)
    : caminho_(std::move(Caminho)),
      nome_(ComMarca(caminho_)),
      arquivo_(nome_, platform::Access::CreateNew),
      existe_(arquivo_.IsOpen()) {}

ArquivoAoLado::~ArquivoAoLado() { Desistir(); }

void ArquivoAoLado::Desistir() {
  arquivo_.Close();
  if (std::exchange(existe_, false)) platform::DeleteFileA(nome_);
}

bool ArquivoAoLado::TomarNome(Existing Existente) {
  arquivo_.Close();
  if (!existe_ || !platform::MoveFileExA(nome_, caminho_, Existente)) return false;
  existe_ = false;
  return true;
}

Substituicao::Substituicao(const std::string& Caminho, std::string_view Conteudo, Existing Existente)
    : caminho_(Caminho), conteudo_(Conteudo), existente_(Existente), aoLado_(Caminho), estado_(Preparar()) {}

// Without room for all of it, what there is of it gives its room back at once.
Substituicao::Estado Substituicao::Preparar() {
  if (!aoLado_.Arquivo().Write(0, conteudo_)) {
    aoLado_.Desistir();
    return Estado::SemLugar;
  }
  return aoLado_.Arquivo().Flush() ? Estado::AoLado : Estado::Recusada;
}

bool Substituicao::Concluir() {
  if (estado_ == Estado::Recusada) return false;
  if (estado_ == Estado::AoLado && aoLado_.TomarNome(existente_)) return true;
  aoLado_.Desistir();
  return GravarNoLugar(caminho_, {conteudo_, 0, true}, existente_);
}

bool GravarNoLugar(const std::string& Caminho, const Gravacao& Pedido, Existing Existente) {
  platform::File arquivo(Caminho, platform::Access::CreateNew);
  const bool novo = arquivo.IsOpen();
  if (!novo && Existente == Existing::Replace) arquivo = platform::File(Caminho, platform::Access::ReadWrite);
  if (!arquivo.IsOpen()) return false;
  const std::int64_t tamanho = arquivo.Size();
  if (tamanho >= 0 && EscreverOuDesfazer(arquivo, Pedido, tamanho)) return true;
  arquivo.Close();
  if (novo) platform::DeleteFileA(Caminho);
  return false;
}

bool PodeGravar(const std::string& Caminho) {
  if (platform::GetFileAttributesA(Caminho)) return platform::File(Caminho, platform::Access::ReadWrite).IsOpen();
  return ArquivoAoLado(Caminho).Arquivo().IsOpen();
}

void ApagarRestos(const std::string& Diretorio) {
  constexpr std::uint32_t umaHora = 3600;  // seconds; no writing takes so long
  if (Diretorio.empty()) return;
  for (const platform::DirectoryEntry& arquivo : platform::ListDirectory(Diretorio, "*" + std::string(Terminacao))) {
    if (TemMarca(arquivo.Name)) platform::DeleteAbandonedFile(Diretorio + arquivo.Name, umaHora);
  }
}
