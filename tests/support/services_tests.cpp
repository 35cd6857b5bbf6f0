// Translation, starting programs, and the file dialogs.
#include "support/mod_CommonDialog.h"
#include "support/mod_Traducao.h"
#include "support/mod_exe.h"
#include "tests/fresh_machine.h"

namespace {

struct Servicos : FreshMachine {};

TEST_F(Servicos, TraduzirTakesTheValueOfTheTranslationFileWithoutItsBars) {
  const std::string longo(254, 'x'), arquivo = "C:\\Tolvaris\\language.ini";
  PutFile(arquivo,
          "[OUTRA]\r\nErro=Wrong\r\n[TOLVARIS20]\r\nJogo=Game\r\nBranco=| word |\r\nDuas=||\r\nTres=|||\r\n"
          "Meio=a|b\r\nVazio=\r\nUma=|\r\nLongo=" +
              longo + "y\r\n");
  const std::pair<const char*, std::string> casos[] = {
      {"Jogo", "Game"}, {"Branco", " word "}, {"Duas", "Duas"}, {"Tres", ""}, {"Meio", "ab"},
      {"Uma", "Uma"},   {"Vazio", "Vazio"},   {"Erro", "Erro"}, {"", ""},     {"Longo", longo}};
  for (const auto& [texto, traducao] : casos) {
    ArquivoIdioma = arquivo;
    EXPECT_EQ(Traduzir(texto), traducao);
    ArquivoIdioma.clear();
    EXPECT_EQ(Traduzir(texto), texto);
  }
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
  for (const auto& [comando, pedido, prioridade, usado, classe] : casos) {
    std::string diretorio = pedido;
    ASSERT_TRUE(ExecutarPrograma(comando, 100, false, prioridade, diretorio)) << comando;
    const StartedProcess& processo = StartedProcesses().back();
    EXPECT_EQ(processo.CommandLine + "|" + processo.Directory + "|" + diretorio, comando + "|" + usado + "|" + usado);
    EXPECT_EQ(processo.CreationFlags, classe);
  }
  EXPECT_TRUE(SleptMilliseconds() == 0 && PendingEventRuns() == 0);
}

TEST_F(Servicos, WaitingLetsEventsRunInTheRhythmAndOnceWhereNothingStarted) {
  PutFile("C:\\cfg.exe", "MZ");
  bool terminou = false, clicou = false;
  OnProcess("C:\\cfg.exe", 3, [&] { terminou = true; });
  QueueEvent([&] { clicou = !terminou; });
  std::string diretorio = "C:\\";
  EXPECT_TRUE(ExecutarPrograma("C:\\cfg.exe", 500, true, 2, diretorio));
  EXPECT_TRUE(terminou && clicou);
  EXPECT_TRUE(PendingEventRuns() == 3 && SleptMilliseconds() <= 1500);
  for (const bool esperar : {false, true}) {
    const auto antes = SleptMilliseconds();
    EXPECT_FALSE(ExecutarPrograma("C:\\nada.exe", 500, esperar, 2, diretorio));
    EXPECT_EQ(SleptMilliseconds() - antes, esperar ? 500u : 0u);
  }
  EXPECT_EQ(PendingEventRuns(), 3 + 1);
}

// Saving takes every path that fits, under a name filled up with blanks; opening only a file that is listed.
TEST_F(Servicos, DialogsGiveTheChosenPathOrNothing) {
  const platform::Window dono({"Dono", 1500, 1500});
  std::string filtro;
  const auto salvar = [&](const std::string& nome) { return SalvarArquivo(dono, "C:\\J", "", "zip", nome, filtro, 4); };
  for (const auto& [tamanho, brancos] : {std::pair(0u, 254u), {253u, 1u}, {254u, 1u}, {300u, 1u}}) {
    const std::string nome(tamanho, 'n');
    EXPECT_EQ(salvar(nome), "");
    const platform::OpenFileName& pedido = ShownFileDialogs().back();
    EXPECT_EQ(pedido.File, nome + std::string(brancos, ' '));
    EXPECT_TRUE(pedido.Owner == &dono && pedido.FileSize == 255 && pedido.InitialDirectory == "C:\\J");
    EXPECT_EQ(pedido.Filter, "Todos os arquivos (*.*)\0*.*\0"s);
  }
  PutFile("C:\\J\\Maçã"_ansi, "x");
  PutFile("C:\\J\\oculto", "x", 0x22);
  const std::string longo = "C:\\" + std::string(251, 'x');
  const std::tuple<std::string, bool, bool> casos[] = {
      {"C:\\j\\MAÇÃ"_ansi, true, true}, {"C:\\J\\oculto", true, false}, {"C:\\J", true, false},
      {longo + "x", false, false},      {longo, true, false},           {"", true, false},
  };
  for (const auto& [caminho, salvo, aberto] : casos) {
    QueueFileDialog(caminho);
    EXPECT_EQ(salvar("Um nome de jogo comprido"), salvo ? caminho : "");
    QueueFileDialog(caminho);
    EXPECT_EQ(AbrirArquivo(dono, "", "", "", filtro, 4), aberto ? caminho : "");
  }
  QueueFileDialog("  C:\\com brancos.tvk ");
  EXPECT_EQ(salvar("Jogo"), "C:\\com brancos.tvk");
}

}  // namespace
