// The package format.
#include <gtest/gtest.h>
#include <sys/wait.h>
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
struct PacotePython : testing::Test {
  PacotePython() {
    std::filesystem::create_directories(Pasta);
    std::filesystem::current_path(Pasta);
  }
  ~PacotePython() override { std::filesystem::remove_all(Pasta); }

  static void Gravar(const char* nome, const std::string& bytes) { std::ofstream(nome, std::ios::binary) << bytes; }

  static std::string Ler(const char* nome) {
    std::ifstream arquivo(nome, std::ios::binary);
    return {std::istreambuf_iterator<char>(arquivo), {}};
  }

  // The exit code; what was printed is in the file "saida".
  static int Rodar(const std::string& argumentos) {
    const std::string comando = "LC_ALL=C.UTF-8 python3 '" TOLVARIS_PACOTE_PY "' " + argumentos;
    const int estado = std::system((comando + " >saida 2>/dev/null").c_str());
    return WIFEXITED(estado) ? WEXITSTATUS(estado) : -1;
  }

  const std::string Pasta = std::filesystem::temp_directory_path() / ("tolvaris-pacote-" + std::to_string(getpid()));
};

TEST_F(PacotePython, EachReadsWhatTheOtherWrites) {
  const std::string nome = "Ação & Emoção (B) [!] - não|é=isso", dosName = "AÇÃO~1";  // in UTF-8
  const std::string imagem("\0\r\n|IMGROMDAT|\0\r\nCRC=1\r\n", 24);
  std::string rom(2'500'000, '\0');
  std::ranges::generate(rom, [acaso = std::mt19937(7)]() mutable { return static_cast<char>(acaso()); });
  const std::string crc = TextoCRC(cls_CRC().CRC(rom).value_or(0));
  const std::string nosso = Montar(platform::FromUtf8(nome), platform::FromUtf8(dosName), crc, imagem, rom);
  Gravar("nosso", nosso);
  EXPECT_EQ(Rodar("ler nosso imagem rom"), 0);
  EXPECT_EQ(Ler("saida"), nome + "\n" + dosName + "\n" + crc + "\n" + crc + "\n");
  EXPECT_EQ(Rodar("montar deles '" + nome + "' '" + dosName + "' imagem rom"), 0);
  EXPECT_TRUE(Ler("deles") == nosso && LerPacote(nosso));
}

TEST_F(PacotePython, BothRefuseTheSamePackages) {
  const std::string inicio = "TOLVARISNOME=A\r\nNOMEDOS=",
                    fim = "\r\niIMG= 1\r\nTIMG=01\t\r\niROM=2\r\ntROM=99\r\n|imgromdat|IR";
  for (const std::string meio :
       {"B\r\ncrc=1", "B CRC=5", "B\r\nC=1", ".\\\r\nCRC=1", "Lpt1 .\r\nCRC=1", "\r\nCRC=\r\ntROM=2147483648"}) {
    const std::string pacote = inicio + meio + fim;
    Gravar("pacote", pacote);
    EXPECT_EQ(Rodar("ler pacote"), LerPacote(pacote) ? 0 : 3) << pacote;
  }
}

}  // namespace
