#include "support/mod_Arquivos.h"

#include <algorithm>
#include <limits>
#include <new>

#include "platform/files.h"
#include "support/gravacao.h"

namespace {

constexpr std::int64_t MaiorTamanho = std::numeric_limits<std::int32_t>::max();

std::optional<std::string> Brancos(std::int64_t tamanho) {
  try {
    return std::string(static_cast<std::size_t>(tamanho), ' ');
  } catch (const std::bad_alloc&) {
    return std::nullopt;
  }
}

// All bytes from a position, counted from 0, to the end of the file.
std::optional<std::string> LerAteFim(platform::File& arquivo, std::int64_t posicao) {
  const std::int64_t tamanho = arquivo.Size();
  if (tamanho < 0 || tamanho > MaiorTamanho) return std::nullopt;
  auto texto = Brancos(std::max<std::int64_t>(tamanho - posicao, 0));
  if (!texto || texto->empty()) return texto;
  const std::int64_t lidos = arquivo.Read(posicao, texto->data(), texto->size());
  if (lidos < 0) return std::nullopt;
  texto->resize(static_cast<std::size_t>(lidos));
  return texto;
}

// A file that was deleted before writing at a later position begins with zeros.
bool Substituir(const std::string& caminho, std::string_view texto, std::int64_t posicao) {
  if (posicao > 0) {
    try {
      return Substituir(caminho, std::string(static_cast<std::size_t>(posicao), '\0').append(texto), 0);
    } catch (const std::bad_alloc&) {
      return false;
    }
  }
  return Substituicao(caminho, texto).Concluir();
}

enum class Tentativa { Feita, NaoLida, SemLugar, Recusada };

// The copy lies beside its place until it is complete. Each piece is on the disk before the next one: a slow disk takes
// its time for a piece and not, at the end, for all of them.
Tentativa CopiarAoLado(platform::File& origem, const std::string& caminho, const Andamento& andamento) {
  constexpr std::size_t tamanhoPedaco = 65'536;
  ArquivoAoLado destino(caminho);
  const std::int64_t tamanho = origem.Size();
  if (tamanho < 0) return Tentativa::NaoLida;
  std::string pedaco(tamanhoPedaco, '\0');
  for (std::int64_t posicao = 0; posicao < tamanho;) {
    const std::int64_t lidos = origem.Read(posicao, pedaco.data(), pedaco.size());
    if (lidos <= 0) return Tentativa::NaoLida;
    if (!destino.Arquivo().Write(posicao, {pedaco.data(), static_cast<std::size_t>(lidos)})) return Tentativa::SemLugar;
    if (!destino.Arquivo().Flush()) return Tentativa::Recusada;
    posicao += lidos;
    if (posicao < tamanho && andamento) andamento(static_cast<int>(100 * posicao / tamanho));
  }
  destino.Arquivo().CopyInformation(origem);
  if (destino.Arquivo().IsOpen() && !destino.Arquivo().Flush()) return Tentativa::Recusada;
  return destino.TomarNome(platform::Existing::Replace) ? Tentativa::Feita : Tentativa::SemLugar;
}

// Where there is no room for a copy beside it, the contents are written like any other text.
Copia CopiarNoLugar(platform::File& origem, const std::string& destino) {
  const auto conteudo = LerInteiro(origem);
  if (!conteudo) return Copia::NaoLida;
  return GravarNoLugar(destino, {*conteudo, 0, true}) ? Copia::Feita : Copia::NaoGravada;
}

}  // namespace

std::string LerArquivo(const std::string& Caminho, std::int32_t Inicio, std::int32_t Tamanho) {
  platform::File arquivo(Caminho, platform::Access::Read);
  const std::int64_t posicao = std::max(Inicio, 1) - 1;
  if (Tamanho < 1) return LerAteFim(arquivo, posicao).value_or("");
  std::string texto = Brancos(Tamanho).value_or("");
  arquivo.Read(posicao, texto.data(), texto.size());
  return texto;
}

void AcrescentarArquivo(std::string& Texto, const std::string& Caminho) {
  platform::File arquivo(Caminho, platform::Access::Read);
  const std::int64_t tamanho = arquivo.Size();
  if (tamanho < 0 || tamanho > MaiorTamanho) return;
  const std::size_t antes = Texto.size(), quantos = static_cast<std::size_t>(tamanho);
  Texto.resize(antes + quantos);
  const std::int64_t lidos = arquivo.Read(0, Texto.data() + antes, quantos);
  Texto.resize(antes + static_cast<std::size_t>(std::max<std::int64_t>(lidos, 0)));
}

std::optional<std::string> LerInteiro(platform::File& Arquivo) { return LerAteFim(Arquivo, 0); }

int GravarArquivo(const std::string& Caminho, std::string_view Texto, std::int32_t Posicao, bool ApagarAntes) {
  if (Posicao < -1) return -1;
  const std::int64_t posicao = Posicao == 0 ? 0 : Posicao - 1;  // below 0: the end
  const bool gravado = ApagarAntes ? Substituir(Caminho, Texto, std::max<std::int64_t>(posicao, 0))
                                   : GravarNoLugar(Caminho, {Texto, posicao, false});
  return gravado ? 1 : -1;
}

Copia CopiarArquivo(const std::string& Origem, const std::string& Destino, const Andamento& AoAndar) {
  platform::File origem(Origem, platform::Access::Read);
  if (!origem.IsOpen()) return Copia::NaoLida;
  switch (CopiarAoLado(origem, Destino, AoAndar)) {
    case Tentativa::Feita:
      return Copia::Feita;
    case Tentativa::NaoLida:
      return Copia::NaoLida;
    case Tentativa::SemLugar:
      return CopiarNoLugar(origem, Destino);
    default:
      return Copia::NaoGravada;
  }
}

void ApagarArquivo(const std::string& Caminho) { platform::DeleteFileA(Caminho); }

std::int32_t TamanhoArquivo(const std::string& Caminho) {
  return static_cast<std::int32_t>(std::min(platform::FileSize(Caminho).value_or(0), MaiorTamanho));
}

bool ArquivoExiste(const std::string& Caminho) { return platform::FileSize(Caminho).value_or(0) != 0; }

bool DiretorioExiste(const std::string& Caminho) {
  return platform::GetFileAttributesA(Caminho) == platform::AttributeDirectory;
}

void CriarDiretorio(const std::string& Caminho) { platform::CreateDirectoryA(Caminho); }

void CriarCaminho(const std::string& Caminho) {
  for (auto barra = Caminho.find('\\'); barra != std::string::npos; barra = Caminho.find('\\', barra + 1)) {
    const std::string trecho = Caminho.substr(0, barra + 1);
    if (!DiretorioExiste(trecho)) CriarDiretorio(trecho);
  }
}
