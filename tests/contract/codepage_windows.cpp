// Texts in code page 1252 and in others, with which this file's tests run once more: 932, where a character has one
// byte or two, and 65001.
#include <windows.h>

#include <cstdlib>
#include <map>

#include "platform/profile.h"
#include "platform/text.h"
#include "platform/windows/control.h"
#include "tests/contract/hand.h"

namespace {

using namespace contract;

constexpr UINT Western = 1252, Japanese = 932, Utf8 = CP_UTF8;

class CodePage : public Machine {
 protected:
  // What runs these tests once more says under which one.
  CodePage() {
    const char* const wanted = std::getenv("TOLVARIS_CODE_PAGE");
    EXPECT_EQ(page_, wanted != nullptr ? static_cast<UINT>(std::atoi(wanted)) : Western);
  }

  const UINT page_ = ::GetACP();
};

TEST_F(CodePage, TextsAreWholeOrReadable) {
  const struct {
    const char* Name;
    const char* Text;
    std::map<UINT, string> Shown;
  } cases[] = {
      {"plain", "Jogar", {{Western, "Jogar"}, {Japanese, "Jogar"}, {Utf8, "Jogar"}}},
      {"accents",
       "Não há, à É",
       {{Western, "N\xE3o h\xE1, \xE0 \xC9"}, {Japanese, "Nao ha, a E"}, {Utf8, "Não há, à É"}}},
      {"katakana", "ソ!", {{Western, "?!"}, {Japanese, "\x83\x5C!"}, {Utf8, "ソ!"}}},
      {"beyond 16 bits", "<😀>", {{Western, "<?>"}, {Japanese, "<?>"}, {Utf8, "<😀>"}}},
  };
  for (const auto& [name, text, shown] : cases) EXPECT_EQ(FromUtf8(text), shown.at(page_)) << name;
}

TEST_F(CodePage, UpperCaseChangesLettersAndNoByteBesides) {
  EXPECT_EQ(CharUpperBuffA("Jogo ç ソツナ ı"_ansi), page_ == Japanese ? "JOGO C \x83\x5C\x83\x63\x83\x69 I"
                                                    : page_ == Utf8   ? "JOGO Ç ソツナ ı"
                                                                      : "JOGO \xC7 ??? I");
  if (page_ == Western) return;
  const string noCharacters = "\xFF\xFE\xE3\xC9\x81\x80";
  EXPECT_EQ(CharUpperBuffA("a" + noCharacters), "A" + noCharacters);
}

TEST_F(CodePage, ACharacterBeginsWhereNoOtherGoesOn) {
  const std::map<UINT, string> begins = {{Western, "yyyyyy"}, {Japanese, "yynyyn"}, {Utf8, "yynnyynn"}};
  string found;
  const string text = "|ポ|ソ"_ansi;  // in code page 932 the second byte of these is "|" and "\"
  for (std::size_t i = 0; i < text.size(); ++i) found += CharacterBeginsAt(text, i) ? 'y' : 'n';
  EXPECT_EQ(found, page_ == Western ? "yyyy" : begins.at(page_));
}

// A value that is found is "Ação".
TEST_F(CodePage, InitialisationFilesOfEitherEncodingAreRead) {
  const string utf8 = "[TOLVARIS20]\r\nNão há=Ação\r\n";
  const string western = "[TOLVARIS20]\r\nN\xE3o h\xE1=A\xE7\xE3o\r\n";
  const struct {
    const char* Name;
    string Content;
  } cases[] = {
      {"code page 1252", western},
      {"UTF-8", utf8},
      {"UTF-8 with its mark", "\xEF\xBB\xBF" + utf8},
  };
  for (const auto& [name, content] : cases) {
    if (page_ == Western && content != western) continue;  // Windows reads them in its own way
    Put(here_ + "language.ini", content);
    EXPECT_EQ(GetPrivateProfileStringA("TOLVARIS20", "NãO há"_ansi, "none", 255, here_ + "language.ini"), "Ação"_ansi)
        << name;
  }
}

TEST_F(CodePage, AValueIsCutBehindAWholeCharacter) {
  const std::map<UINT, string> cut = {{Western, "12345"}, {Japanese, "123\x83\x5C"}, {Utf8, "123"}};
  Put(here_ + "language.ini", page_ == Western ? "[TOLVARIS20]\r\nSo=1234567" : "[TOLVARIS20]\r\nSo=123ソソ");
  EXPECT_EQ(GetPrivateProfileStringA("TOLVARIS20", "So", "", 6, here_ + "language.ini"), cut.at(page_));
}

// "Ā" looks like "A", which names another file.
TEST_F(CodePage, AFileWhoseNameItCannotGiveHasAShortNameThatCan) {
  std::wstring path(here_.begin(), here_.end());
  path += L"\u0100 \u30BD\u05D0.zip";
  ::CloseHandle(::CreateFileW(path.c_str(), GENERIC_WRITE, 0, nullptr, CREATE_ALWAYS, 0, nullptr));
  Put(here_ + "A.zip", "another");
  const std::map<UINT, string> names = {{Western, "? ??.zip"}, {Japanese, "? \x83\x5C?.zip"}, {Utf8, "Ā ソא.zip"}};
  std::map<string, string> found;
  for (const DirectoryEntry& each : ListDirectory(here_, "*.zip")) found[each.Name] = each.ShortName;
  EXPECT_EQ(found.size(), 2U);
  ASSERT_TRUE(found.contains(names.at(page_)));
  EXPECT_EQ(FileSize(here_ + found[names.at(page_)]), 0);
}

TEST_F(CodePage, AListGivesBackWhatItGot) {
  Window window({"Janela", 3000, 3000});
  ListBox list(window, {0, 0, 2000, 2000}, ListBox::Order::Sorted);
  const string foreign = "Jo\xE3o";  // no text in code page 65001, nor in 932
  list.Fill({foreign, "Ana"});
  list.Add("\xC9lan");
  const HWND native = list.State().Handle;
  wchar_t shown[8] = L"";
  const int index = list.FindExact(foreign);
  EXPECT_EQ(list.Text(index), foreign);
  ::SendMessageW(native, LB_GETTEXT, static_cast<WPARAM>(index), reinterpret_cast<LPARAM>(shown));
  if (page_ != Japanese) {
    EXPECT_EQ(std::wstring(shown), L"Jo\u00E3o");
  }
  EXPECT_EQ(list.Text(list.FindExact("\xC9lan")), "\xC9lan");
  list.Clear();
  list.Add("Outro");
  EXPECT_EQ(list.Text(0), "Outro");
}

}  // namespace
