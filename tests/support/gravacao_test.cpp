// Writing and copying files when something goes wrong.
#include <gtest/gtest.h>

#include "platform/files.h"
#include "support/mod_Arquivos.h"
#include "tests/falhas.h"

namespace {

using namespace platform::simulated;

const std::string Alvo = "C:\\Jogos\\alvo.smc";
const std::string AoLado = Alvo + ".novo~";

struct Caso {
  const char* Nome;
  std::optional<std::string> Antes;
  std::string Texto;
  std::int32_t Posicao;
  bool Apagar;
  std::string Depois;
  bool SemTemporario = false;  // a directory has the name that the temporary file would get
};

const Caso Casos[] = {
    {"new", {}, "novo", 1, true, "novo"},
    {"shorter", "conteudo velho", "novo", 1, true, "novo"},
    {"longer", "velho", "conteudo novo", 1, true, "conteudo novo"},
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
};

void Preparar(const Caso& caso) {
  PutDirectory("C:\\Jogos");
  if (caso.Antes) PutFile(Alvo, *caso.Antes);
  if (caso.SemTemporario) PutDirectory(AoLado);
}

// Success is said of the new contents only, failure of the old ones only, and nothing else lies there.
void Conferir(const std::optional<std::string>& antes, const std::string& depois, bool gravado) {
  EXPECT_EQ(Content(Alvo), gravado ? std::optional(depois) : antes);
  for (const std::string& arquivo : AllFiles()) EXPECT_EQ(arquivo.find(".novo~"), std::string::npos) << arquivo;
}

TEST(Gravacao, AFileIsOldOrNewWhicheverCallFailsAndWhenThePowerIsCutAfterwards) {
  for (const bool corte : {false, true}) {
    for (const Caso& caso : Casos) {
      SCOPED_TRACE(testing::Message() << caso.Nome << (corte ? ", power cut" : ""));
      int resultado = 0;
      const int falhas = ComCadaFalha([&] { Preparar(caso); },
                                      [&] { resultado = GravarArquivo(Alvo, caso.Texto, caso.Posicao, caso.Apagar); },
                                      [&] {
                                        if (corte) CutPower();
                                        Conferir(caso.Antes, caso.Depois, resultado == 1);
                                      });
      EXPECT_GE(falhas, 3);
      EXPECT_EQ(resultado, 1);  // of the last run, in which nothing failed
    }
  }
}

TEST(Gravacao, WhatCannotBeWrittenStaysAndWhatDeletingAndWritingCouldDoIsDone) {
  const std::string velho(40960, 'v'), novo(81920, 'n');
  const struct {
    const char* Nome;
    std::function<void()> Preparar;
    bool Gravado;
  } casos[] = {
      {"nothing in the way", [] {}, true},
      {"left over from a power cut", [] { PutFile(AoLado, "meio"); }, true},
      {"temporary name taken", [] { PutDirectory(AoLado); }, true},
      {"room for the new one only where the old one is", [] { SetFreeSpace('C', 45000); }, true},
      {"no room", [] { SetFreeSpace('C', 30000); }, false},
      {"no room at all", [] { SetFreeSpace('C', 0); }, false},
      {"no room in place", [] { PutDirectory(AoLado), SetFreeSpace('C', 30000); }, false},
      {"locked", [] { LockFile(Alvo); }, false},
      {"read-only", [] { SetAttributes(Alvo, platform::AttributeReadOnly); }, false},
  };
  for (const auto& caso : casos) {
    for (const bool copiar : {false, true}) {
      SCOPED_TRACE(testing::Message() << caso.Nome << (copiar ? ", copied" : ", written"));
      Reset();
      AddDisk('D', 1 << 20);
      PutFile("D:\\novo", novo);
      PutFile(Alvo, velho);
      caso.Preparar();
      const auto escritas = WriteCount(Alvo);
      const bool gravado = copiar ? CopiarArquivo("D:\\novo", Alvo) : GravarArquivo(Alvo, novo, 1, true) == 1;
      EXPECT_EQ(gravado, caso.Gravado);
      EXPECT_EQ(Content(Alvo) == (gravado ? novo : velho), true);
      EXPECT_EQ(WriteCount(Alvo) != escritas, gravado);  // not even for a moment, when it cannot be
      EXPECT_EQ(Content(AoLado), std::nullopt);
      EXPECT_EQ(Content("D:\\novo") == novo, true);
    }
  }
}

TEST(Gravacao, WhereNoFileCanBeNothingIsMade) {
  Reset();
  for (const char* caminho : {"C:\\nada\\alvo", "D:\\alvo", "C:\\Tolvaris", ""}) {
    for (const bool apagar : {false, true}) EXPECT_EQ(GravarArquivo(caminho, "novo", 1, apagar), -1) << caminho;
  }
  EXPECT_EQ(GravarArquivo("C:\\alvo", "novo", -2, false), -1);
  EXPECT_EQ(AllFiles(), std::vector<std::string>{});
}

TEST(Copia, ADestinationIsOldOrNewWhicheverCallFailsAndWhenThePowerIsCutAfterwards) {
  const struct {
    const char* Nome;
    std::optional<std::string> Antes;
    std::uint32_t Atributos;
    bool SemTemporario;
  } casos[] = {{"new", {}, 0x20, false},
               {"over another", "velho", 0x20, false},
               {"of a read-only file", "velho", 0x21, false},
               {"in place", "um conteudo velho", 0x20, true}};
  for (const bool corte : {false, true}) {
    for (const auto& caso : casos) {
      SCOPED_TRACE(testing::Message() << caso.Nome << (corte ? ", power cut" : ""));
      bool copiado = false;
      ComCadaFalha(
          [&] {
            AddDisk('A', 1 << 20);
            PutFile("A:\\origem", "novo", caso.Atributos);
            Preparar({"", caso.Antes, "", 1, true, "", caso.SemTemporario});
          },
          [&] { copiado = CopiarArquivo("A:\\origem", Alvo); },
          [&] {
            if (corte) CutPower();
            Conferir(caso.Antes, "novo", copiado);
            EXPECT_EQ(Content("A:\\origem"), "novo");
          });
      EXPECT_TRUE(copiado);
    }
  }
}

TEST(Copia, AMissingOrAbsentFileIsNotCopied) {
  Reset();
  PutFile(Alvo, "velho");
  EXPECT_FALSE(CopiarArquivo("A:\\origem", Alvo));
  EXPECT_FALSE(CopiarArquivo("C:\\nada", Alvo));
  EXPECT_FALSE(CopiarArquivo("C:\\Jogos", Alvo));
  EXPECT_FALSE(CopiarArquivo(Alvo, "A:\\destino"));
  EXPECT_EQ(Content(Alvo), "velho");
  EXPECT_EQ(AllFiles(), std::vector<std::string>{Alvo});
}

}  // namespace
