// SHA-256 for the machine itself, which never fails.
#pragma once

#include "platform/hash.h"

namespace platform::simulated {

Sha256Value HashOf(std::string_view bytes);

}  // namespace platform::simulated
