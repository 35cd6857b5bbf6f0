// Translation, starting programs, and the file dialogs.
#include <gtest/gtest.h>

#include "platform/processes.h"
#include "platform/simulated/simulated.h"
#include "platform/text.h"
#include "support/mod_CommonDialog.h"
#include "support/mod_Globais.h"
#include "support/mod_Traducao.h"
#include "support/mod_exe.h"

namespace {

using namespace platform::simulated;
using namespace std::string_literals;

class Servicos : public testing::Test {
 protected:
  void SetUp() override {
    Reset();
    ArquivoIdioma.clear();
  }
};

TEST_F(Servicos, TraduzirTakesTheValueOfTheTranslationFileWithoutItsBars) {
  PutFile("C:\\Tolvaris\\language.ini",
          "[OUTRA]\r\nErro=Wrong\r\n"
          "[TOLVARIS20]\r\nDeletar jogo=Delete game\r\n"
          "Com brancos=| word |\r\nDuas=||\r\nTres=|||\r\nMeio=a|b\r\nVazio=\r\nUma=|\r\n"
          "Configuração=Configuração nova\r\nLongo="_ansi +
              std::string(300, 'x') + "\r\n");
  const std::pair<std::string, std::string> casos[] = {
      {"Deletar jogo", "Delete game"},
      {"Com brancos", " word "},
      {"Duas", "Duas"},
      {"Tres", ""},
      {"Meio", "ab"},
      {"Vazio", "Vazio"},
      {"Uma", "Uma"},
      {"Erro", "Erro"},
      {"Outro", "Outro"},
      {"", ""},
      {"Longo", std::string(254, 'x')},
      {"Configuração"_ansi, "Configuração nova"_ansi},
  };
  for (const auto& [texto, traducao] : casos) EXPECT_EQ(Traduzir(texto), texto);
  ArquivoIdioma = "C:\\Tolvaris\\language.ini";
  for (const auto& [texto, traducao] : casos) EXPECT_EQ(Traduzir(texto), traducao);
  EXPECT_EQ(LerIni("TOLVARIS20", "Tres"), "|");
  EXPECT_EQ(LerIni("OUTRA", "Erro"), "Wrong");
  ArquivoIdioma = "C:\\Tolvaris\\nada.ini";
  EXPECT_EQ(Traduzir("Deletar jogo"), "Deletar jogo");
}

TEST_F(Servicos, AProgramStartsWithItsPriorityInItsDirectory) {
  const struct {
    const char* Comando;
    const char* Diretorio;
    int Prioridade;
    const char* DiretorioUsado;
    std::uint32_t Classe;
  } casos[] = {
      {"C:\\Emu\\emu.exe C:\\Roms\\Jogo.smc", "", 2, "C:\\Roms\\", 0x20},
      {"C:\\Emu\\emu.exe C:\\Roms\\Jogo.smc", "C:\\Emu", 1, "C:\\Emu", 0x40},
      {"C:\\Emu 2\\emu.exe -x", "", 2, "C:\\Emu 2\\", 0x20},
      {"C:\\Emu\\emu.exe", "", 3, "C:\\Emu\\", 0x80},
      {"C:\\Emu\\emu.exe", "", 4, "C:\\Emu\\", 0x100},
      {"C:\\Emu\\emu.exe", "", 0, "C:\\Emu\\", 0x20},
      {"C:\\Emu\\emu.exe", "", 5, "C:\\Emu\\", 0x20},
  };
  PutFile("C:\\Emu\\emu.exe", "MZ");
  PutFile("C:\\Emu 2\\emu.exe", "MZ");
  PutDirectory("C:\\Roms");
  for (const auto& caso : casos) {
    std::string diretorio = caso.Diretorio;
    EXPECT_TRUE(ExecutarPrograma(caso.Comando, 100, false, caso.Prioridade, diretorio)) << caso.Comando;
    EXPECT_EQ(diretorio, caso.DiretorioUsado);
    ASSERT_FALSE(StartedProcesses().empty());
    EXPECT_EQ(StartedProcesses().back().CommandLine, caso.Comando);
    EXPECT_EQ(StartedProcesses().back().Directory, caso.DiretorioUsado);
    EXPECT_EQ(StartedProcesses().back().CreationFlags, caso.Classe);
  }
  std::string diretorio;
  ExecutarPrograma("emu.exe", 100, false, 2, diretorio);
  EXPECT_EQ(diretorio, "");
  EXPECT_EQ(SleptMilliseconds(), 0u);
  EXPECT_EQ(PendingEventRuns(), 0);
}

TEST_F(Servicos, WaitingForAProgramLetsEventsRunInTheRhythm) {
  PutFile("C:\\cfg.exe", "MZ");
  bool terminou = false, clicou = false;
  OnProcess("C:\\cfg.exe", 3, [&] { terminou = true; });
  QueueEvent([&] { clicou = !terminou; });
  std::string diretorio = "C:\\";
  EXPECT_TRUE(ExecutarPrograma("C:\\cfg.exe", 500, true, 2, diretorio));
  EXPECT_TRUE(terminou);
  EXPECT_TRUE(clicou);
  EXPECT_EQ(PendingEventRuns(), 3);
  EXPECT_LE(SleptMilliseconds(), 1500u);
}

TEST_F(Servicos, AProgramThatCannotBeStartedIsToldAndWaitedForOnce) {
  PutFile("C:\\recusado.exe", "MZ");
  RefuseToStart("C:\\recusado.exe");
  for (const char* comando : {"C:\\nada.exe", "C:\\recusado.exe"}) {
    std::string diretorio = "C:\\";
    const auto antes = SleptMilliseconds();
    EXPECT_FALSE(ExecutarPrograma(comando, 500, false, 2, diretorio));
    EXPECT_EQ(SleptMilliseconds(), antes);
    EXPECT_FALSE(ExecutarPrograma(comando, 500, true, 2, diretorio));
    EXPECT_EQ(SleptMilliseconds(), antes + 500);
  }
  EXPECT_EQ(PendingEventRuns(), 2);
}

class Dialogos : public Servicos {
 protected:
  std::string Abrir() { return AbrirArquivo(Dono, "", "Adicionar...", "", Filtro, 4); }
  std::string Salvar(const std::string& nome) {
    return SalvarArquivo(Dono, "C:\\Jogos", "Salvar como...", "tvk;zip", nome, Filtro, 4);
  }

