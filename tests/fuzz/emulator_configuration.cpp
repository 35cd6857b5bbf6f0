// The emulator's configuration. The input's first two lines are the directories of the saves and of the games, the rest
// is the file. What the program makes of it is compared with what a look at one line after the other gives.
#include <optional>
#include <string>
#include <vector>

#include "mainwindow/configuracao_emulador.h"
#include "platform/text.h"
#include "tests/fuzz/target.h"

namespace {

constexpr std::string_view Keys[] = {"SAVEDIRECTORY =", "GAMEDIRECTORY ="};

// A line as far as an entry can reach, and what ends it: CR LF, LF, or nothing at the end of the file.
struct Line {
  std::string Text, End;
};

std::vector<Line> LinesOf(std::string_view content) {
  std::vector<Line> lines;
  while (!content.empty()) {
    const bool ended = content.find('\n') != std::string_view::npos;
    std::string text(TakeLine(content));
    const bool both = ended && text.ends_with('\r');
    if (both) text.pop_back();
    lines.push_back({text, both ? "\r\n" : ended ? "\n" : ""});
  }
  return lines;
}

std::string Join(const std::vector<Line>& lines) {
  std::string content;
  for (const Line& line : lines) content += line.Text + line.End;
  return content;
}

std::string Upper(const std::string& text) { return platform::CharUpperBuffA(text); }

std::size_t Occurrences(const std::string& text, std::string_view wanted) {
  std::size_t count = 0;
  for (auto at = text.find(wanted); at != std::string::npos; at = text.find(wanted, at + 1)) ++count;
  return count;
}

// Two entries on one line are none that an emulator writes: replacing the one may change the other. Nor is a CR that
// ends no line: with it at its end, an entry is the same as another one with a part of that one's CR LF.
bool Ordinary(const std::vector<Line>& lines) {
  for (const Line& line : lines) {
    if (line.Text.find('\r') != std::string::npos) return false;
    if (Occurrences(Upper(line.Text), Keys[0]) + Occurrences(Upper(line.Text), Keys[1]) > 1) return false;
  }
  return true;
}

// The entry of the last line that has the key, as it is written there; nothing when there is none.
std::optional<std::string> Entry(const std::vector<Line>& lines, std::string_view key) {
  for (auto line = lines.rbegin(); line != lines.rend(); ++line) {
    const auto at = Upper(line->Text).find(key);
    if (at != std::string::npos) return line->Text.substr(at);
  }
  return std::nullopt;
}

// The lines with the entry set: on its own line, and wherever the very same stands; or on a line of its own at the end.
void Set(std::vector<Line>& lines, std::string_view key, const std::string& entry) {
  const auto old = Entry(lines, key);
  if (!old) {
    lines.push_back({"", "\r\n"});
    lines.push_back({entry, "\r\n"});
    return;
  }
  if (Upper(*old) == Upper(entry)) return;
  for (Line& line : lines) {
    const auto at = line.Text.find(*old);
    if (at != std::string::npos) line.Text.replace(at, old->size(), entry);
  }
}

}  // namespace

void Test(std::string_view input) {
  const std::string saves(TakeLine(input)), games(TakeLine(input)), content(input);
  const auto updated = ConfiguracaoAtualizada(content, saves, games);
  Require(!updated || *updated != content);
  // No directory holds a part of an entry, or ends a line.
  if (Upper(saves + games).find("DIRECTORY") != std::string::npos) return;
  if ((saves + games).find('\r') != std::string::npos) return;

  const std::string entries[] = {"SaveDirectory = " + saves.substr(0, saves.size() - !saves.empty()),
                                 "GameDirectory = " + games.substr(0, games.size() - !games.empty())};
  std::vector<Line> lines = LinesOf(content);
  for (int i = 0; i < 2; ++i) {
    if (!Ordinary(lines)) return;
    Set(lines, Keys[i], entries[i]);
  }
  const std::string now = updated.value_or(content);
  Require(now == Join(lines));
  Require(ConfiguracaoAtualizada(now, saves, games) == std::nullopt);
  lines = LinesOf(now);
  for (int i = 0; i < 2; ++i) Require(Upper(Entry(lines, Keys[i]).value()) == Upper(entries[i]));
}
