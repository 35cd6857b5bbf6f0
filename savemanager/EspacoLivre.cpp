#include "savemanager/EspacoLivre.h"

#include <limits>

namespace {

constexpr std::int32_t UmGiB = 0x40000000;
constexpr std::uint64_t Maximo = std::numeric_limits<std::int32_t>::max();

std::int32_t BytesLivres(const platform::DiskFreeSpace& disco) {
  const std::uint64_t setores = std::uint64_t{disco.FreeClusters} * disco.SectorsPerCluster;
  if (setores > Maximo) return UmGiB;
  const std::uint64_t bytes = setores * disco.BytesPerSector;
  return bytes > Maximo ? UmGiB : static_cast<std::int32_t>(bytes);
}

}  // namespace

std::int32_t EspacoLivre(const std::string& caminho) {
  return EspacoLivre(caminho, platform::GetDiskFreeSpaceA(caminho.substr(0, 2)));
}

std::int32_t EspacoLivre(const std::string& caminho, const std::optional<platform::DiskFreeSpace>& disco) {
  const std::int32_t livre = disco ? BytesLivres(*disco) : 0;
  return livre == 0 && !caminho.starts_with('A') ? UmGiB : livre;
}
