#include "savemanager/EspacoLivre.h"

#include <gtest/gtest.h>

TEST(EspacoLivre, CountsIn32BitsAndTrustsEveryDiskButTheFloppy) {
  constexpr std::int32_t UmGiB = 1073741824;
  constexpr std::uint32_t Tudo = 0xFFFFFFFF;
  const struct {
    const char* caminho;
    std::optional<platform::DiskFreeSpace> disco;
    std::int32_t livre;
  } casos[] = {
      {"A:\\X.srm", {{1, 512, 2847, 2847}}, 1457664},
      {"A:\\X.srm", {{1, 512, 0, 2847}}, 0},
      {"A:\\X.srm", std::nullopt, 0},
      {"A:\\X.srm", {{8, 512, 524288, 524288}}, 0},
      {"a:\\X.srm", {{1, 512, 0, 2847}}, UmGiB},
      {"a:\\X.srm", std::nullopt, UmGiB},
      {"C:\\X.srm", {{8, 512, 524287, Tudo}}, 2147479552},
      {"C:\\X.srm", {{8, 512, 524288, Tudo}}, UmGiB},
      {"C:\\X.srm", {{8, 512, Tudo, Tudo}}, UmGiB},
      {"A:\\X.srm", {{5, 1u << 30, 3435973837, Tudo}}, 0},  // 2 to the 64th and 1 GiB
      {"C:\\X.srm", {{8, 512, 0, 2000}}, UmGiB},
      {"\\\\casa\\saves\\X.srm", std::nullopt, UmGiB},
      {"", std::nullopt, UmGiB},
  };
  for (const auto& caso : casos) {
    EXPECT_EQ(EspacoLivre(caso.caminho, caso.disco), caso.livre) << caso.caminho << " case " << &caso - casos;
  }
}
