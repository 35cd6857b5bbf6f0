#include <gtest/gtest.h>

#include "savemanager/EspacoLivre.h"

TEST(FreeSpace, CountsIn32BitsAndFindsOnlyTheFloppyFullOrMissing) {
  constexpr std::int32_t oneGiB = 1073741824;
  constexpr std::uint32_t all = 0xFFFFFFFF;
  using Disk = platform::DiskFreeSpace;
  const struct {
    const char *Name, *Path;
    std::optional<Disk> Space;
    std::int32_t Free;
  } cases[] = {
      {"an empty floppy", "A:\\X.srm", Disk{1, 512, 2847, 2847}, 1457664},
      {"a full floppy", "A:\\X.srm", Disk{1, 512, 0, 2847}, 0},
      {"a stick with 2 GiB free", "A:\\X.srm", Disk{8, 512, 524288, 524288}, oneGiB},
      {"no floppy", "A:\\X.srm", std::nullopt, 0},
      {"a full floppy by its small letter", "a:\\X.srm", Disk{1, 512, 0, 2847}, oneGiB},
      {"no floppy by its small letter", "a:\\X.srm", std::nullopt, oneGiB},
      {"a cluster less than 2 GiB", "C:\\X.srm", Disk{8, 512, 524287, all}, 2147479552},
      {"2 GiB", "C:\\X.srm", Disk{8, 512, 524288, all}, oneGiB},
      {"2 to the 64th and 1 GiB", "A:\\X.srm", Disk{5, 1u << 30, 3435973837, all}, oneGiB},
      {"a share that does not tell", "\\\\casa\\saves\\X.srm", std::nullopt, oneGiB},
      {"no path", "", std::nullopt, oneGiB},
  };
  for (const auto& [name, path, space, free] : cases) EXPECT_EQ(EspacoLivre(path, space), free) << name;
}
