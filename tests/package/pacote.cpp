#include "package/pacote.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <random>
#include <string>

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
  return MontarPacote(nome, dosName, crc, static_cast<std::int64_t>(imagem.size()),
                      static_cast<std::int64_t>(rom.size()), imagem, rom);
}

bool Lido(const std::string& conteudo) { return LerPacote(conteudo).has_value(); }

TEST(Pacote, TheExampleIsWrittenAndReadByteForByte) {
  EXPECT_EQ(MontarPacote("Super Jogo", "SUPERJOG", "-873187034", 6, 9, "GIF89a", "123456789"), Exemplo);
  const auto pacote = LerPacote(Exemplo);
  ASSERT_TRUE(pacote);
  EXPECT_EQ(pacote->Nome, "Super Jogo");
  EXPECT_EQ(pacote->DOSName, "SUPERJOG");
  EXPECT_EQ(pacote->CRC, "-873187034");
  EXPECT_EQ(pacote->Imagem, "GIF89a");
  EXPECT_EQ(pacote->Rom, "123456789");
  EXPECT_EQ(pacote->Rom.data(), Exemplo.data() + 110) << "a block is a part of the content, not a copy";
}

TEST(Pacote, LengthsAreWrittenAsGiven) {
  EXPECT_EQ(MontarPacote("", "", "", 0, 5'000'000'000, "", "R"),
            "TOLVARIS\r\nNOME=\r\nNOMEDOS=\r\nCRC=\r\niIMG=1\r\ntIMG=0\r\niROM=1\r\ntROM=5000000000\r\n|IMGROMDAT|R");
}

// The reader's whole judgement: the same package with one piece replaced.
TEST(Pacote, WhatIsReadAndWhatIsRefused) {
  const struct {
    const char *De, *Para;
    bool Lido;
  } casos[] = {
      {"TOLVARIS", "tolvaris", true},
      {"TOLVARIS\r\n", "Tolvaris", true},  // no line end is asked for there
      {"TOLVARIS", "TOLVARIZ", false},
      {"TOLVARIS", " TOLVARIS", false},
      {"|IMGROMDAT|", "|imgRomDat|", true},
      {"|IMGROMDAT|", "|IMGROMDAT", false},
      {"NOME=", "nOmE=", true},
      {"iIMG=1\r\ntIMG=6\r\n", "TIMG=6\r\n\r\nlixo\r\nIimg=1\r\n", true},  // any order, other lines between
      {"NOME=", "NOME ", false},
      {"NOMEDOS=", "NOMEDOX=", false},
      {"CRC=", "CRK=", false},
      {"iIMG=", "iIMH=", false},
      {"tIMG=", "tIMH=", false},
      {"iROM=", "iRON=", false},
      {"tROM=", "tRON=", false},
      {"tROM=9\r\n", "tROM=9\n", false},  // no line end before the marker
      {"tROM=9\r\n", "tROM=9", false},
      {"NOME=Super Jogo", "NOME=", true},
      {"SUPERJOG", "", true},
      {"-873187034", "", true},
      {"tIMG=6", "tIMG= \t6 ", true},
      {"tIMG=6", "tIMG=0006", true},
      {"tIMG=6", "tIMG=", false},
      {"tIMG=6", "tIMG=  ", false},
      {"tIMG=6", "tIMG=+6", false},
      {"tIMG=6", "tIMG=-6", false},
      {"tIMG=6", "tIMG=6.0", false},
      {"tIMG=6", "tIMG=0x6", false},
      {"tIMG=6", "tIMG=6 6", false},
      {"iIMG=1", "iIMG=0", false},
      {"tIMG=6", "tIMG=0", false},
      {"iROM=7", "iROM=0", false},
      {"tROM=9", "tROM=0", false},
      {"tROM=9", "tROM=2147483647", true},
      {"tROM=9", "tROM=2147483648", false},
      {"tROM=9", "tROM=4294967297", false},
      {"tROM=9", "tROM=18446744073709551617", false},
      {"iROM=7", "iROM=2147483647", true},
  };
  for (const auto& caso : casos) {
    EXPECT_EQ(Lido(ExemploCom(caso.De, caso.Para)), caso.Lido) << caso.De << " -> " << caso.Para;
  }
  EXPECT_FALSE(LerPacote(std::string_view()));
  const std::size_t cabecalho = Exemplo.find("GIF89a");
  for (std::size_t tamanho = 0; tamanho < Exemplo.size(); ++tamanho) {
    EXPECT_EQ(Lido(Exemplo.substr(0, tamanho)), tamanho >= cabecalho) << tamanho;
  }
}

TEST(Pacote, TheMarkerEndsWithinTheFirst10240Bytes) {
  const std::size_t sobra = 10'240 - Montar("", "", "1", "", "").size();
  EXPECT_TRUE(Lido(Montar(std::string(sobra, 'x'), "")));
  EXPECT_FALSE(Lido(Montar(std::string(sobra + 1, 'x'), "")));
}

TEST(Pacote, BlocksAreCutShortWhereTheContentEnds) {
  const struct {
    const char *De, *Para, *Imagem, *Rom;
  } casos[] = {
      {"123456789", "1234", "GIF89a", "1234"},
      {"123456789", "", "GIF89a", ""},
      {"GIF89a123456789", "GI", "GI", ""},
      {"123456789", "123456789 and more", "GIF89a", "123456789"},
      {"tROM=9", "tROM=2147483647", "GIF89a", "123456789"},
      {"iROM=7", "iROM=2147483647", "GIF89a", ""},
      {"iROM=7", "iROM=15", "GIF89a", "9"},
      {"iROM=7", "iROM=16", "GIF89a", ""},
      {"iIMG=1", "iIMG=4", "89a123", "123456789"},  // blocks may overlap
  };
  for (const auto& caso : casos) {
    const std::string conteudo = ExemploCom(caso.De, caso.Para);
    const auto pacote = LerPacote(conteudo);
    ASSERT_TRUE(pacote) << caso.Para;
    EXPECT_EQ(pacote->Imagem, caso.Imagem) << caso.Para;
    EXPECT_EQ(pacote->Rom, caso.Rom) << caso.Para;
  }
}

// A key is searched in the whole header, so a name that holds one answers for the line that the key belongs to.
TEST(Pacote, AKeyInsideANameCapturesTheSearch) {
  const std::string crc = Montar("Jogo Crc=5", "JOGO", "7");
  ASSERT_TRUE(LerPacote(crc));
  EXPECT_EQ(LerPacote(crc)->Nome, "Jogo Crc=5");
  EXPECT_EQ(LerPacote(crc)->CRC, "5");
  const std::string dosName = Montar("Jogo nomedos=OUTRO", "JOGO");
  ASSERT_TRUE(LerPacote(dosName));
  EXPECT_EQ(LerPacote(dosName)->DOSName, "OUTRO");
  const std::string rom = Montar("Jogo", "TROM=2", "7", "I", "ROM");
  ASSERT_TRUE(LerPacote(rom));
  EXPECT_EQ(LerPacote(rom)->Rom, "RO");
  EXPECT_FALSE(Lido(Montar("Jogo nomedos=..\\OUTRO", "JOGO"))) << "what was captured is checked like the line itself";
  EXPECT_FALSE(Lido(Montar("Jogo |ImgRomDat|", "JOGO"))) << "the header ends inside the name";
}

TEST(Pacote, ANameThatWouldLeaveItsDirectoryIsRefused) {
  const struct {
    std::string Nome;
    bool Lido;
  } casos[] = {
      {"..\\JOGO", false},    {"../JOGO", false},
      {"\\JOGO", false},      {"C:JOGO", false},
      {"JOGO:oculto", false}, {std::string("JOGO.exe\0", 9), false},
      {"JO\tGO", false},      {"JO\nGO", false},
      {"\x1F", false},        {"CON", false},
      {"nul", false},         {"Aux.txt", false},
      {"PRN  .x", false},     {"com1", false},
      {"LPT9", false},        {"COM\xB2", false},
      {"CONIN$", false},      {"CONTRA", true},
      {"COM10", true},        {"COMX", true},
      {"LPT", true},          {"Super CON", true},
      {" CON", true},         {"..", true},  // an extension always follows
      {"Jogo Bros. ", true},  {"Ação|Pão=1 & 2 [!] (BR) 'x' ~1"_ansi, true},
      {"Quem? *<>\"", true},  // the platform refuses these by itself
  };
  for (const auto& caso : casos) {
    EXPECT_EQ(Lido(Montar(caso.Nome, "JOGO")), caso.Lido) << caso.Nome;
    EXPECT_EQ(Lido(Montar("Jogo", caso.Nome)), caso.Lido) << caso.Nome;
  }
}

TEST(Pacote, WhatIsWrittenIsReadBack) {
  // Every key needs one of E, S, C, G and M before its "=", so these letters never make one.
  const std::string letras = "abdfhijklnopqrtuvwxyzABDFHIJKLNOPQRTUVWXYZ 0123456789|=.,-'()[]!&~áÉçÃôÜñÿ"_ansi;
  std::mt19937 acaso(3);
  const auto texto = [&](std::size_t maior) {
    std::string resultado(acaso() % maior, ' ');
    std::ranges::generate(resultado, [&] { return letras[acaso() % letras.size()]; });
    return resultado;
  };
  const auto bloco = [&] {
    std::string bytes(1 + acaso() % 5'000, '\0');
    std::ranges::generate(bytes, [&] { return static_cast<char>(acaso()); });
    return bytes;
  };
  for (int vez = 0; vez < 500; ++vez) {
    const std::string nome = texto(300), dosName = texto(40), crc = texto(12), imagem = bloco(), rom = bloco();
    const std::string conteudo = Montar(nome, dosName, crc, imagem, rom);
    const auto pacote = LerPacote(conteudo);
    ASSERT_TRUE(pacote) << nome << " / " << dosName;
    EXPECT_EQ(pacote->Nome, nome);
    EXPECT_EQ(pacote->DOSName, dosName);
    EXPECT_EQ(pacote->CRC, crc);
    EXPECT_EQ(pacote->Imagem, imagem);
    EXPECT_EQ(pacote->Rom, rom);
  }
}

}  // namespace
