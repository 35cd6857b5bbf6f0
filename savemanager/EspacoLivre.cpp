#include "savemanager/EspacoLivre.h"

#include <limits>

namespace {

constexpr std::int32_t UmGiB = 0x40000000;
constexpr std::uint64_t Maximo = std::numeric_limits<std::int32_t>::max();

std::int32_t BytesLivres(const platform::DiskFreeSpace& Disco) {
  const std::uint64_t setores = std::uint64_t{Disco.FreeClusters} * Disco.SectorsPerCluster;
  if (setores > Maximo) return UmGiB;
  const std::uint64_t bytes = setores * Disco.BytesPerSector;
  return bytes > Maximo ? UmGiB : static_cast<std::int32_t>(bytes);
}

}  // namespace

std::int32_t EspacoLivre(const std::string& Caminho) {
  return EspacoLivre(Caminho, platform::GetDiskFreeSpaceA(Caminho.substr(0, 2)));
}

std::int32_t EspacoLivre(const std::string& Caminho, const std::optional<platform::DiskFreeSpace>& Disco) {
  const std::int32_t livre = Disco ? BytesLivres(*Disco) : 0;
  return livre == 0 && !Caminho.starts_with('A') ? UmGiB : livre;
}
