// The free space of a disk as the save-file manager counts it: in 32 bits.
#pragma once

#include <cstdint>
#include <optional>
#include <string>

#include "platform/files.h"

// The free bytes of the disk that the path lies on. What does not fit 31 bits is 1 GiB. A disk that is full, or cannot
// be asked, has 0 when it is the floppy ("A", not "a") and else 1 GiB, so that only a floppy can be found full or
// missing.
std::int32_t EspacoLivre(const std::string& Caminho);

// The same of a disk whose state is known.
std::int32_t EspacoLivre(const std::string& Caminho, const std::optional<platform::DiskFreeSpace>& Disco);
