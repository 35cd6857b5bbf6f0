// The machine's clock, which can be wrong and can be set back.
#pragma once

#include <cstdint>
#include <string>

namespace platform {

// Seconds since 1970-01-01T00:00:00Z.
std::int64_t SystemTime();

// The day on the person's calendar, as "2026-11-23".
std::string LocalDate();

}  // namespace platform
