// Reading, writing and copying files, also when something goes wrong.
#include "platform/files.h"
#include "support/mod_Arquivos.h"
#include "tests/falhas.h"

namespace {

using namespace platform::simulated;

const std::string Alvo = "C:\\Jogos\\alvo.smc", AoLado = Alvo + ".novo~";

struct Arquivos : testing::Test {
  void SetUp() override { Reset(); }
};

TEST_F(Arquivos, LerArquivoGivesTheWantedBytesAndBlanksForWhatIsMissing) {
  const std::string dez = "0123456789", bytes("\0\r\n\x1A\xFF", 5);
  PutFile("C:\\d", dez);
  PutFile("C:\\v", "");
  PutFile("C:\\b", bytes);
  PutFile("C:\\preso", dez);
  LockFile("C:\\preso");
  const std::tuple<const char*, std::int32_t, std::int32_t, std::string> casos[] = {
      {"C:\\d", 1, -1, dez},    {"C:\\d", 4, 3, "345"},    {"C:\\d", 0, 3, "012"},        {"C:\\d", -7, 0, dez},
      {"C:\\d", 10, -1, "9"},   {"C:\\d", 11, -1, ""},     {"C:\\d", 2147483647, -1, ""}, {"C:\\d", 9, 4, "89  "},
      {"C:\\d", 12, 2, "  "},   {"C:\\v", 1, -1, ""},      {"C:\\n", 1, -1, ""},          {"C:\\n", 1, 5, "     "},
      {"C:\\preso", 1, -1, ""}, {"C:\\preso", 1, 2, "  "}, {"C:\\Tolvaris", 1, -1, ""},   {"", 1, -1, ""},
      {"C:\\b", 1, -1, bytes},
  };
  for (const auto& [caminho, inicio, tamanho, lido] : casos) {
    EXPECT_EQ(LerArquivo(caminho, inicio, tamanho), lido) << caminho << " " << inicio << " " << tamanho;
  }
  for (int n = 1; n <= 3; ++n) {  // opening, length, reading: never taken for blanks
    FailCall(n);
    EXPECT_EQ(LerArquivo("C:\\d"), "") << n;
    ASSERT_TRUE(CallFailed()) << n;
  }
}

TEST_F(Arquivos, WhatExistsAndWhatCriarCaminhoMakes) {
  PutDirectory("C:\\so leitura", 0x11);
  PutFile("C:\\oculto", "abc", 0x22);
  PutFile("C:\\vazio", "");
  for (const char* caminho : {"C:\\a\\b\\c\\d", "C:\\oculto\\d\\", "D:\\d\\", "barra", ""}) CriarCaminho(caminho);
  const std::tuple<const char*, std::int32_t, bool> casos[] = {
      {"C:\\a", 0, true},       {"C:\\a\\", 0, true},    {"C:\\a\\b\\c", 0, true}, {"C:\\a\\b\\c\\d", 0, false},
      {"C:\\oculto", 3, false}, {"C:\\vazio", 0, false}, {"C:\\nada", 0, false},   {"C:\\so leitura", 0, false},
      {"D:\\d", 0, false},      {"", 0, false},          {"C:\\barra", 0, false},
  };
  for (const auto& [caminho, tamanho, diretorio] : casos) {
    EXPECT_EQ(TamanhoArquivo(caminho), tamanho) << caminho;
    EXPECT_EQ(ArquivoExiste(caminho), tamanho > 0) << caminho;
    EXPECT_EQ(DiretorioExiste(caminho), diretorio) << caminho;
  }
}

// Success is said of the new contents only, failure of the old ones only, and nothing else lies there.
TEST_F(Arquivos, AreOldOrNewWhicheverCallFailsAndWhenThePowerIsCutAfterwards) {
  const struct {
    const char* Nome;
    std::optional<std::string> Antes;
    std::string Texto;
    std::int32_t Posicao;
    bool Apagar;
    std::string Depois;
    bool SemTemporario = false;   // a directory has the name that the temporary file would get
    std::uint32_t Atributos = 0;  // of the file that is copied; 0: the text is written
  } casos[] = {
      {"new", {}, "novo", 1, true, "novo"},
      {"shorter", "conteudo velho", "novo", 1, true, "novo"},
      {"emptied", "velho", "", 1, true, ""},
      {"at the end of what was deleted", "velho", "novo", -1, true, "novo"},
      {"position 0", "velho", "novo", 0, true, "novo"},
      {"later position", "velho", "novo", 3, true, {"\0\0novo", 6}},
      {"new in place", {}, "novo", 1, true, "novo", true},
      {"shorter in place", "conteudo velho", "novo", 1, true, "novo", true},
      {"longer in place", "velho", "conteudo novo", 1, true, "conteudo novo", true},
      {"appended", "velho", " e novo", -1, false, "velho e novo"},
      {"appended to nothing", {}, "novo", -1, false, "novo"},
      {"over the beginning", "conteudo velho", "NOVO", 1, false, "NOVOeudo velho"},
      {"over the end", "velho", "novo", 4, false, "velnovo"},
      {"new copy", {}, "novo", 1, true, "novo", false, 0x20},
      {"copied over", "velho", "novo", 1, true, "novo", false, 0x20},
      {"copy of a read-only file", "velho", "novo", 1, true, "novo", false, 0x21},
      {"copied in place", "um conteudo velho", "novo", 1, true, "novo", true, 0x20},
  };
  for (const auto& caso : casos) {
    SCOPED_TRACE(caso.Nome);
    const bool copiar = caso.Atributos != 0;
    bool gravado = false;
    const auto preparar = [&] {
      AddDisk('A', 1 << 20);
      PutDirectory("C:\\Jogos");
      if (caso.Antes) PutFile(Alvo, *caso.Antes);
      if (caso.SemTemporario) PutDirectory(AoLado);
      if (copiar) PutFile("A:\\origem", caso.Texto, caso.Atributos);
    };
    const auto operar = [&] {
      gravado =
          copiar ? CopiarArquivo("A:\\origem", Alvo) : GravarArquivo(Alvo, caso.Texto, caso.Posicao, caso.Apagar) == 1;
    };
    const auto conferir = [&] {
      for (const bool corte : {false, true}) {
        if (corte) CutPower();
        EXPECT_EQ(Content(Alvo), gravado ? std::optional(caso.Depois) : caso.Antes) << (corte ? "power cut" : "");
        EXPECT_EQ(Content(AoLado), std::nullopt);
        EXPECT_TRUE(!copiar || Content("A:\\origem") == caso.Texto);
      }
    };
    EXPECT_GE(ComCadaFalha(preparar, operar, conferir), 3);
    EXPECT_TRUE(gravado);  // by the last run, in which nothing failed
  }
}

TEST_F(Arquivos, ThatCannotBeWrittenStayAndWhatDeletingAndWritingCouldDoIsDone) {
  const std::string velho(40960, 'v'), novo(81920, 'n');
  const std::tuple<const char*, std::function<void()>, bool> casos[] = {
      {"left over from a power cut", [] { PutFile(AoLado, "meio"); }, true},
      {"temporary name taken", [] { PutDirectory(AoLado); }, true},
      {"room for the new one only where the old one is", [] { SetFreeSpace('C', 45000); }, true},
      {"no room at all", [] { SetFreeSpace('C', 0); }, false},
      {"no room in place", [] { PutDirectory(AoLado), SetFreeSpace('C', 30000); }, false},
      {"locked", [] { LockFile(Alvo); }, false},
      {"read-only", [] { SetAttributes(Alvo, platform::AttributeReadOnly); }, false},
  };
  for (const auto& [nome, preparar, gravavel] : casos) {
    for (const bool copiar : {false, true}) {
      SCOPED_TRACE(testing::Message() << nome << (copiar ? ", copied" : ", written"));
      Reset();
      AddDisk('D', 1 << 20);
      PutFile("D:\\novo", novo);
      PutFile(Alvo, velho);
      preparar();
      const auto escritas = WriteCount(Alvo);
      const bool gravado = copiar ? CopiarArquivo("D:\\novo", Alvo) : GravarArquivo(Alvo, novo, 1, true) == 1;
      EXPECT_EQ(gravado, gravavel);
      EXPECT_TRUE(Content(Alvo) == (gravado ? novo : velho) && Content("D:\\novo") == novo);
      EXPECT_EQ(WriteCount(Alvo) != escritas, gravado);  // not even for a moment, when it cannot be
      EXPECT_EQ(Content(AoLado), std::nullopt);
    }
  }
}

TEST_F(Arquivos, AreNeitherReadNorMadeWhereNoneCanBe) {
  PutFile(Alvo, "velho");
  for (const char* caminho : {"C:\\nada\\alvo", "D:\\alvo", "C:\\Tolvaris", ""}) {
    for (const bool apagar : {false, true}) EXPECT_EQ(GravarArquivo(caminho, "novo", 1, apagar), -1) << caminho;
    EXPECT_FALSE(CopiarArquivo(Alvo, caminho)) << caminho;
    EXPECT_FALSE(CopiarArquivo(caminho, Alvo)) << caminho;
    ApagarArquivo(caminho);
  }
  EXPECT_EQ(GravarArquivo(Alvo, "novo", -2, false), -1);
  EXPECT_EQ(Content(Alvo), "velho");
  EXPECT_EQ(AllFiles(), std::vector<std::string>{Alvo});
}

}  // namespace
