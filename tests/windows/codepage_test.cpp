// The program under code page 1252, and once more under 932 and 65001.
#include <cstdlib>

#include "tests/windows/installation.h"

namespace {

class CodePage : public Installation {
 protected:
  // What runs these tests once more says under which one.
  CodePage() {
    const char* const wanted = std::getenv("TOLVARIS_CODE_PAGE");
    EXPECT_EQ(page, wanted != nullptr ? static_cast<UINT>(std::atoi(wanted)) : 1252U);
  }

  // A text in code page 1252, as it is shown: 932 has no accents.
  std::string Shown(const std::string& text, const std::string& japanese) const {
    return page == 932 ? japanese : text;
  }

  const UINT page = GetACP();
};

TEST_F(CodePage, MessagesAreReadableAndTranslatedFromAFileOfEitherEncoding) {
  const std::string western = "[TOLVARIS20]\r\nO jogo n\xE3o foi encontrado.=Il a \xE9t\xE9 ici.\r\n";
  const std::string utf8 = "[TOLVARIS20]\r\nO jogo n\xC3\xA3o foi encontrado.=Il a \xC3\xA9t\xC3\xA9 ici.\r\n";
  const std::string translated = Shown("Il a \xE9t\xE9 ici.", "Il a ete ici.");
  const struct {
    const char* Name;
    std::string File, Text;
  } cases[] = {
      {"no file", "", Shown("O jogo n\xE3o foi encontrado.", "O jogo nao foi encontrado.")},
      {"code page 1252", western, translated},
      {"UTF-8", utf8, translated},
      {"UTF-8 with its mark", "\xEF\xBB\xBF" + utf8, translated},
  };
  Set("LRom", "Zebra");
  for (const auto& [name, file, text] : cases) {
    SCOPED_TRACE(name);
    if (page == 1252 && file.find("\xC3") != std::string::npos) continue;  // Windows reads the file as it does
    Put("Roms\\ZEBRA.SMC", "jogo");
    if (!file.empty()) Put("language.ini", file);
    Start();
    Remove("Roms\\ZEBRA.SMC");
    window->Play.Click();
    EXPECT_EQ(Answer(IDOK), (Message{"Erro", text, {IDOK}}));
    program.reset();
  }
}

// In code page 932 the second bytes of the first and of the last letter are "\\" and "|"; 1252 has none of them.
TEST_F(CodePage, AGameWithAJapaneseNameIsShownAndPlayed) {
  const std::wstring name = L"\u30BD\u30CB\u30C3\u30AF\u30DD", directory = L"C:\\Ensaio\\";
  const std::wstring rom = directory + L"Roms\\" + name + L".smc";
  Put("Imgs\\a.gif", Gif(RGB(10, 200, 60)));
  MoveFileW((directory + L"Imgs\\a.gif").c_str(), (directory + L"Imgs\\" + name + L".gif").c_str());
  MoveFileW((directory + L"Roms\\ZEBRA.SMC").c_str(), rom.c_str());
  std::wstring shortPath(MAX_PATH, L'\0');
  shortPath.resize(GetShortPathNameW(rom.c_str(), shortPath.data(), MAX_PATH));
  const Call expected = {Emulator + " " + FromWide(shortPath), Home + "Emulador"};
  const std::string listed = page == 1252 ? "?????" : FromWide(name);
  Start();
  Select(listed);
  if (page != 1252) {
    EXPECT_SOON_EQ(RGB(10, 200, 60), window->Preview());
  }
  PressKey(VK_RETURN);
  EXPECT_EQ(NextCall(Emulator), expected);
  Start();
  EXPECT_EQ(Selected(), listed) << "the last game";
}

}  // namespace
