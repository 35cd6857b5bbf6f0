// Tables, archives and DOS names: functions of texts.
#include "keeper/codificacao.h"
#include "keeper/csv.h"
#include "keeper/nome_dos.h"
#include "keeper/rom.h"
#include "keeper/zip.h"
#include "tests/keeper/keeper.h"

namespace {

// The fields between bars, each line with its number before it; "wrong N" at the end.
std::string Fields(const std::string& content) {
  LeitorCsv table(content);
  std::string text;
  while (const auto line = table.Proxima()) {
    text += std::to_string(line->Numero) + "[";
    for (const std::string& field : line->Campos) text += field + "|";
    text += "]";
  }
  return table.LinhaErrada() == 0 ? text : text + "wrong " + std::to_string(table.LinhaErrada());
}

TEST(Csv, IsReadAsPeopleAndProgramsWriteIt) {
  const struct {
    const char *Name, *Content, *Fields;
  } cases[] = {
      {"commas", "a,b\r\n1,2;3\r\n", "1[a|b|]2[1|2;3|]"},
      {"semicolons", "a;b\n1,5;2", "1[a|b|]2[1,5|2|]"},
      {"quotes decide nothing about the separator", "\"a,b\";c\n1,2;3\n", "1[a,b|c|]2[1,2|3|]"},
      {"empty fields", "a,b,c\n,,\n", "1[a|b|c|]2[|||]"},
      {"empty lines are passed over and counted", "a\n\r\n\n1\r\r2", "1[a|]4[1|]6[2|]"},
      {"quotes, doubled quotes and line ends in a field", "a,b\r\n\"x \"\"y\"\"\r\nz\",1\r\n2,3",
       "1[a|b|]2[x \"y\"\r\nz|1|]4[2|3|]"},
      {"a quote without end", "a\n1\n\"x\ny", "1[a|]2[1|]wrong 3"},
      {"a quote in a field", "a\nx\"y\n1", "1[a|]wrong 2"},
      {"more behind a quote", "a\n\"x\"y\n1", "1[a|]wrong 2"},
      {"nothing", "", ""},
      {"one column", "arquivo\na.smc", "1[arquivo|]2[a.smc|]"},
  };
  for (const auto& [name, content, fields] : cases) EXPECT_EQ(Fields(content), fields) << name;
}

// Bytes that stand for the number, the lowest first.
using contract::Low;

TEST(Zip, SaysWhatIsInIt) {
  const std::string zip = FazerZip("a.smc", std::string(1000, 'x')).value_or("");
  ASSERT_GT(zip.size(), 100U);
  const std::size_t end = zip.size() - 22;
  EXPECT_EQ(zip.substr(22, 4), Low(1000, 4)) << "the length of the ROM";
  EXPECT_EQ(zip.substr(26, 2), Low(5, 2)) << "the length of its name";
  EXPECT_EQ(zip.substr(end + 8, 4), Low(1, 2) + Low(1, 2)) << "the number of entries";
  EXPECT_EQ(zip.substr(end + 12, 4), Low(46 + 5, 4)) << "the length of the directory";
}

TEST(Zip, OfOthersIsTakenOnlyWholeAndItsCommentGrows) {
  const std::string made = FazerZip("a.smc", Rom).value_or("");
  EXPECT_EQ(made, FazerZip("a.smc", Rom)) << "the same bytes each time";
  const std::string commented = std::string(made).replace(made.size() - 2, 2, Low(3, 2)) + "oi!";
  for (const std::string& whole : {made, commented}) {
    ASSERT_EQ(FimDoZip(whole), made.size() - 22);
    std::string longer = whole;
    ASSERT_TRUE(AlongarComentario(longer));
    EXPECT_EQ(longer.size(), whole.size() + 1);
    EXPECT_EQ(longer.substr(made.size() - 2, 2), Low(whole.size() - made.size() + 1, 2));
    EXPECT_EQ(FimDoZip(longer), made.size() - 22);
  }
  for (std::size_t length = 0; length < made.size(); ++length) EXPECT_FALSE(FimDoZip(made.substr(0, length))) << length;
  std::string longest = std::string(made).replace(made.size() - 2, 2, Low(65'535, 2)) + std::string(65'535, 'x');
  EXPECT_TRUE(FimDoZip(longest));
  EXPECT_FALSE(AlongarComentario(longest));
  const std::string noEntry = std::string(made).replace(made.size() - 12, 2, Low(0, 2));
  EXPECT_FALSE(FimDoZip(noEntry));
}

// What is not UTF-8 is in the code page.
TEST(Encoding, IsToldFromTheBytes) {
  Reset();
  const struct {
    const char *Name, *Content, *Utf8;
  } cases[] = {
      {"a mark", "\xEF\xBB\xBFx", "x"},
      {"ASCII", "x", "x"},
      {"two bytes", "\xC2\x80\xDF\xBF", "\xC2\x80\xDF\xBF"},
      {"three bytes", "\xE0\xA0\x80\xEF\xBF\xBF", "\xE0\xA0\x80\xEF\xBF\xBF"},
      {"four bytes", "\xF0\x90\x80\x80\xF4\x8F\xBF\xBF", "\xF0\x90\x80\x80\xF4\x8F\xBF\xBF"},
      {"a letter of the code page", "\xE7x", "\xC3\xA7x"},
      {"two of them", "\xC3\xC3", "\xC3\x83\xC3\x83"},
      {"the first byte alone, at the end", "x\xC3", "x\xC3\x83"},
      {"a byte that begins nothing", "\xBF\xC1\xBF", "\xC2\xBF\xC3\x81\xC2\xBF"},
      {"five bytes", "\xF5\xBF\xBF\xBF", "\xC3\xB5\xC2\xBF\xC2\xBF\xC2\xBF"},
  };
  for (const auto& [name, content, utf8] : cases) EXPECT_EQ(EmUtf8(content), utf8) << name;
}

TEST(Roms, AreKnownByTheirExtension) {
  const std::pair<const char*, bool> cases[] = {
      {"C:\\p\\a.smc", true}, {"a.SFC", true}, {"a.zip", true},   {"a.b.zip", true},
      {"C:\\p\\.smc", false}, {"asmc", false}, {"a.smc2", false}, {"a.tvk", false},
  };
  for (const auto& [file, isRom] : cases) EXPECT_EQ(EhRom(file), isRom) << file;
}

TEST(DosNames, StayWhereTheyCanAndElseComeFromTheName) {
  Reset();
  const struct {
    const char *Name, *DosName;
  } cases[] = {
      {"zebra", "ZEBRA"},          {"A_B-9876", "A_B-9876"}, {"123456789", "1234CXRL"}, {"Super Jogo", "SUPEP7PV"},
      {"Ação Máxima", "ACAOCBUM"}, {"con", "CONCFB5"},       {"a.b", "ABFZZT"},         {"!", "XNZA"},
      {"Ünïcødé ß", "UNICE6FR"},   {"a é", "AEP6LD"},
  };
  for (const auto& [name, dosName] : cases) EXPECT_EQ(FazerNomeDOS(platform::FromUtf8(name)), dosName) << name;
}

}  // namespace
