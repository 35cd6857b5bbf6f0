// Reading, writing and copying files, also when something goes wrong.
#include "platform/files.h"
#include "support/mod_Arquivos.h"
#include "tests/maquina.h"

namespace {

const std::string Alvo = "C:\\Jogos\\alvo.smc", AoLado = Alvo + ".novo~";

struct Arquivos : Maquina {};

TEST_F(Arquivos, LerArquivoGivesTheWantedBytesAndBlanksForWhatIsMissing) {
  const std::string dez = "012345678\0"s;
  PutFile("C:\\d", dez);
  PutFile("C:\\v", "");
  PutFile("C:\\preso", dez);
  LockFile("C:\\preso");
  const std::tuple<const char*, std::int32_t, std::int32_t, std::string> casos[] = {
      {"C:\\d", 1, -1, dez},    {"C:\\d", 4, 3, "345"},    {"C:\\d", 0, 3, "012"},        {"C:\\d", -7, 0, dez},
      {"C:\\d", 10, -1, "\0"s}, {"C:\\d", 11, -1, ""},     {"C:\\d", 2147483647, -1, ""}, {"C:\\d", 9, 4, "8\0  "s},
      {"C:\\d", 12, 2, "  "},   {"C:\\v", 1, -1, ""},      {"C:\\n", 1, -1, ""},          {"C:\\n", 1, 5, "     "},
      {"C:\\preso", 1, -1, ""}, {"C:\\preso", 1, 2, "  "}, {"C:\\Tolvaris", 1, -1, ""},   {"", 1, -1, ""},
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
  for (const char* caminho : {"C:\\a\\b\\c", "C:\\oculto\\d\\", "D:\\d\\", "barra", ""}) CriarCaminho(caminho);
  EXPECT_TRUE(DiretorioExiste("C:\\a\\b") && DiretorioExiste("C:\\a\\b\\"));
  for (const char* nenhum : {"C:\\a\\b\\c", "C:\\oculto", "C:\\so leitura", "C:\\barra", "D:\\d", ""}) {
    EXPECT_FALSE(DiretorioExiste(nenhum)) << nenhum;
  }
  EXPECT_TRUE(TamanhoArquivo("C:\\oculto") == 3 && ArquivoExiste("C:\\oculto"));
  for (const char* nenhum : {"C:\\a", "C:\\vazio", "C:\\nada", ""}) {
    EXPECT_TRUE(TamanhoArquivo(nenhum) == 0 && !ArquivoExiste(nenhum)) << nenhum;
  }
}

// Success is said of the new contents only, failure of the old ones only, and nothing else lies there.
TEST_F(Arquivos, AreOldOrNewWhicheverCallFailsAndWhenThePowerIsCutAfterwards) {
  const auto gravar = [](const char* texto, std::int32_t posicao, bool apagar) {
    return [=] { return GravarArquivo(Alvo, texto, posicao, apagar) == 1; };
  };
  const auto copiar = [](const char* origem) { return [=] { return CopiarArquivo(origem, Alvo); }; };
  const std::tuple<std::optional<std::string>, std::function<bool()>, std::string> casos[] = {
      {std::nullopt, gravar("novo", 1, true), "novo"},
      {"velho", gravar("conteudo novo", 1, true), "conteudo novo"},
      {"conteudo velho", gravar("novo", 0, true), "novo"},
      {"velho", gravar("novo", -1, true), "novo"},
      {"velho", gravar("novo", 3, true), "\0\0novo"s},
      {std::nullopt, gravar("novo", 1, false), "novo"},
      {"velho", gravar(" e novo", -1, false), "velho e novo"},
      {"conteudo velho", gravar("NOVO", 0, false), "NOVOeudo velho"},
      {"velho", gravar("novo", 4, false), "velnovo"},
      {"conteudo velho", copiar("A:\\origem"), "copiado"},
      {"velho", copiar("A:\\leitura"), "copiado"},
  };
  for (const auto& [antes, operacao, depois] : casos) {
    for (const bool noLugar : {false, true}) {
      SCOPED_TRACE(depois + (noLugar ? ", in place" : ""));
      bool gravado = false;
      const auto operar = [&, &operacao = operacao] { gravado = operacao(); };
      const auto preparar = [&] {
        AddDisk('A', 1 << 20);
        PutFile("A:\\origem", "copiado");
        PutFile("A:\\leitura", "copiado", 0x21);
        PutDirectory(noLugar ? AoLado : "C:\\Jogos");  // the name of the temporary file is taken
        if (antes) PutFile(Alvo, *antes);
      };
      const auto conferir = [&] {
        for (const bool corte : {false, true}) {
          if (corte) CutPower();
          EXPECT_EQ(Content(Alvo), gravado ? std::optional(depois) : antes) << (corte ? "power cut" : "");
          EXPECT_EQ(AllFiles().size(), Content(Alvo) ? 3u : 2u);
        }
      };
      EXPECT_GE(ComCadaFalha(preparar, operar, conferir), 3);
      EXPECT_TRUE(gravado);  // by the last run, in which nothing failed
    }
  }
}

TEST_F(Arquivos, ThatCannotBeWrittenStayAndWhatDeletingAndWritingCouldDoIsDone) {
  const std::string velho(40960, 'v'), novo(81920, 'n');
  const std::tuple<const char*, std::function<void()>, bool> casos[] = {
      {"left over from a power cut", [] { PutFile(AoLado, "meio"); }, true},
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
      EXPECT_EQ(copiar ? CopiarArquivo("D:\\novo", Alvo) : GravarArquivo(Alvo, novo, 1, true) == 1, gravavel);
      EXPECT_TRUE(Content(Alvo) == (gravavel ? novo : velho) && Content("D:\\novo") == novo);
      EXPECT_EQ(WriteCount(Alvo) != escritas, gravavel);  // not even for a moment, when it cannot be
      EXPECT_EQ(Content(AoLado), std::nullopt);
    }
  }
}

TEST_F(Arquivos, AreNeitherReadNorMadeWhereNoneCanBe) {
  PutFile(Alvo, "velho");
  for (const char* caminho : {"C:\\nada\\alvo", "D:\\alvo", "C:\\Tolvaris", ""}) {
    for (const bool apagar : {false, true}) EXPECT_EQ(GravarArquivo(caminho, "novo", 1, apagar), -1) << caminho;
    EXPECT_FALSE(CopiarArquivo(Alvo, caminho) || CopiarArquivo(caminho, Alvo)) << caminho;
    ApagarArquivo(caminho);
  }
  EXPECT_EQ(GravarArquivo(Alvo, "novo", -2, false), -1);
  EXPECT_TRUE(Content(Alvo) == "velho" && AllFiles().size() == 1);
}

}  // namespace
