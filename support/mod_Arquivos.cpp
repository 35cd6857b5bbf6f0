#include "support/mod_Arquivos.h"

#include <algorithm>
#include <limits>
#include <new>

#include "platform/files.h"
#include "support/caracteres.h"
#include "support/gravacao.h"

namespace {

constexpr std::int64_t MaiorTamanho = std::numeric_limits<std::int32_t>::max();

std::optional<std::string> Brancos(std::int64_t Tamanho) {
  try {
    return std::string(static_cast<std::size_t>(Tamanho), ' ');
  } catch (const std::bad_alloc&) {
    return std::nullopt;
  }
}

// All bytes from a position, counted from 0, to the end of the file.
std::optional<std::string> LerAteFim(platform::File& Arquivo, std::int64_t Posicao) {
  const std::int64_t tamanho = Arquivo.Size();
  if (tamanho < 0 || tamanho > MaiorTamanho) return std::nullopt;
  auto texto = Brancos(std::max<std::int64_t>(tamanho - Posicao, 0));
  if (!texto || texto->empty()) return texto;
  const std::int64_t lidos = Arquivo.Read(Posicao, texto->data(), texto->size());
  if (lidos < 0) return std::nullopt;
  texto->resize(static_cast<std::size_t>(lidos));
  return texto;
}

// A file that was deleted before writing at a later position begins with zeros.
bool GravarDoZero(const std::string& Caminho, std::string_view Texto, std::int64_t Posicao) {
  if (Posicao > 0) {
    try {
      return GravarDoZero(Caminho, std::string(static_cast<std::size_t>(Posicao), '\0').append(Texto), 0);
    } catch (const std::bad_alloc&) {
      return false;
    }
  }
  return Substituicao(Caminho, Texto).Concluir();
}

enum class Tentativa { Feita, NaoLida, SemLugar, Recusada };

// The copy lies beside its place until it is complete. Each piece is on the disk before the next one: a slow disk takes
// its time for a piece and not, at the end, for all of them.
Tentativa CopiarAoLado(platform::File& Origem, const std::string& Caminho, const Andamento& AoAndar) {
  constexpr std::size_t tamanhoPedaco = 65'536;
  ArquivoAoLado destino(Caminho);
  const std::int64_t tamanho = Origem.Size();
  if (tamanho < 0) return Tentativa::NaoLida;
  std::string pedaco(tamanhoPedaco, '\0');
  for (std::int64_t posicao = 0; posicao < tamanho;) {
    const std::int64_t lidos = Origem.Read(posicao, pedaco.data(), pedaco.size());
    if (lidos <= 0) return Tentativa::NaoLida;
    if (!destino.Arquivo().Write(posicao, {pedaco.data(), static_cast<std::size_t>(lidos)})) return Tentativa::SemLugar;
    if (!destino.Arquivo().Flush()) return Tentativa::Recusada;
    posicao += lidos;
    if (posicao < tamanho && AoAndar) AoAndar(static_cast<int>(100 * posicao / tamanho));
  }
  destino.Arquivo().CopyInformation(Origem);
  if (destino.Arquivo().IsOpen() && !destino.Arquivo().Flush()) return Tentativa::Recusada;
  return destino.TomarNome(platform::Existing::Replace) ? Tentativa::Feita : Tentativa::SemLugar;
}

// Where there is no room for a copy beside it, the contents are written like any other text.
Copia CopiarNoLugar(platform::File& Origem, const std::string& Destino) {
  const auto conteudo = LerInteiro(Origem);
  if (!conteudo) return Copia::NaoLida;
  return GravarNoLugar(Destino, {*conteudo, 0, true}) ? Copia::Feita : Copia::NaoGravada;
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

bool AcrescentarArquivo(std::string& Texto, const std::string& Caminho) {
  platform::File arquivo(Caminho, platform::Access::Read);
  const std::int64_t tamanho = arquivo.Size();
  if (tamanho < 0 || tamanho > MaiorTamanho) return false;
  const std::size_t antes = Texto.size(), quantos = static_cast<std::size_t>(tamanho);
  Texto.resize(antes + quantos);
  return arquivo.Read(0, Texto.data() + antes, quantos) == tamanho;
}

std::optional<std::string> LerInteiro(platform::File& Arquivo) { return LerAteFim(Arquivo, 0); }

int GravarArquivo(const std::string& Caminho, std::string_view Texto, std::int32_t Posicao, bool ApagarAntes) {
  if (Posicao < -1) return -1;
  const std::int64_t inicio = Posicao == 0 ? 0 : Posicao - 1;  // below 0: the end
  const bool gravado = ApagarAntes ? GravarDoZero(Caminho, Texto, std::max<std::int64_t>(inicio, 0))
                                   : GravarNoLugar(Caminho, {Texto, inicio, false});
  return gravado ? 1 : -1;
}

Copia CopiarArquivo(const std::string& Origem, const std::string& Destino, const Andamento& AoAndar) {
  platform::File fonte(Origem, platform::Access::Read);
  if (!fonte.IsOpen()) return Copia::NaoLida;
  switch (CopiarAoLado(fonte, Destino, AoAndar)) {
    case Tentativa::Feita:
      return Copia::Feita;
    case Tentativa::NaoLida:
      return Copia::NaoLida;
    case Tentativa::SemLugar:
      return CopiarNoLugar(fonte, Destino);
    default:
      return Copia::NaoGravada;
  }
}

void ApagarArquivo(const std::string& Caminho) { platform::DeleteFileA(Caminho); }

void DescartarArquivo(const std::string& Caminho) {
  if (!platform::MoveToRecycleBin(Caminho)) ApagarArquivo(Caminho);
}

std::int32_t TamanhoArquivo(const std::string& Caminho) {
  return static_cast<std::int32_t>(std::clamp<std::int64_t>(platform::FileSize(Caminho).value_or(0), 0, MaiorTamanho));
}

bool ArquivoExiste(const std::string& Caminho) { return platform::FileSize(Caminho) > 0; }

bool DiretorioExiste(const std::string& Caminho) {
  return platform::GetFileAttributesA(Caminho) == platform::AttributeDirectory;
}

void CriarDiretorio(const std::string& Caminho) { platform::CreateDirectoryA(Caminho); }

void CriarCaminho(const std::string& Caminho) {
  for (auto barra = AcharCaractere(Caminho, '\\'); barra != std::string::npos;
       barra = AcharCaractere(Caminho, '\\', barra + 1)) {
    const std::string trecho = Caminho.substr(0, barra + 1);
    if (!DiretorioExiste(trecho)) CriarDiretorio(trecho);
  }
}
