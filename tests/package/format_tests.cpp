// The package format.
#include <gtest/gtest.h>
#include <unistd.h>

#include <algorithm>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <random>
#include <string>

#include "package/cls_CRC.h"
#include "package/pacote.h"
#include "platform/text.h"

namespace {

const std::string Example =
    "TOLVARIS\r\nNOME=Super Jogo\r\nNOMEDOS=SUPERJOG\r\nCRC=-873187034\r\n"
    "iIMG=1\r\ntIMG=6\r\niROM=7\r\ntROM=9\r\n|IMGROMDAT|GIF89a123456789";

// The example with one piece of it replaced by another.
std::string ExampleWith(const std::string& from, const std::string& to) {
  return std::string(Example).replace(Example.find(from), from.size(), to);
}

std::string Build(const std::string& name, const std::string& dosName, const std::string& crc = "1",
                  const std::string& picture = "I", const std::string& rom = "R") {
  return MontarPacote(name, dosName, crc, std::ssize(picture), std::ssize(rom), picture, rom);
}

// The five pieces that are read, between bars.
std::string PiecesOf(const std::string& content) {
  const auto read = LerPacote(content);
  if (!read) return "refused";
  return (read->Nome + "|" + read->DOSName + "|" + read->CRC + "|").append(read->Imagem).append("|").append(read->Rom);
}

TEST(Package, TheExampleIsWrittenAndReadByteForByte) {
  EXPECT_EQ(MontarPacote("Super Jogo", "SUPERJOG", "-873187034", 6, 9, "GIF89a", "123456789"), Example);
  EXPECT_EQ(PiecesOf(Example), "Super Jogo|SUPERJOG|-873187034|GIF89a|123456789");
  EXPECT_EQ(MontarPacote("", "", "", 0, 5'000'000'000, "", "R"),
            "TOLVARIS\r\nNOME=\r\nNOMEDOS=\r\nCRC=\r\niIMG=1\r\ntIMG=0\r\niROM=1\r\ntROM=5000000000\r\n|IMGROMDAT|R");
}

TEST(Package, IsReadInEveryFormThatTheFormatAllows) {
  const struct {
    const char *Name, *From, *To, *Blocks;
  } cases[] = {
      {"no line end behind the first word", "TOLVARIS\r\n", "Tolvaris", "GIF89a|123456789"},
      {"the marker in another letter case", "|IMGROMDAT|", "|imgRomDat|", "GIF89a|123456789"},
      {"a key in another letter case, behind another line", "CRC=", "lixo\r\ncrC=", "GIF89a|123456789"},
      {"another order, and blanks around a number", "iIMG=1\r\ntIMG=6", "TIMG= \t06 \r\niIMG=1", "GIF89a|123456789"},
      {"blocks that overlap", "iIMG=1", "iIMG=4", "89a123|123456789"},
      {"more behind the blocks", "123456789", "123456789 and more", "GIF89a|123456789"},
      {"cut in the picture", "GIF89a123456789", "GI", "GI|"},
      {"a ROM longer than the content", "tROM=9", "tROM=2147483647", "GIF89a|123456789"},
      {"a ROM beyond the content", "iROM=7", "iROM=2147483647", "GIF89a|"},
  };
  for (const auto& [name, from, to, blocks] : cases) {
    EXPECT_EQ(PiecesOf(ExampleWith(from, to)), std::string("Super Jogo|SUPERJOG|-873187034|") + blocks) << name;
  }
  // A key is searched in the whole header: a name that holds one answers for the line that the key belongs to.
  EXPECT_EQ(PiecesOf(Build("Jogo Nomedos=OUTRO", "JOGO", "")), "Jogo Nomedos=OUTRO|OUTRO||I|R");
  EXPECT_EQ(PiecesOf(Build("", "TROM=2", "7", "I", "ROM")), "|TROM=2|7|I|RO");
}

TEST(Package, WhatIsRefused) {
  const struct {
    const char *Name, *From, *To;
  } cases[] = {
      {"another first word", "TOLVARIS", "TOLVARIZ"},
      {"a blank before the first word", "TOLVARIS", " TOLVARIS"},
      {"half a marker", "|IMGROMDAT|", "|IMGROMDAT"},
      {"no name", "NOME=", "NOMEx="},
      {"no DOS name", "NOMEDOS=", "NOMEDOSx="},
      {"no checksum", "CRC=", "CRCx="},
      {"no start of the picture", "iIMG=", "iIMGx="},
      {"no length of the picture", "tIMG=", "tIMGx="},
      {"no start of the ROM", "iROM=", "iROMx="},
      {"no length of the ROM", "tROM=", "tROMx="},
      {"a lone line feed", "tROM=9\r\n", "tROM=9\n"},
      {"a picture that starts at zero", "iIMG=1", "iIMG=0"},
      {"a ROM that starts at zero", "iROM=7", "iROM=0"},
      {"a ROM of no bytes", "tROM=9", "tROM=0"},
      {"a picture of no bytes", "tIMG=6", "tIMG=0"},
      {"blanks for a number", "tIMG=6", "tIMG=  "},
      {"a plus", "tIMG=6", "tIMG=+6"},
      {"a minus", "tIMG=6", "tIMG=-6"},
      {"more than 31 bits", "tIMG=6", "tIMG=2147483648"},
      {"more than 32 bits", "tIMG=6", "tIMG=4294967297"},
      {"more than 64 bits", "tIMG=6", "tIMG=18446744073709551617"},
      {"a DOS name that leads elsewhere", "=SUPERJOG", "=..\\JOGO"},
      {"a name that leads elsewhere", "=Super Jogo", "=../JOGO"},
      {"a DOS name within the name, with a drive", "=Super", "=nomedos=C:"},
  };
  for (const auto& [name, from, to] : cases) EXPECT_EQ(PiecesOf(ExampleWith(from, to)), "refused") << name;
  for (std::size_t length = 0; length < Example.size(); ++length) {
    EXPECT_EQ(PiecesOf(Example.substr(0, length)) != "refused", length >= Example.find("GIF89a")) << length;
  }
  const std::size_t room = 10'240 - Build("", "", "1", "", "").size();  // the marker has to end within 10,240 bytes
  EXPECT_NE(PiecesOf(Build(std::string(room, 'x'), "")), "refused");
  EXPECT_EQ(PiecesOf(Build(std::string(room + 1, 'x'), "")), "refused");
}

// An extension always follows, so ".." leads nowhere; and what the platform refuses by itself is left to it.
TEST(FileName, IsNoneThatWouldLeaveItsDirectory) {
  const std::string outside[] = {"..\\JOGO", "../JOGO", "\\JOGO",  "C:JOGO", "JO:oculto",    "JO\tGO",
                                 "JO\nGO",   "\x1F",    "CON",     "nul",    "Aux.txt",      "PRN  .x",
                                 "com1",     "LPT9",    "COM\xB2", "CONIN$", {"JO.exe\0", 7}};
  const std::string inside[] = {
      "CONTRA", "COM10", "COMX", "LPT", "Super CON", " CON", "..", "Jogo Bros. ", "Quem? *<>\"", "Ação|Pão=1"_ansi,
  };
  for (const auto& each : outside) EXPECT_FALSE(NomeSeguro(each)) << each;
  for (const auto& each : inside) EXPECT_TRUE(NomeSeguro(each)) << each;
}

TEST(Package, WhatIsWrittenIsReadBack) {
  std::mt19937 random(3);
  const auto drawFrom = [&](const std::string& alphabet, std::size_t longest) {
    std::string text(1 + random() % longest, ' ');
    std::ranges::generate(text, [&] { return alphabet[random() % alphabet.size()]; });
    return text;
  };
  // Every key needs one of E, S, C, G and M before its "=", so these letters never make one.
  const std::string letters = "abdfhijklnopqrtuvwxyzABDFHIJKLNOPQRTUVWXYZ 0123456789|=.,-'()[]!&~áÉçÃôÜñÿ"_ansi;
  const std::string bytes("\0\r\n\t\x1A\xFF|IMGROMDAT|=", 18);
  for (int round = 0; round < 500; ++round) {
    const std::string name = drawFrom(letters, 300), dosName = drawFrom(letters, 40), crc = drawFrom(letters, 12);
    const std::string picture = "|IMGROMDAT|" + drawFrom(bytes, 5'000), rom = drawFrom(bytes, 5'000);
    const std::string pieces = name + "|" + dosName + "|" + crc + "|" + picture + "|" + rom;
    EXPECT_TRUE(PiecesOf(Build(name, dosName, crc, picture, rom)) == pieces) << name << " / " << dosName;
  }
}

// Beside package_format.py, which was written from the format alone.
TEST(Package, IsReadAndWrittenAlikeInPython) {
  const auto directory = std::filesystem::temp_directory_path() / ("tolvaris-package-" + std::to_string(getpid()));
  std::filesystem::create_directories(directory);
  std::filesystem::current_path(directory);
  const auto readFile = [](const char* file) {
    std::ifstream input(file, std::ios::binary);
    return std::string(std::istreambuf_iterator<char>(input), {});
  };
  const auto run = [](const std::string& arguments) {
    const std::string command = "LC_ALL=C.UTF-8 python3 '" TOLVARIS_PACKAGE_FORMAT_PY "' " + arguments;
    EXPECT_EQ(std::system((command + " >output").c_str()), 0) << arguments;
  };
  const std::string name = " Ação & Emoção (B) [!] - não|é=isso " + std::string(300, 'x') + " ", dosName = "AÇÃO~1";
  const std::string picture("|IMGROMDAT|\0\r\n|IMGROMDAT|\0\r\nCRC=1\r\n", 35);
  std::string rom(2'500'000, '\0');
  std::ranges::generate(rom, [random = std::mt19937(7)]() mutable { return static_cast<char>(random()); });
  const std::string crc = TextoCRC(cls_CRC().CRC(rom).value_or(0)), texts = name + "\n" + dosName + "\n" + crc + "\n";
  const std::string ours = Build(platform::FromUtf8(name), platform::FromUtf8(dosName), crc, picture, rom);
  EXPECT_TRUE(PiecesOf(ours) == platform::FromUtf8(name + "|" + dosName + "|") + crc + "|" + picture + "|" + rom);
  std::ofstream("ours", std::ios::binary) << ours;
  run("read ours picture rom");
  EXPECT_EQ(readFile("output"), texts + crc + "\n");
  run("build theirs '" + name + "' '" + dosName + "' picture rom");
  EXPECT_TRUE(readFile("theirs") == ours);
  std::filesystem::remove_all(directory);
}

}  // namespace
