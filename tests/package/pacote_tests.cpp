#include <gtest/gtest.h>

#include <algorithm>
#include <numeric>
#include <random>
#include <string>

#include "package/pacote.h"
#include "platform/text.h"

namespace {

const std::string Exemplo =
    "TOLVARIS\r\nNOME=Super Jogo\r\nNOMEDOS=SUPERJOG\r\nCRC=-873187034\r\n"
    "iIMG=1\r\ntIMG=6\r\niROM=7\r\ntROM=9\r\n|IMGROMDAT|GIF89a123456789";

// The example with one piece of it replaced by another.
std::string ExemploCom(const std::string& de, const std::string& para) {
  const std::size_t lugar = Exemplo.find(de);
  EXPECT_NE(lugar, std::string::npos) << de;
  return std::string(Exemplo).replace(lugar, de.size(), para);
}

std::string Montar(const std::string& nome, const std::string& dosName, const std::string& crc = "1",
                   const std::string& imagem = "I", const std::string& rom = "R") {
  return MontarPacote(nome, dosName, crc, std::ssize(imagem), std::ssize(rom), imagem, rom);
}

bool Lido(const std::string& conteudo) { return LerPacote(conteudo).has_value(); }

// The five pieces between bars.
std::string Pecas(const std::string& conteudo) {
  const auto lido = LerPacote(conteudo);
  if (!lido) return "refused";
  return (lido->Nome + "|" + lido->DOSName + "|" + lido->CRC + "|").append(lido->Imagem).append("|").append(lido->Rom);
}

TEST(Pacote, TheExampleIsWrittenAndReadByteForByte) {
  EXPECT_EQ(MontarPacote("Super Jogo", "SUPERJOG", "-873187034", 6, 9, "GIF89a", "123456789"), Exemplo);
  EXPECT_EQ(Pecas(Exemplo), "Super Jogo|SUPERJOG|-873187034|GIF89a|123456789");
  EXPECT_EQ(LerPacote(Exemplo)->Rom.data(), Exemplo.data() + 110) << "a block is a part of the content, not a copy";
  EXPECT_EQ(MontarPacote("", "", "", 0, 5'000'000'000, "", "R"),
            "TOLVARIS\r\nNOME=\r\nNOMEDOS=\r\nCRC=\r\niIMG=1\r\ntIMG=0\r\niROM=1\r\ntROM=5000000000\r\n|IMGROMDAT|R");
}

// The reader's whole judgement: the same package with one piece replaced.
TEST(Pacote, WhatIsReadAndWhatIsRefused) {
  const std::pair<const char*, const char*> lidos[] = {
      {"TOLVARIS", "tolvaris"},
      {"TOLVARIS\r\n", "Tolvaris"},  // no line end is asked for there
      {"|IMGROMDAT|", "|imgRomDat|"},
      {"NOME=", "nOmE="},
      {"iIMG=1\r\ntIMG=6\r\n", "TIMG=6\r\n\r\nlixo\r\nIimg=1\r\n"},  // any order, other lines between
      {"Super Jogo", ""},
      {"SUPERJOG", ""},
      {"-873187034", ""},
      {"tROM=9", "tROM=2147483647"},
      {"iROM=7", "iROM=2147483647"},
      {"tIMG=6", "tIMG= \t0006 "},
  };
  for (const auto& [de, para] : lidos) EXPECT_TRUE(Lido(ExemploCom(de, para))) << de << " -> " << para;
  const std::pair<const char*, const char*> recusados[] = {
      {"TOLVARIS", "TOLVARIZ"},   {"TOLVARIS", " TOLVARIS"}, {"|IMGROMDAT|", "|IMGROMDAT"}, {"iIMG=1", "iIMG=0"},
      {"tROM=9\r\n", "tROM=9\n"}, {"tROM=9\r\n", "tROM=9"},  {"iROM=7", "iROM=0"},          {"tROM=9", "tROM=0"},
  };
  for (const auto& [de, para] : recusados) EXPECT_FALSE(Lido(ExemploCom(de, para))) << de << " -> " << para;
  for (const std::string chave : {"NOME", "NOMEDOS", "CRC", "iIMG", "tIMG", "iROM", "tROM"}) {
    EXPECT_FALSE(Lido(ExemploCom(chave + "=", chave + "x="))) << chave;
  }
  for (const std::string numero :
       {"", "  ", "+6", "-6", "6.0", "0x6", "6 6", "0", "2147483648", "4294967297", "18446744073709551617"}) {
    EXPECT_FALSE(Lido(ExemploCom("tIMG=6", "tIMG=" + numero))) << numero;
  }
  EXPECT_FALSE(LerPacote(std::string_view()));
  for (std::size_t tamanho = 0; tamanho < Exemplo.size(); ++tamanho) {
    EXPECT_EQ(Lido(Exemplo.substr(0, tamanho)), tamanho >= Exemplo.find("GIF89a")) << tamanho;
  }
  const std::size_t sobra = 10'240 - Montar("", "", "1", "", "").size();  // the marker has to end within 10,240 bytes
  EXPECT_TRUE(Lido(Montar(std::string(sobra, 'x'), "")));
  EXPECT_FALSE(Lido(Montar(std::string(sobra + 1, 'x'), "")));
}

TEST(Pacote, BlocksAreCutShortWhereTheContentEnds) {
  const char* const casos[][3] = {
      {"123456789", "1234", "GIF89a|1234"},
      {"123456789", "", "GIF89a|"},
      {"GIF89a123456789", "GI", "GI|"},
      {"123456789", "123456789 and more", "GIF89a|123456789"},
      {"tROM=9", "tROM=2147483647", "GIF89a|123456789"},
      {"iROM=7", "iROM=2147483647", "GIF89a|"},
      {"iROM=7", "iROM=15", "GIF89a|9"},
      {"iROM=7", "iROM=16", "GIF89a|"},
      {"iIMG=1", "iIMG=4", "89a123|123456789"},  // blocks may overlap
  };
  for (const auto& [de, para, blocos] : casos) {
    EXPECT_EQ(Pecas(ExemploCom(de, para)), std::string("Super Jogo|SUPERJOG|-873187034|") + blocos) << para;
  }
}

// A key is searched in the whole header, so a name that holds one answers for the line that the key belongs to.
TEST(Pacote, AKeyInsideANameCapturesTheSearch) {
  EXPECT_EQ(Pecas(Montar("Jogo Crc=5", "JOGO", "7")), "Jogo Crc=5|JOGO|5|I|R");
  EXPECT_EQ(Pecas(Montar("Jogo nomedos=OUTRO", "JOGO")), "Jogo nomedos=OUTRO|OUTRO|1|I|R");
  EXPECT_EQ(Pecas(Montar("Jogo", "TROM=2", "7", "I", "ROM")), "Jogo|TROM=2|7|I|RO");
  EXPECT_FALSE(Lido(Montar("Jogo nomedos=..\\OUTRO", "JOGO"))) << "what was captured is checked like the line itself";
  EXPECT_FALSE(Lido(Montar("Jogo |ImgRomDat|", "JOGO"))) << "the header ends inside the name";
}

// An extension always follows, so ".." leads nowhere; and what the platform refuses by itself is left to it.
TEST(Pacote, ANameThatWouldLeaveItsDirectoryIsRefused) {
  const std::string levamFora[] = {"..\\JOGO", "../JOGO", "\\JOGO",  "C:JOGO", "JO:oculto",    "JO\tGO",
                                   "JO\nGO",   "\x1F",    "CON",     "nul",    "Aux.txt",      "PRN  .x",
                                   "com1",     "LPT9",    "COM\xB2", "CONIN$", {"JO.exe\0", 7}};
  const std::string ficam[] = {"CONTRA",       "COM10", "COMX",        "LPT",         "Super CON",
                               " CON",         "..",    "Jogo Bros. ", "Quem? *<>\"", "Ação|Pão=1"_ansi,
                               "& 2 [!] (BR)", "'x' ~1"};
  for (const auto& fora : levamFora) EXPECT_FALSE(Lido(Montar(fora, "JOGO")) || Lido(Montar("Jogo", fora))) << fora;
  for (const auto& fica : ficam) EXPECT_TRUE(Lido(Montar(fica, "JOGO")) && Lido(Montar("Jogo", fica))) << fica;
}

TEST(Pacote, WhatIsWrittenIsReadBack) {
  // Every key needs one of E, S, C, G and M before its "=", so these letters never make one.
  const std::string letras = "abdfhijklnopqrtuvwxyzABDFHIJKLNOPQRTUVWXYZ 0123456789|=.,-'()[]!&~áÉçÃôÜñÿ"_ansi;
  std::string bytes(256, '\0');
  std::iota(bytes.begin(), bytes.end(), '\0');
  std::mt19937 acaso(3);
  const auto texto = [&](const std::string& alfabeto, std::size_t menor, std::size_t maior) {
    std::string resultado(menor + acaso() % maior, ' ');
    std::ranges::generate(resultado, [&] { return alfabeto[acaso() % alfabeto.size()]; });
    return resultado;
  };
  for (int vez = 0; vez < 500; ++vez) {
    const std::string nome = texto(letras, 0, 300), dosName = texto(letras, 0, 40), crc = texto(letras, 0, 12);
    const std::string imagem = texto(bytes, 1, 5'000), rom = texto(bytes, 1, 5'000);
    EXPECT_TRUE(Pecas(Montar(nome, dosName, crc, imagem, rom)) ==
                nome + "|" + dosName + "|" + crc + "|" + imagem + "|" + rom)
        << nome << " / " << dosName;
  }
}

}  // namespace
