#include "platform/environment.h"

#include "platform/simulated/machine.h"
#include "platform/text.h"

namespace platform {

std::string GetEnvironmentVariableA(const std::string& name) {
  const auto& environment = simulated::TheMachine().Environment;
  const auto found = environment.find(CharUpperBuffA(name));
  return found == environment.end() ? "" : found->second;
}

}  // namespace platform

namespace platform::simulated {

void SetEnvironment(const std::string& name, const std::string& value) {
  TheMachine().Environment[CharUpperBuffA(name)] = value;
}

}  // namespace platform::simulated
