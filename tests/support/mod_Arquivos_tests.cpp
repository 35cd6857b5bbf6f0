// Reading, writing and copying files, also when something goes wrong.
#include "platform/files.h"
#include "support/mod_Arquivos.h"
#include "tests/fresh_machine.h"

namespace {

using platform::Existing;

const std::string Alvo = "C:\\Jogos\\alvo.smc";
const std::string Longo(200'000, 'l');  // more than three pieces of a copy

struct Arquivos : FreshMachine {};

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

// Success is said of the new contents only, failure of the old ones only, and nothing else lies there for long.
TEST_F(Arquivos, AreOldOrNewWhateverFailsAndWhenThePowerIsCut) {
  const auto gravar = [](const char* texto, std::int32_t posicao, bool apagar) {
    return [=] { return GravarArquivo(Alvo, texto, posicao, apagar) == 1; };
  };
  const auto copiar = [](const char* origem) { return [=] { return CopiarArquivo(origem, Alvo) == Copia::Feita; }; };
  const auto novo = [](Existing existente) { return [=] { return Substituicao(Alvo, "novo", existente).Concluir(); }; };
  const struct {
    const char* Nome;
    std::optional<std::string> Antes;
    std::function<bool()> Operacao;
    std::string Depois;
    bool NoLugar = false;  // into the file itself: what fails for good, or without power, leaves a mixture
  } casos[] = {
      {"a new file", std::nullopt, gravar("novo", 1, true), "novo"},
      {"a longer one", "velho", gravar("conteudo novo", 1, true), "conteudo novo"},
      {"a shorter one", "conteudo velho", gravar("novo", 0, true), "novo"},
      {"all of it, at the end", "velho", gravar("novo", -1, true), "novo"},
      {"all of it, later", "velho", gravar("novo", 3, true), "\0\0novo"s},
      {"one that must not exist", std::nullopt, novo(Existing::Keep), "novo"},
      {"written without deleting", std::nullopt, gravar("novo", 1, false), "novo", true},
      {"at the end", "velho", gravar(" e novo", -1, false), "velho e novo", true},
      {"over the beginning", "conteudo velho", gravar("NOVO", 0, false), "NOVOeudo velho", true},
      {"over the end", "velho", gravar("novo", 4, false), "velnovo", true},
      {"copied", "conteudo velho", copiar("A:\\origem"), "copiado"},
      {"copied from a read-only one", "velho", copiar("A:\\leitura"), "copiado"},
      {"copied in pieces", "velho", copiar("A:\\longo"), Longo},
  };
  for (const auto& caso : casos) {
    for (const bool noLugar : {false, true}) {
      SCOPED_TRACE(std::string(caso.Nome) + (noLugar ? ", in place" : ""));
      bool gravado = false;
      const auto operar = [&] { gravado = caso.Operacao(); };
      const auto preparar = [&] {
        AddDisk('A', 1 << 20);
        PutFile("A:\\origem", "copiado");
        PutFile("A:\\leitura", "copiado", 0x21);
        PutFile("A:\\longo", Longo);
        PutDirectory("C:\\Jogos");
        if (caso.Antes) PutFile(Alvo, *caso.Antes);
        if (noLugar && caso.Antes) TakeNoNewFiles("C:\\Jogos");
      };
      const auto conferir = [&] {
        for (const bool corte : {false, true}) {
          if (corte) CutPower();
          EXPECT_EQ(Content(Alvo), gravado ? std::optional(caso.Depois) : caso.Antes) << (corte ? "power cut" : "");
          EXPECT_EQ(Leftovers({"C:\\Jogos\\"}), Texts{});
        }
      };
      EXPECT_GE(WithEachFault(Fault::Once, preparar, operar, conferir), 3);
      EXPECT_TRUE(gravado);  // by the last run, in which nothing failed
      for (const Fault falha : {Fault::FromThenOn, Fault::PowerCut}) {
        if (!noLugar && !caso.NoLugar) WithEachFault(falha, preparar, operar, conferir);
      }
    }
  }
}

TEST_F(Arquivos, ThatCannotBeWrittenStayAndWhatDeletingAndWritingCouldDoIsDone) {
  const std::string velho(40960, 'v'), novo(81920, 'n');
  const auto semNovos = [] { TakeNoNewFiles("C:\\Jogos"); };
  const std::tuple<const char*, std::function<void()>, bool> casos[] = {
      {"no file can be made beside it", semNovos, true},
      {"room for the new one only where the old one is", [] { SetFreeSpace('C', 45000); }, true},
      {"no room at all", [] { SetFreeSpace('C', 0); }, false},
      {"no room in place", [&] { semNovos(), SetFreeSpace('C', 30000); }, false},
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
      const bool gravado =
          copiar ? CopiarArquivo("D:\\novo", Alvo) == Copia::Feita : GravarArquivo(Alvo, novo, 1, true) == 1;
      EXPECT_EQ(gravado, gravavel);
      EXPECT_TRUE(Content(Alvo) == (gravavel ? novo : velho));
      EXPECT_TRUE(Content("D:\\novo") == novo);
      EXPECT_EQ(WriteCount(Alvo) != escritas, gravavel) << "not even for a moment, when it cannot be";
      EXPECT_EQ(AllFiles().size(), 2u) << "what lay beside it is gone";
    }
  }
}

TEST_F(Arquivos, HalfWrittenOnesGoWhenTheyAreOldAndNobodysAndThePersonsOwnStay) {
  const struct {
    const char* Name;
    bool Goes;
  } files[] = {{"jogo.zip.0f3a99c2.novo~", true}, {"jogo.zip.12345678.NOVO~", false}, {"jogo.zip.novo~", false},
               {".0f3a99c2.novo~", false},        {"jogo.0F3A99C2.novo~", false},     {"jogo.0f3a99c.novo~", false},
               {"jogo0f3a99c2.novo~", false},     {"jogo.0f3a99c2.novo~.zip", false}, {"preso.0f3a99c2.novo~", false}};
  for (const auto& [name, goes] : files) PutFile("C:\\Jogos\\"s + name, "half");
  LockFile("C:\\Jogos\\preso.0f3a99c2.novo~");
  ApagarRestos("C:\\Jogos\\");
  EXPECT_EQ(AllFiles().size(), std::size(files)) << "another program may be writing";
  PassTime(3601);
  PutFile("C:\\Jogos\\novo.11111111.novo~", "half");
  ApagarRestos("C:\\Jogos\\");
  for (const auto& [name, goes] : files) EXPECT_NE(Content("C:\\Jogos\\"s + name).has_value(), goes) << name;
  EXPECT_TRUE(Content("C:\\Jogos\\novo.11111111.novo~")) << "younger than an hour";
  CutPower();
  ApagarRestos("C:\\Jogos\\");
  EXPECT_FALSE(Content("C:\\Jogos\\novo.11111111.novo~")) << "from before the machine's start";
}

TEST_F(Arquivos, ACopyTellsHowFarItIsAndWhichSideFailed) {
  PutFile("C:\\longo", Longo, platform::AttributeReadOnly | platform::AttributeHidden);
  PutFile("C:\\curto", "x");
  std::vector<int> andamentos;
  const auto anotar = [&](int porCento) { andamentos.push_back(porCento); };
  EXPECT_EQ(CopiarArquivo("C:\\curto", Alvo, anotar), Copia::NaoGravada) << "there is no such directory";
  PutDirectory("C:\\Jogos");
  EXPECT_EQ(CopiarArquivo("C:\\curto", Alvo, anotar), Copia::Feita);
  EXPECT_TRUE(andamentos.empty()) << "one piece";
  EXPECT_EQ(CopiarArquivo("C:\\longo", Alvo, anotar), Copia::Feita);
  EXPECT_EQ(andamentos, (std::vector{32, 65, 98}));
  EXPECT_EQ(platform::GetFileAttributesA(Alvo), platform::AttributeHidden);
  EXPECT_EQ(CopiarArquivo("C:\\nada", Alvo), Copia::NaoLida);
  LockFile("C:\\curto");
  EXPECT_EQ(CopiarArquivo("C:\\curto", Alvo), Copia::NaoLida);
  EXPECT_EQ(CopiarArquivo("C:\\longo", Alvo, [](int) { LockFile("C:\\longo"), RemoveDisk('C'); }), Copia::NaoLida);
}

TEST_F(Arquivos, AreNeitherReadNorMadeWhereNoneCanBe) {
  PutFile(Alvo, "velho");
  for (const char* caminho : {"C:\\nada\\alvo", "D:\\alvo", "C:\\Tolvaris", ""}) {
    for (const bool apagar : {false, true}) EXPECT_EQ(GravarArquivo(caminho, "novo", 1, apagar), -1) << caminho;
    EXPECT_EQ(CopiarArquivo(Alvo, caminho), Copia::NaoGravada) << caminho;
    EXPECT_EQ(CopiarArquivo(caminho, Alvo), Copia::NaoLida) << caminho;
    ApagarArquivo(caminho);
  }
  EXPECT_EQ(GravarArquivo(Alvo, "novo", -2, false), -1);
  EXPECT_TRUE(Content(Alvo) == "velho" && AllFiles().size() == 1);
}

}  // namespace
