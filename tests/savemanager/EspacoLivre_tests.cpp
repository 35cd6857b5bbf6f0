#include <gtest/gtest.h>

#include "savemanager/EspacoLivre.h"

TEST(EspacoLivre, CountsIn32BitsAndFindsOnlyTheFloppyFullOrMissing) {
  constexpr std::int32_t UmGiB = 1073741824;
  constexpr std::uint32_t Tudo = 0xFFFFFFFF;
  using Disco = platform::DiskFreeSpace;
  const std::tuple<const char*, std::optional<Disco>, std::int32_t> casos[] = {
      {"A:\\X.srm", Disco{1, 512, 2847, 2847}, 1457664},
      {"A:\\X.srm", Disco{1, 512, 0, 2847}, 0},
      {"A:\\X.srm", Disco{8, 512, 524288, 524288}, UmGiB},
      {"A:\\X.srm", std::nullopt, 0},
      {"a:\\X.srm", Disco{1, 512, 0, 2847}, UmGiB},
      {"a:\\X.srm", std::nullopt, UmGiB},
      {"C:\\X.srm", Disco{8, 512, 524287, Tudo}, 2147479552},
      {"C:\\X.srm", Disco{8, 512, 524288, Tudo}, UmGiB},
      {"A:\\X.srm", Disco{5, 1u << 30, 3435973837, Tudo}, UmGiB},  // 2 to the 64th and 1 GiB
      {"\\\\casa\\saves\\X.srm", std::nullopt, UmGiB},
      {"", std::nullopt, UmGiB},
  };
  for (const auto& [caminho, disco, livre] : casos) {
    EXPECT_EQ(EspacoLivre(caminho, disco), livre) << caminho << " expected " << livre;
  }
}
