// The environment variables that the program was started with.
#pragma once

#include <string>

namespace platform {

// The value of a variable, named without regard to letter case; empty when there is none.
std::string GetEnvironmentVariableA(const std::string& name);

}  // namespace platform
