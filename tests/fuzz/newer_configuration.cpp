// The configuration of newer emulators. The input's first two lines are the directories of the games and of the saves,
// the rest is the file.
#include <algorithm>
#include <optional>
#include <string>
#include <vector>

#include "autoconfig/forma_nova.h"
#include "platform/text.h"
#include "tests/fuzz/target.h"

namespace {

// The value that a line gives to the key, as the emulator understands it, and what follows it; nothing when the line
// gives it none.
struct Value {
  std::string Directory, Rest;
};

std::optional<Value> ValueOn(std::string_view line, std::string_view key) {
  if (!line.starts_with(key)) return std::nullopt;
  line.remove_prefix(key.size());
  const bool quoted = line.starts_with('"');
  Value value;
  std::size_t at = quoted ? 1 : 0;
  for (; at < line.size() && line[at] != '\r' && !(quoted && line[at] == '"'); ++at) {
    if (quoted && line.substr(at).starts_with("\\\\")) ++at;
    value.Directory += line[at];
  }
  if (quoted && at < line.size() && line[at] == '"') ++at;
  value.Rest = line.substr(at);
  return value;
}

// The same directory in every way to write it.
std::string Comparable(std::string directory) {
  while (directory.ends_with('\\')) directory.pop_back();
  return platform::CharUpperBuffA(directory);
}

std::vector<std::string_view> LinesOf(std::string_view content) {
  std::vector<std::string_view> lines;
  while (!content.empty()) lines.push_back(TakeLine(content));
  return lines;
}

struct Wanted {
  std::string_view Key;
  std::string Directory;
};

// How many of the keys have a line.
std::size_t CountKeys(std::string_view content, const std::vector<Wanted>& wanted) {
  std::size_t count = 0;
  for (const Wanted& each : wanted) {
    const auto lines = LinesOf(content);
    if (std::ranges::any_of(lines, [&](std::string_view line) { return line.starts_with(each.Key); })) ++count;
  }
  return count;
}

// A line that sets one of the directories sets the wanted one, with all that stood behind the value; every other line
// is as it was.
void CompareLine(std::string_view before, std::string_view after, const std::vector<Wanted>& wanted) {
  for (const auto& [key, directory] : wanted) {
    const auto old = ValueOn(before, key), now = ValueOn(after, key);
    Require(old.has_value() == now.has_value());
    if (!now) continue;
    Require(Comparable(now->Directory) == Comparable(directory));
    Require(now->Rest == old->Rest);
    return;
  }
  Require(before == after);
}

}  // namespace

void Test(std::string_view input) {
  const std::string games(TakeLine(input)), saves(TakeLine(input));
  const auto changed = ComDiretorios(input, games, saves);
  if ((games + saves).find_first_of("\"\r") != std::string::npos) return;

  const std::string now = changed.value_or(std::string(input));
  Require(!changed || now != input);
  Require(FormaNova(now) && ComDiretorios(now, games, saves) == std::nullopt);
  const std::vector<Wanted> wanted = {{"ROMPath=", games}, {"SRAMPath=", saves}};
  // What is added stands behind the end of the last line, which it may have had to get.
  std::string old(input);
  if (!old.ends_with('\n') && CountKeys(old, wanted) < wanted.size()) {
    old += old.find("\r\n") == std::string::npos ? "\n" : "\r\n";
  }
  const auto before = LinesOf(old), after = LinesOf(now);
  Require(after.size() == before.size() + wanted.size() - CountKeys(old, wanted));
  for (std::size_t i = 0; i < after.size(); ++i) {
    CompareLine(i < before.size() ? before[i] : after[i], after[i], wanted);
  }
  Require(CountKeys(now, wanted) == wanted.size());
}
