#include "support/mod_Arquivos.h"

#include <gtest/gtest.h>

#include "platform/files.h"
#include "platform/simulated/simulated.h"

namespace {

using namespace platform::simulated;

class Arquivos : public testing::Test {
 protected:
  void SetUp() override { Reset(); }
};

TEST_F(Arquivos, LerArquivoGivesTheWantedBytesAndBlanksForWhatIsMissing) {
  PutFile("C:\\dez", "0123456789");
  PutFile("C:\\vazio", "");
  PutFile("C:\\preso", "0123456789");
  LockFile("C:\\preso");
  const struct {
    const char* Caminho;
    std::int32_t Inicio, Tamanho;
    const char* Esperado;
  } casos[] = {
      {"C:\\dez", 1, -1, "0123456789"}, {"C:\\dez", 4, 3, "345"},
      {"C:\\dez", 0, 3, "012"},         {"C:\\dez", -7, 0, "0123456789"},
      {"C:\\dez", 10, -1, "9"},         {"C:\\dez", 11, -1, ""},
      {"C:\\dez", 2147483647, -1, ""},  {"C:\\dez", 9, 4, "89  "},
      {"C:\\dez", 12, 2, "  "},         {"C:\\vazio", 1, -1, ""},
      {"C:\\nada", 1, -1, ""},          {"C:\\nada", 1, 5, "     "},
      {"C:\\preso", 1, -1, ""},         {"C:\\preso", 1, 2, "  "},
      {"C:\\Tolvaris", 1, -1, ""},      {"", 1, -1, ""},
  };
  for (const auto& caso : casos) {
    EXPECT_EQ(LerArquivo(caso.Caminho, caso.Inicio, caso.Tamanho), caso.Esperado)
        << caso.Caminho << " " << caso.Inicio << " " << caso.Tamanho;
  }
}

TEST_F(Arquivos, AFileThatCannotBeReadToItsEndIsNeverTakenForBlanks) {
  for (int n = 1; n <= 3; ++n) {
    Reset();
    PutFile("C:\\dez", "0123456789");
    FailCall(n);
    EXPECT_EQ(LerArquivo("C:\\dez"), "") << n;
    ASSERT_TRUE(CallFailed()) << n;  // opening, length, reading
  }
}

TEST_F(Arquivos, BytesComeBackAsTheyWereWritten) {
  std::string bytes;
  for (int i = 0; i < 256; ++i) bytes += static_cast<char>(i);
  EXPECT_EQ(GravarArquivo("C:\\bytes", bytes, 1, true), 1);
  EXPECT_EQ(LerArquivo("C:\\bytes"), bytes);
}

TEST_F(Arquivos, WhatExists) {
  PutDirectory("C:\\so leitura", 0x11);
  PutDirectory("C:\\comum");
  PutFile("C:\\oculto", "abc", 0x22);
  PutFile("C:\\vazio", "");
  const struct {
    const char* Caminho;
    std::int32_t Tamanho;
    bool Arquivo, Diretorio;
  } casos[] = {
      {"C:\\comum", 0, false, true},  {"C:\\comum\\", 0, false, true}, {"C:\\so leitura", 0, false, false},
      {"C:\\oculto", 3, true, false}, {"C:\\vazio", 0, false, false},  {"C:\\nada", 0, false, false},
      {"D:\\nada", 0, false, false},  {"", 0, false, false},
  };
  for (const auto& caso : casos) {
    EXPECT_EQ(TamanhoArquivo(caso.Caminho), caso.Tamanho) << caso.Caminho;
    EXPECT_EQ(ArquivoExiste(caso.Caminho), caso.Arquivo) << caso.Caminho;
    EXPECT_EQ(DiretorioExiste(caso.Caminho), caso.Diretorio) << caso.Caminho;
  }
}

TEST_F(Arquivos, ApagarArquivoLeavesAloneWhatCannotBeDeleted) {
  PutFile("C:\\comum", "x");
  PutFile("C:\\so leitura", "x", 0x21);
  for (const char* caminho : {"C:\\comum", "C:\\so leitura", "C:\\nada", "C:\\Tolvaris", ""}) ApagarArquivo(caminho);
  EXPECT_EQ(AllFiles(), std::vector<std::string>{"C:\\so leitura"});
  EXPECT_TRUE(DirectoryStands("C:\\Tolvaris"));
}

TEST_F(Arquivos, CriarCaminhoMakesEachMissingDirectoryUpToTheLastBackslash) {
  PutDirectory("C:\\Jogos");
  CriarCaminho("C:\\Jogos\\a\\b\\c");
  EXPECT_TRUE(DirectoryStands("C:\\Jogos\\a\\b"));
  EXPECT_FALSE(DirectoryStands("C:\\Jogos\\a\\b\\c"));
  CriarCaminho("C:\\Jogos\\a\\b\\c\\");
  EXPECT_TRUE(DirectoryStands("C:\\Jogos\\a\\b\\c"));

  PutFile("C:\\arquivo", "x");
  CriarCaminho("C:\\arquivo\\d\\");
  CriarCaminho("D:\\d\\");
  CriarCaminho("sem barra");
  CriarCaminho("");
  EXPECT_EQ(Content("C:\\arquivo"), "x");
  EXPECT_FALSE(DirectoryStands("D:\\d"));
}

}  // namespace
