// Translation, starting programs, and the file dialogs.
#include <gtest/gtest.h>

#include "platform/simulated/simulated.h"
#include "platform/text.h"
#include "support/mod_CommonDialog.h"
#include "support/mod_Globais.h"
#include "support/mod_Traducao.h"
#include "support/mod_exe.h"

namespace {

using namespace platform::simulated;
using namespace std::string_literals;

struct Servicos : testing::Test {
  void SetUp() override { Reset(), ArquivoIdioma.clear(); }
};

TEST_F(Servicos, TraduzirTakesTheValueOfTheTranslationFileWithoutItsBars) {
  const std::string longo(254, 'x'), acao = "Ação"_ansi;
  PutFile("C:\\Tolvaris\\language.ini",
          "[OUTRA]\r\nErro=Wrong\r\n[TOLVARIS20]\r\nJogo=Game\r\nBranco=| word |\r\nDuas=||\r\nTres=|||\r\n"
          "Meio=a|b\r\nVazio=\r\nUma=|\r\n" +
              acao + "=Deed\r\nLongo=" + longo + "y\r\n");
  const std::pair<std::string, std::string> casos[] = {
      {"Jogo", "Game"},   {"Branco", " word "}, {"Duas", "Duas"}, {"Tres", ""},     {"Meio", "ab"}, {"Uma", "Uma"},
      {"Vazio", "Vazio"}, {"Erro", "Erro"},     {"", ""},         {"Longo", longo}, {acao, "Deed"}};
  for (const std::string arquivo : {"", "C:\\Tolvaris\\nada.ini", "C:\\Tolvaris\\language.ini"}) {
    ArquivoIdioma = arquivo;
    for (const auto& [texto, traducao] : casos) {
      EXPECT_EQ(Traduzir(texto), arquivo.ends_with("language.ini") ? traducao : texto) << arquivo;
    }
  }
  EXPECT_EQ(LerIni("TOLVARIS20", "Tres") + LerIni("OUTRA", "Erro"), "|Wrong");
}

TEST_F(Servicos, AProgramStartsWithItsPriorityInItsDirectory) {
  const std::tuple<std::string, std::string, int, std::string, std::uint32_t> casos[] = {
      {"C:\\Emu\\emu.exe C:\\Roms\\Jogo.smc", "", 2, "C:\\Roms\\", 0x20},
      {"C:\\Emu\\emu.exe C:\\Roms\\Jogo.smc", "C:\\Emu", 1, "C:\\Emu", 0x40},
      {"C:\\Emu 2\\emu.exe -x", "", 3, "C:\\Emu 2\\", 0x80},
      {"C:\\Emu\\emu.exe", "", 4, "C:\\Emu\\", 0x100},
      {"C:\\Emu\\emu.exe", "", 5, "C:\\Emu\\", 0x20},
  };
  PutFile("C:\\Emu\\emu.exe", "MZ");
  PutFile("C:\\Emu 2\\emu.exe", "MZ");
  PutDirectory("C:\\Roms");
  std::string diretorio;
  for (const auto& [comando, pedido, prioridade, usado, classe] : casos) {
    diretorio = pedido;
    EXPECT_TRUE(ExecutarPrograma(comando, 100, false, prioridade, diretorio)) << comando;
    ASSERT_FALSE(StartedProcesses().empty());
    const StartedProcess& processo = StartedProcesses().back();
    EXPECT_EQ(processo.CommandLine + "|" + processo.Directory + "|" + diretorio, comando + "|" + usado + "|" + usado);
    EXPECT_EQ(processo.CreationFlags, classe);
  }
  diretorio.clear();
  ExecutarPrograma("emu.exe", 100, false, 2, diretorio);
  EXPECT_EQ(diretorio, "");
  EXPECT_TRUE(SleptMilliseconds() == 0 && PendingEventRuns() == 0);
}

TEST_F(Servicos, WaitingLetsEventsRunInTheRhythmAndOnceWhereNothingStarted) {
  PutFile("C:\\cfg.exe", "MZ");
  PutFile("C:\\recusado.exe", "MZ");
  RefuseToStart("C:\\recusado.exe");
  bool terminou = false, clicou = false;
  OnProcess("C:\\cfg.exe", 3, [&] { terminou = true; });
  QueueEvent([&] { clicou = !terminou; });
  std::string diretorio = "C:\\";
  EXPECT_TRUE(ExecutarPrograma("C:\\cfg.exe", 500, true, 2, diretorio));
  EXPECT_TRUE(terminou && clicou);
  EXPECT_EQ(PendingEventRuns(), 3);
  EXPECT_LE(SleptMilliseconds(), 1500u);
  for (const char* comando : {"C:\\nada.exe", "C:\\recusado.exe"}) {
    for (const bool esperar : {false, true}) {
      const auto antes = SleptMilliseconds();
      EXPECT_FALSE(ExecutarPrograma(comando, 500, esperar, 2, diretorio));
      EXPECT_EQ(SleptMilliseconds() - antes, esperar ? 500u : 0u);
    }
  }
  EXPECT_EQ(PendingEventRuns(), 3 + 2);
}

struct Dialogos : Servicos {
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
    EXPECT_EQ(pedido.File, nome + std::string(tamanho < 254 ? 254 - tamanho : 1, ' '));
    EXPECT_TRUE(pedido.Owner == &Dono && pedido.FileSize == 255 && pedido.Flags == 4);
    EXPECT_EQ(pedido.InitialDirectory + "|" + pedido.Title + "|" + pedido.DefaultExtension + "|" + pedido.Filter,
              "C:\\Jogos|Salvar como...|tvk;zip|" + Filtro);
  }
  Filtro.clear();
  Abrir();
  EXPECT_EQ(Filtro, "Todos os arquivos (*.*)\0*.*\0"s);
  EXPECT_EQ(ShownFileDialogs().back().Filter, Filtro);
  EXPECT_EQ(ShownFileDialogs().back().DefaultExtension, "");
}

// Saving takes every path that fits; opening only a file that is listed.
TEST_F(Dialogos, GiveTheChosenPathOrNothing) {
  PutFile("C:\\J\\Maçã"_ansi, "x");
  PutFile("C:\\J\\leitura", "x", 0x21);
  PutFile("C:\\J\\oculto", "x", 0x22);
  PutFile("C:\\J\\sistema", "x", 0x24);
  const std::string longo = "C:\\" + std::string(251, 'x');
  const std::tuple<std::string, bool, bool> casos[] = {
      {"C:\\j\\MAÇÃ"_ansi, true, true}, {"C:\\J\\leitura", true, true},
      {"C:\\J\\oculto", true, false},   {"C:\\J\\sistema", true, false},
      {"C:\\J\\nenhum", true, false},   {"C:\\J\\", true, false},
      {longo + "x", false, false},      {longo, true, false},
      {"C:\\J", true, false},           {"", true, false},
  };
  for (const auto& [caminho, salvo, aberto] : casos) {
    QueueFileDialog(caminho);
    EXPECT_EQ(Salvar("Um nome de jogo comprido"), salvo ? caminho : "");
    QueueFileDialog(caminho);
    EXPECT_EQ(Abrir(), aberto ? caminho : "");
  }
  QueueFileDialog("  C:\\com brancos.tvk ");
  EXPECT_EQ(Salvar("Jogo"), "C:\\com brancos.tvk");
}

}  // namespace
