#include "platform/clock.h"

#include "platform/simulated/machine.h"

namespace platform {

std::int64_t SystemTime() { return static_cast<std::int64_t>(simulated::TheMachine().Clock); }

}  // namespace platform
