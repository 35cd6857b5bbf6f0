// The machine's clock, which can be wrong and can be set back.
#pragma once

#include <cstdint>

namespace platform {

// Seconds since 1970-01-01T00:00:00Z.
std::int64_t SystemTime();

}  // namespace platform
