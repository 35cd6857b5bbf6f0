#include "keeper/zip.h"

#include <zlib.h>

#include <algorithm>
#include <cstdint>
#include <limits>

#include "package/crc32.h"

namespace {

constexpr std::string_view ArquivoLocal = "PK\x03\x04", EntradaCentral = "PK\x01\x02", FimDeZip = "PK\x05\x06";
constexpr std::size_t TamanhoDoFim = 22;  // bytes, without the comment

// Numbers have their lowest byte first.
void Por(std::string& Texto, std::uint64_t Numero, int Bytes) {
  for (int i = 0; i < Bytes; ++i) Texto += static_cast<char>(Numero >> 8 * i & 0xFF);
}

std::uint64_t Ler(std::string_view Texto, std::size_t Posicao, std::size_t Bytes) {
  std::uint64_t numero = 0;
  for (std::size_t i = Bytes; i-- > 0;) numero = numero << 8 | static_cast<unsigned char>(Texto[Posicao + i]);
  return numero;
}

struct Fluxo {
  z_stream Estado{};
  bool Aberto = false;
  Fluxo() { Aberto = deflateInit2(&Estado, 9, Z_DEFLATED, -MAX_WBITS, MAX_MEM_LEVEL, Z_DEFAULT_STRATEGY) == Z_OK; }
  ~Fluxo() {
    if (Aberto) deflateEnd(&Estado);
  }
  Fluxo(const Fluxo&) = delete;
  Fluxo& operator=(const Fluxo&) = delete;
};

// Puts the content behind the text, deflated; zlib counts the bytes of one call in 32 bits.
bool Comprimir(std::string& Texto, std::string_view Conteudo) {
  Fluxo fluxo;
  if (!fluxo.Aberto || Conteudo.size() > std::numeric_limits<std::uint32_t>::max() / 2) return false;
  const std::size_t antes = Texto.size(), cabem = deflateBound(&fluxo.Estado, static_cast<uLong>(Conteudo.size()));
  Texto.resize(antes + cabem);
  fluxo.Estado.next_in = reinterpret_cast<Bytef*>(const_cast<char*>(Conteudo.data()));  // only read
  fluxo.Estado.avail_in = static_cast<uInt>(Conteudo.size());
  fluxo.Estado.next_out = reinterpret_cast<Bytef*>(Texto.data() + antes);
  fluxo.Estado.avail_out = static_cast<uInt>(cabem);
  const bool feito = deflate(&fluxo.Estado, Z_FINISH) == Z_STREAM_END;
  Texto.resize(antes + (feito ? cabem - fluxo.Estado.avail_out : 0));
  return feito;
}

// What the entry says of the file, in both places where it does: from the version that is needed to the name's length.
struct Descricao {
  std::uint32_t Soma;
  std::size_t Comprimido, Tamanho;
  std::string_view Nome;
};

void PorDescricao(std::string& Texto, const Descricao& Qual) {
  constexpr std::uint64_t versao = 20, nomeEmUtf8 = 1 << 11, deflate = 8, primeiroDeJaneiroDe1980 = 1 << 5 | 1;
  const bool ascii = std::ranges::none_of(Qual.Nome, [](char Letra) { return (Letra & 0x80) != 0; });
  Por(Texto, versao, 2);
  Por(Texto, ascii ? 0 : nomeEmUtf8, 2);
  Por(Texto, deflate, 2);
  Por(Texto, 0, 2);  // midnight
  Por(Texto, primeiroDeJaneiroDe1980, 2);
  Por(Texto, Qual.Soma, 4);
  Por(Texto, Qual.Comprimido, 4);
  Por(Texto, Qual.Tamanho, 4);
  Por(Texto, Qual.Nome.size(), 2);
  Por(Texto, 0, 2);  // no extra field
}

void PorEntradaCentral(std::string& Zip, const Descricao& Qual) {
  const std::size_t inicio = Zip.size();
  Zip += EntradaCentral;
  Por(Zip, 20, 2);  // made by: the same version, MS-DOS
  PorDescricao(Zip, Qual);
  constexpr std::size_t semComentarioNoInicio = 2 + 2 + 2 + 4 + 4;  // also: the first disk, no attributes
  Zip.append(semComentarioNoInicio, '\0').append(Qual.Nome);
  const std::size_t tamanho = Zip.size() - inicio;
  Zip += FimDeZip;
  Por(Zip, 0, 4);  // one disk
  Por(Zip, 1, 2);
  Por(Zip, 1, 2);
  Por(Zip, tamanho, 4);
  Por(Zip, inicio, 4);
  Por(Zip, 0, 2);  // no comment
}

// The directory of the archive lies before its end, with an entry at its beginning.
bool TemDiretorio(std::string_view Conteudo, std::size_t Fim) {
  const std::uint64_t entradas = Ler(Conteudo, Fim + 10, 2), tamanho = Ler(Conteudo, Fim + 12, 4);
  const std::uint64_t inicio = Ler(Conteudo, Fim + 16, 4);
  return entradas > 0 && inicio + tamanho <= Fim && Conteudo.substr(inicio).starts_with(EntradaCentral);
}

}  // namespace

std::optional<std::string> FazerZip(std::string_view NomeUtf8, std::string_view Conteudo) {
  const std::uint32_t soma = ~CRC32::Atualizar(CRC32::Inicial, Conteudo);
  constexpr std::size_t tamanhoDoLocal = 30;
  std::string comprimido(tamanhoDoLocal + NomeUtf8.size(), '\0');
  if (!Comprimir(comprimido, Conteudo)) return std::nullopt;
  const std::size_t inicio = tamanhoDoLocal + NomeUtf8.size();
  const Descricao descricao{soma, comprimido.size() - inicio, Conteudo.size(), NomeUtf8};
  std::string local(ArquivoLocal);
  PorDescricao(local, descricao);
  local += NomeUtf8;
  comprimido.replace(0, inicio, local);
  PorEntradaCentral(comprimido, descricao);
  return comprimido;
}

bool PareceZip(std::string_view Conteudo) { return Conteudo.starts_with(ArquivoLocal); }

std::optional<std::size_t> FimDoZip(std::string_view Conteudo) {
  if (!PareceZip(Conteudo) || Conteudo.size() < TamanhoDoFim) return std::nullopt;
  const std::size_t ultimo = Conteudo.size() - TamanhoDoFim;
  const std::size_t primeiro = ultimo - std::min<std::size_t>(ultimo, 0xFFFF);
  for (std::size_t posicao = ultimo;; --posicao) {
    if (Conteudo.substr(posicao).starts_with(FimDeZip) && TemDiretorio(Conteudo, posicao)) return posicao;
    if (posicao == primeiro) return std::nullopt;
  }
}

bool AlongarComentario(std::string& Zip) {
  const auto fim = FimDoZip(Zip);
  if (!fim) return false;
  const std::size_t comentario = Zip.size() - *fim - TamanhoDoFim + 1;
  if (comentario > 0xFFFF) return false;
  std::string tamanho;
  Por(tamanho, comentario, 2);
  Zip.replace(*fim + TamanhoDoFim - 2, 2, tamanho);
  Zip += ' ';
  return true;
}
