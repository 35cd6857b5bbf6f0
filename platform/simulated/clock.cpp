#include "platform/clock.h"

#include "platform/simulated/machine.h"

namespace platform {

std::int64_t SystemTime() { return static_cast<std::int64_t>(simulated::TheMachine().Clock); }

std::string LocalDate() { return "2026-11-23"; }

}  // namespace platform
