#include "platform/profile_text.h"

namespace platform {
namespace {

constexpr std::string_view Blanks = " \t\r\v\f\x1A";

std::string_view Trim(std::string_view text) {
  const std::size_t first = text.find_first_not_of(Blanks);
  if (first == std::string_view::npos) return {};
  return text.substr(first, text.find_last_not_of(Blanks) - first + 1);
}

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
std::optional<std::string_view> SectionName(std::string_view line) {
  const std::size_t end = line.rfind(']');
  if (!line.starts_with('[') || end == std::string_view::npos) return std::nullopt;
  return Trim(line.substr(1, end - 1));
}

}  // namespace

std::optional<std::string> FindProfileValue(std::string_view content, const std::string& section,
                                            const std::string& key, FoldName fold) {
  const auto folded = [fold](std::string_view name) { return fold(std::string(Trim(name))); };
  const std::string wantedSection = folded(section), wantedKey = folded(key);
  if (wantedKey.empty()) return std::nullopt;
  bool inside = false;
  while (!content.empty()) {
    const std::string_view line = TakeLine(content);
    if (const std::optional<std::string_view> name = SectionName(line)) {
      if (inside) return std::nullopt;
      inside = folded(*name) == wantedSection;
      continue;
    }
    const std::size_t equals = line.find('=');
    if (!inside || line.starts_with(';') || equals == std::string_view::npos) continue;
    if (folded(line.substr(0, equals)) == wantedKey) return std::string(WithoutQuotes(Trim(line.substr(equals + 1))));
  }
  return std::nullopt;
}

}  // namespace platform
