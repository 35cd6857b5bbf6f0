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

const std::string Exemplo =
    "TOLVARIS\r\nNOME=Super Jogo\r\nNOMEDOS=SUPERJOG\r\nCRC=-873187034\r\n"
    "iIMG=1\r\ntIMG=6\r\niROM=7\r\ntROM=9\r\n|IMGROMDAT|GIF89a123456789";

// The example with one piece of it replaced by another.
std::string ExemploCom(const std::string& de, const std::string& para) {
  return std::string(Exemplo).replace(Exemplo.find(de), de.size(), para);
}

std::string Montar(const std::string& nome, const std::string& dosName, const std::string& crc = "1",
                   const std::string& imagem = "I", const std::string& rom = "R") {
  return MontarPacote(nome, dosName, crc, std::ssize(imagem), std::ssize(rom), imagem, rom);
}

// The five pieces that are read, between bars.
std::string Pecas(const std::string& conteudo) {
  const auto lido = LerPacote(conteudo);
  if (!lido) return "refused";
  return (lido->Nome + "|" + lido->DOSName + "|" + lido->CRC + "|").append(lido->Imagem).append("|").append(lido->Rom);
}

TEST(Pacote, TheExampleIsWrittenAndReadByteForByte) {
  EXPECT_EQ(MontarPacote("Super Jogo", "SUPERJOG", "-873187034", 6, 9, "GIF89a", "123456789"), Exemplo);
  EXPECT_EQ(Pecas(Exemplo), "Super Jogo|SUPERJOG|-873187034|GIF89a|123456789");
  EXPECT_EQ(MontarPacote("", "", "", 0, 5'000'000'000, "", "R"),
            "TOLVARIS\r\nNOME=\r\nNOMEDOS=\r\nCRC=\r\niIMG=1\r\ntIMG=0\r\niROM=1\r\ntROM=5000000000\r\n|IMGROMDAT|R");
}

TEST(Pacote, IsReadInEveryFormThatTheFormatAllows) {
  const char* const casos[][3] = {
      {"TOLVARIS\r\n", "Tolvaris", "GIF89a|123456789"},  // no line end is asked for there
      {"|IMGROMDAT|", "|imgRomDat|", "GIF89a|123456789"},
      {"CRC=", "lixo\r\ncrC=", "GIF89a|123456789"},
      {"iIMG=1\r\ntIMG=6", "TIMG= \t06 \r\niIMG=1", "GIF89a|123456789"},
      // blocks may overlap, and are cut short where the content ends
      {"iIMG=1", "iIMG=4", "89a123|123456789"},
      {"123456789", "123456789 and more", "GIF89a|123456789"},
      {"GIF89a123456789", "GI", "GI|"},
      {"tROM=9", "tROM=2147483647", "GIF89a|123456789"},
      {"iROM=7", "iROM=2147483647", "GIF89a|"},
  };
  for (const auto& [de, para, blocos] : casos) {
    EXPECT_EQ(Pecas(ExemploCom(de, para)), std::string("Super Jogo|SUPERJOG|-873187034|") + blocos) << para;
  }
  // A key is searched in the whole header: a name that holds one answers for the line that the key belongs to.
  EXPECT_EQ(Pecas(Montar("Jogo Nomedos=OUTRO", "JOGO", "")), "Jogo Nomedos=OUTRO|OUTRO||I|R");
  EXPECT_EQ(Pecas(Montar("", "TROM=2", "7", "I", "ROM")), "|TROM=2|7|I|RO");
}

TEST(Pacote, WhatIsRefused) {
  const std::pair<const char*, const char*> casos[] = {
      {"TOLVARIS", "TOLVARIZ"},      {"TOLVARIS", " TOLVARIS"},     {"|IMGROMDAT|", "|IMGROMDAT"},
      {"NOME=", "NOMEx="},           {"NOMEDOS=", "NOMEDOSx="},     {"CRC=", "CRCx="},
      {"iIMG=", "iIMGx="},           {"tIMG=", "tIMGx="},           {"iROM=", "iROMx="},
      {"tROM=", "tROMx="},           {"tROM=9\r\n", "tROM=9\n"},    {"iIMG=1", "iIMG=0"},
      {"iROM=7", "iROM=0"},          {"tROM=9", "tROM=0"},          {"tIMG=6", "tIMG=0"},
      {"tIMG=6", "tIMG=  "},         {"tIMG=6", "tIMG=+6"},         {"tIMG=6", "tIMG=-6"},
      {"tIMG=6", "tIMG=2147483648"}, {"tIMG=6", "tIMG=4294967297"}, {"tIMG=6", "tIMG=18446744073709551617"},
      {"=SUPERJOG", "=..\\JOGO"},    {"=Super Jogo", "=../JOGO"},   {"=Super", "=nomedos=C:"},
  };
  for (const auto& [de, para] : casos) EXPECT_EQ(Pecas(ExemploCom(de, para)), "refused") << de << " -> " << para;
  for (std::size_t tamanho = 0; tamanho < Exemplo.size(); ++tamanho) {
    EXPECT_EQ(Pecas(Exemplo.substr(0, tamanho)) != "refused", tamanho >= Exemplo.find("GIF89a")) << tamanho;
  }
  const std::size_t sobra = 10'240 - Montar("", "", "1", "", "").size();  // the marker has to end within 10,240 bytes
  EXPECT_NE(Pecas(Montar(std::string(sobra, 'x'), "")), "refused");
  EXPECT_EQ(Pecas(Montar(std::string(sobra + 1, 'x'), "")), "refused");
}

// An extension always follows, so ".." leads nowhere; and what the platform refuses by itself is left to it.
TEST(NomeDeArquivo, IsNoneThatWouldLeaveItsDirectory) {
  const std::string levamFora[] = {"..\\JOGO", "../JOGO", "\\JOGO",  "C:JOGO", "JO:oculto",    "JO\tGO",
                                   "JO\nGO",   "\x1F",    "CON",     "nul",    "Aux.txt",      "PRN  .x",
                                   "com1",     "LPT9",    "COM\xB2", "CONIN$", {"JO.exe\0", 7}};
  const std::string ficam[] = {
      "CONTRA", "COM10", "COMX", "LPT", "Super CON", " CON", "..", "Jogo Bros. ", "Quem? *<>\"", "Ação|Pão=1"_ansi,
  };
  for (const auto& fora : levamFora) EXPECT_FALSE(NomeDeArquivo(fora)) << fora;
  for (const auto& fica : ficam) EXPECT_TRUE(NomeDeArquivo(fica)) << fica;
}

TEST(Pacote, WhatIsWrittenIsReadBack) {
  std::mt19937 acaso(3);
  const auto sorteado = [&](const std::string& alfabeto, std::size_t maior) {
    std::string texto(1 + acaso() % maior, ' ');
    std::ranges::generate(texto, [&] { return alfabeto[acaso() % alfabeto.size()]; });
    return texto;
  };
  // Every key needs one of E, S, C, G and M before its "=", so these letters never make one.
  const std::string letras = "abdfhijklnopqrtuvwxyzABDFHIJKLNOPQRTUVWXYZ 0123456789|=.,-'()[]!&~áÉçÃôÜñÿ"_ansi;
  const std::string bytes("\0\r\n\t\x1A\xFF|IMGROMDAT|=", 18);
  for (int vez = 0; vez < 500; ++vez) {
    const std::string nome = sorteado(letras, 300), dosName = sorteado(letras, 40), crc = sorteado(letras, 12);
    const std::string imagem = "|IMGROMDAT|" + sorteado(bytes, 5'000), rom = sorteado(bytes, 5'000);
    const std::string pecas = nome + "|" + dosName + "|" + crc + "|" + imagem + "|" + rom;
    EXPECT_TRUE(Pecas(Montar(nome, dosName, crc, imagem, rom)) == pecas) << nome << " / " << dosName;
  }
}

// Beside pacote.py, which was written from the format alone.
TEST(Pacote, IsReadAndWrittenAlikeInPython) {
  const auto pasta = std::filesystem::temp_directory_path() / ("tolvaris-pacote-" + std::to_string(getpid()));
  std::filesystem::create_directories(pasta);
  std::filesystem::current_path(pasta);
  const auto ler = [](const char* arquivo) {
    std::ifstream entrada(arquivo, std::ios::binary);
    return std::string(std::istreambuf_iterator<char>(entrada), {});
  };
  const auto rodar = [](const std::string& argumentos) {
    const std::string comando = "LC_ALL=C.UTF-8 python3 '" TOLVARIS_PACOTE_PY "' " + argumentos;
    EXPECT_EQ(std::system((comando + " >saida").c_str()), 0) << argumentos;
  };
  const std::string nome = " Ação & Emoção (B) [!] - não|é=isso " + std::string(300, 'x') + " ", dosName = "AÇÃO~1";
  const std::string imagem("|IMGROMDAT|\0\r\n|IMGROMDAT|\0\r\nCRC=1\r\n", 35);
  std::string rom(2'500'000, '\0');
  std::ranges::generate(rom, [acaso = std::mt19937(7)]() mutable { return static_cast<char>(acaso()); });
  const std::string crc = TextoCRC(cls_CRC().CRC(rom).value_or(0)), textos = nome + "\n" + dosName + "\n" + crc + "\n";
  const std::string nosso = Montar(platform::FromUtf8(nome), platform::FromUtf8(dosName), crc, imagem, rom);
  EXPECT_TRUE(Pecas(nosso) == platform::FromUtf8(nome + "|" + dosName + "|") + crc + "|" + imagem + "|" + rom);
  std::ofstream("nosso", std::ios::binary) << nosso;
  rodar("ler nosso imagem rom");
  EXPECT_EQ(ler("saida"), textos + crc + "\n");
  rodar("montar deles '" + nome + "' '" + dosName + "' imagem rom");
  EXPECT_TRUE(ler("deles") == nosso);
  std::filesystem::remove_all(pasta);
}

}  // namespace
