// The translation file. The input's first line is a text of the program, its second one a value, the rest is the file.
#include <algorithm>
#include <string>

#include "platform/simulated/simulated.h"
#include "platform/text.h"
#include "support/mod_Globais.h"
#include "support/mod_Traducao.h"
#include "tests/fuzz/target.h"

namespace {

constexpr std::size_t Longest = 254;
constexpr std::string_view Blanks = " \t\r\v\f\x1A";

std::string TranslatedBy(const std::string& file, const std::string& text) {
  platform::simulated::PutFile(ArquivoIdioma, file);
  return Traduzir(text);
}

std::string_view Trim(std::string_view text) {
  const std::size_t first = std::min(text.find_first_not_of(Blanks), text.size());
  text.remove_prefix(first);
  return text.substr(0, text.find_last_not_of(Blanks) + 1);
}

// Whether the text can be a key: what stands before the sign, on a line that is nothing else.
bool CanBeKey(std::string_view text) {
  return !Trim(text).empty() && text.find('=') == std::string_view::npos && !Trim(text).starts_with(';') &&
         !Trim(text).starts_with('[');
}

// Whatever the file holds: a translation without bars, or the text; in any letter case; whatever other sections say.
void ReadAny(const std::string& text, const std::string& file) {
  const std::string translated = TranslatedBy(file, text);
  Require(translated == text || (translated.size() <= Longest && translated.find('|') == std::string::npos));
  const std::string upper = platform::CharUpperBuffA(text), ofUpper = TranslatedBy(file, upper);
  Require(ofUpper == (translated == text ? ofUpper : translated));
  const std::string other = "[TOLVARIS2]\r\n" + text + "=x\r\n";
  if (CanBeKey(text)) Require(TranslatedBy(other + file, text) == translated);
  if (file.find('=') == std::string::npos) Require(translated == text);
}

// A value that is known because it was put first is the translation: without the blanks and the quotes around it, cut,
// without bars. Bars around nothing are no translation.
void ReadKnown(const std::string& text, std::string_view value, const std::string& file) {
  if (!CanBeKey(text) || Trim(value).ends_with(']')) return;
  std::string expected(Trim(value));
  const char quote = expected.size() < 2 || expected.front() != expected.back() ? 'x' : expected.front();
  if (quote == '"' || quote == '\'') expected = expected.substr(1, expected.size() - 2);
  expected.resize(std::min(expected.size(), Longest));
  const bool nothing = expected.size() <= 2 && expected.find_first_not_of('|') == std::string::npos;
  std::erase(expected, '|');
  if (nothing) expected = text;
  const std::string line = text + " =" + std::string(value) + "\n";
  Require(TranslatedBy("[tolvaris20]\n" + line + file, text) == expected);
}

}  // namespace

void Test(std::string_view input) {
  ArquivoIdioma = "C:\\language.ini";
  const std::string text(TakeLine(input));
  const std::string_view value = TakeLine(input);
  const std::string file(input);
  ReadAny(text, file);
  ReadKnown(text, value, file);
  ArquivoIdioma.clear();
  Require(Traduzir(text) == text);
}