  platform::Window Dono{{"Dono", 1500, 1500}};
  std::string Filtro = "Todos\0*.*\0"s;
};

TEST_F(Dialogos, TheRequestIsFilledAsThePlatformWantsIt) {
  for (const std::size_t tamanho : {0u, 8u, 253u, 254u, 300u}) {
    const std::string nome(tamanho, 'n');
    EXPECT_EQ(Salvar(nome), "");
    ASSERT_FALSE(ShownFileDialogs().empty());
    const auto& pedido = ShownFileDialogs().back();
    EXPECT_EQ(pedido.Owner, &Dono);
    EXPECT_EQ(pedido.File, nome + std::string(tamanho < 254 ? 254 - tamanho : 1, ' '));
    EXPECT_EQ(pedido.FileSize, 255u);
    EXPECT_EQ(pedido.InitialDirectory, "C:\\Jogos");
    EXPECT_EQ(pedido.Title, "Salvar como...");
    EXPECT_EQ(pedido.Flags, 4u);
    EXPECT_EQ(pedido.DefaultExtension, "tvk;zip");
    EXPECT_EQ(pedido.Filter, Filtro);
  }
  Filtro.clear();
  Abrir();
  EXPECT_EQ(Filtro, "Todos os arquivos (*.*)\0*.*\0"s);
  EXPECT_EQ(ShownFileDialogs().back().Filter, Filtro);
  EXPECT_EQ(ShownFileDialogs().back().DefaultExtension, "");
}

TEST_F(Dialogos, SalvarArquivoGivesTheChosenPathAndNothingElse) {
  for (const std::string& caminho : {"C:\\x.tvk"s, "C:\\"s + std::string(251, 'x')}) {
    QueueFileDialog(caminho);
    EXPECT_EQ(Salvar("Um nome de jogo comprido"), caminho);
  }
  QueueFileDialog("  C:\\com brancos.tvk ");
  EXPECT_EQ(Salvar("Jogo"), "C:\\com brancos.tvk");
  QueueFileDialog("C:\\" + std::string(252, 'x'));
  EXPECT_EQ(Salvar("Jogo"), "");
}

TEST_F(Dialogos, AbrirArquivoGivesOnlyAFileThatIsListed) {
  PutFile("C:\\Jogos\\Maçã.smc"_ansi, "x");
  PutFile("C:\\Jogos\\leitura.smc", "x", 0x21);
  PutFile("C:\\Jogos\\oculto.smc", "x", 0x22);
  PutFile("C:\\Jogos\\sistema.smc", "x", 0x24);
  const std::pair<std::string, bool> casos[] = {
      {"C:\\JOGOS\\MAÇÃ.SMC"_ansi, true},
      {"C:\\Jogos\\leitura.smc", true},
      {"C:\\Jogos\\oculto.smc", false},
      {"C:\\Jogos\\sistema.smc", false},
      {"C:\\Jogos\\nenhum.smc", false},
      {"C:\\Jogos", false},
      {"C:\\Jogos\\", false},
  };
  for (const auto& [caminho, aberto] : casos) {
    QueueFileDialog(caminho);
    EXPECT_EQ(Abrir(), aberto ? caminho : "");
  }
  EXPECT_EQ(Abrir(), "");  // cancelled
}

}  // namespace
