#include "support/gravacao.h"

#include <algorithm>
#include <new>

#include "platform/files.h"

namespace {

// Where a text goes in a file of a known length.
struct Trecho {
  std::int64_t Posicao, Fim;   // of the text
  std::int64_t Antes, Depois;  // the file's lengths
};

Trecho TrechoDe(const Gravacao& pedido, std::int64_t tamanho) {
  const std::int64_t posicao = pedido.Posicao < 0 ? tamanho : pedido.Posicao;
  const std::int64_t fim = posicao + static_cast<std::int64_t>(pedido.Texto.size());
  return {posicao, fim, tamanho, pedido.Cortar ? fim : std::max(fim, tamanho)};
}

// What the file has where the text goes. Nothing that can be put back is better than a file that cannot be written:
// without the memory for it, or when it cannot be read, it is the empty text.
std::string Guardar(platform::File& arquivo, const Trecho& trecho) {
  const std::int64_t ate = trecho.Depois < trecho.Antes ? trecho.Antes : std::min(trecho.Fim, trecho.Antes);
  if (ate <= trecho.Posicao) return "";
  try {
    std::string guardado(static_cast<std::size_t>(ate - trecho.Posicao), '\0');
    const std::int64_t lidos = arquivo.Read(trecho.Posicao, guardado.data(), guardado.size());
    guardado.resize(static_cast<std::size_t>(std::max<std::int64_t>(lidos, 0)));
    return guardado;
  } catch (const std::bad_alloc&) {
    return "";
  }
}

// The room is reserved before the first byte is written: a full disk says so while the old contents still stand.
bool Reservar(platform::File& arquivo, const Trecho& trecho) {
  return trecho.Depois <= trecho.Antes || arquivo.SetSize(trecho.Depois);
}

bool Escrever(platform::File& arquivo, std::string_view texto, const Trecho& trecho) {
  if (!arquivo.Write(trecho.Posicao, texto)) return false;
  if (trecho.Depois < trecho.Antes && !arquivo.SetSize(trecho.Depois)) return false;
  return arquivo.Flush();
}

void PorDeVolta(platform::File& arquivo, std::string_view guardado, const Trecho& trecho) {
  if (!guardado.empty()) arquivo.Write(trecho.Posicao, guardado);
  arquivo.SetSize(trecho.Antes);
  arquivo.Flush();
}

bool EscreverOuDesfazer(platform::File& arquivo, const Gravacao& pedido, std::int64_t tamanho) {
  const Trecho trecho = TrechoDe(pedido, tamanho);
  const std::string guardado = Guardar(arquivo, trecho);
  if (!Reservar(arquivo, trecho)) return false;
  if (Escrever(arquivo, pedido.Texto, trecho)) return true;
  PorDeVolta(arquivo, guardado, trecho);
  return false;
}

Troca Preparar(const std::string& temporario, std::string_view conteudo) {
  platform::File arquivo(temporario, platform::Access::ReplaceContent);
  if (!arquivo.IsOpen() || !arquivo.Write(0, conteudo)) return Troca::SemLugar;
  return arquivo.Flush() ? Troca::Feita : Troca::Recusada;
}

}  // namespace

std::string NomeTemporario(const std::string& Caminho) { return Caminho + ".novo~"; }

Troca TrocarConteudo(const std::string& Caminho, std::string_view Conteudo) {
  const std::string temporario = NomeTemporario(Caminho);
  Troca troca = Preparar(temporario, Conteudo);
  if (troca == Troca::Feita && !platform::MoveFileExA(temporario, Caminho)) troca = Troca::SemLugar;
  if (troca != Troca::Feita) platform::DeleteFileA(temporario);
  return troca;
}

bool GravarNoLugar(const std::string& Caminho, const Gravacao& Pedido) {
  const bool existia = platform::GetFileAttributesA(Caminho).has_value();
  platform::File arquivo(Caminho, platform::Access::ReadWrite);
  if (!arquivo.IsOpen()) return false;
  const std::int64_t tamanho = arquivo.Size();
  if (tamanho >= 0 && EscreverOuDesfazer(arquivo, Pedido, tamanho)) return true;
  arquivo.Close();
  // Made by opening it; but whatever holds something is not deleted.
  if (!existia && platform::FileSize(Caminho) == 0) platform::DeleteFileA(Caminho);
  return false;
}
