#include "platform/profile.h"

#include <algorithm>
#include <optional>
#include <string_view>

#include "platform/simulated/machine.h"
#include "platform/text.h"

namespace platform {
namespace {

constexpr std::string_view Blanks = " \t\r\v\f\x1A";

std::string_view Trim(std::string_view text) {
  const std::size_t first = text.find_first_not_of(Blanks);
  if (first == std::string_view::npos) return {};
  return text.substr(first, text.find_last_not_of(Blanks) - first + 1);
}

std::string Fold(std::string_view text) { return CharUpperBuffA(std::string(Trim(text))); }

std::string_view WithoutQuotes(std::string_view value) {
  const bool quoted = value.size() >= 2 && (value.front() == '"' || value.front() == '\'');
  return quoted && value.front() == value.back() ? value.substr(1, value.size() - 2) : value;
}

// The next line without blanks around it, taken off the front.
std::string_view TakeLine(std::string_view& rest) {
  const std::size_t end = rest.find('\n');
  const std::string_view line = rest.substr(0, end);
  rest.remove_prefix(end == std::string_view::npos ? rest.size() : end + 1);
  return Trim(line);
}

// The name of the section that starts with this line.
std::optional<std::string> SectionName(std::string_view line) {
  const std::size_t end = line.rfind(']');
  if (!line.starts_with('[') || end == std::string_view::npos) return std::nullopt;
  return Fold(line.substr(1, end - 1));
}

// The value of the first such key in the first such section.
std::optional<std::string> FindValue(std::string_view content, const std::string& section, const std::string& key) {
  bool inside = false;
  while (!content.empty()) {
    const std::string_view line = TakeLine(content);
    if (const std::optional<std::string> name = SectionName(line)) {
      if (inside) return std::nullopt;
      inside = *name == section;
      continue;
    }
    const std::size_t equals = line.find('=');
    if (!inside || line.starts_with(';') || equals == std::string_view::npos) continue;
    if (Fold(line.substr(0, equals)) == key) return std::string(WithoutQuotes(Trim(line.substr(equals + 1))));
  }
  return std::nullopt;
}

}  // namespace

std::string GetPrivateProfileStringA(const std::string& section, const std::string& key,
                                     const std::string& defaultValue, std::size_t bufferSize, const std::string& file) {
  const std::optional<std::string> content = simulated::Fails() ? std::nullopt : simulated::Content(file);
  const std::string upperKey = Fold(key);
  std::optional<std::string> value;
  if (content && !upperKey.empty()) value = FindValue(*content, Fold(section), upperKey);
  if (!value) value = defaultValue.substr(0, defaultValue.find_last_not_of(' ') + 1);
  return value->substr(0, bufferSize == 0 ? 0 : bufferSize - 1);
}

}  // namespace platform
