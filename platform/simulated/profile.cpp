#include "platform/profile.h"

#include <optional>

#include "platform/profile_text.h"
#include "platform/simulated/machine.h"
#include "platform/text.h"

namespace platform {

// The file is in the machine's code page, whichever that is.
std::string GetPrivateProfileStringA(const std::string& section, const std::string& key,
                                     const std::string& defaultValue, std::size_t bufferSize, const std::string& file) {
  const std::optional<std::string> content = simulated::Fails() ? std::nullopt : simulated::Content(file);
  std::optional<std::string> value;
  if (content) value = FindProfileValue(*content, section, key, CharUpperBuffA);
  if (!value) value = defaultValue.substr(0, defaultValue.find_last_not_of(' ') + 1);
  return std::string(WholeCharacters(*value, bufferSize == 0 ? 0 : bufferSize - 1));
}

}  // namespace platform
