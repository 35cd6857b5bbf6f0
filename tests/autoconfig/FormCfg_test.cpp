#include "platform/files.h"
#include "support/mod_Configuracao.h"
#include "support/mod_Globais.h"
#include "tests/autoconfig/janela.h"
#include "tests/falhas.h"

namespace {

using namespace janela;  // NOLINT(google-build-using-namespace)

const Textos Padroes = {"\\Roms\\", "\\Saves\\", "\\Imgs\\", "\\ZSNES\\zsnesw.exe", "\\ZSNES\\zsnesw.cfg"};

TEST_F(Janela, ShowsWhatItFoundAndWritesIt) {
  Abrir();
  EXPECT_EQ(form->Label2.Caption(), "");
  EXPECT_FALSE(form->Command1.Enabled()) << "there is nothing to save yet";
  Tick(form->Timer1);
  EXPECT_FALSE(form->Timer1.Enabled());
  EXPECT_EQ(form->Label2.Caption(), "Busca concluída."_ansi);
  EXPECT_EQ(Lista(), Textos{Emulador});
  const Textos mostrados = {Emulador, "C:\\Tolvaris\\ZSNES\\zsnesw.cfg", "C:\\Tolvaris\\Roms\\",
                            "C:\\Tolvaris\\Saves\\", "C:\\Tolvaris\\Imgs\\"};
  EXPECT_EQ(Mostrados(), mostrados);
  EXPECT_EQ(Gravados(), Nada);
  Gravar();
  EXPECT_EQ(Gravados(), Padroes);
  EXPECT_TRUE(form->IsClosed());
  EXPECT_EQ(Mensagens(), Textos());
  LerCaminhos({});
  EXPECT_EQ(ArquivoEmulador, Emulador) << "as start-up reads it";
}

TEST_F(Janela, CancelWritesNothingEvenInTheMiddleOfTheSearch) {
  for (int i = 0; i < 200; ++i) PutDirectory("C:\\Tolvaris\\" + std::to_string(i));
  PutFile("C:\\Tolvaris\\ZZ\\zsnes.exe", "MZ");
  Abrir();
  QueueEvent([this] {
    EXPECT_EQ(form->Label2.Caption(), "Procurando...");
    QueueEvent([this] { Click(form->Command2); });
  });
  Tick(form->Timer1);
  EXPECT_TRUE(form->IsClosed());
  EXPECT_LT(PendingEventRuns(), 10) << "the search has ended at once";
  EXPECT_EQ(Gravados(), Nada);
  EXPECT_EQ(WritesEver(), 0U);

  AbrirEProcurar();
  EXPECT_EQ(Lista().size(), 2U);
  CloseWindow(*form);
  EXPECT_EQ(Gravados(), Nada);
}

TEST_F(Janela, KeysAndClicksOfTheList) {
  PutFile("C:\\Tolvaris\\ZZZ\\zsnes.exe", "MZ");
  AbrirEProcurar();
  const std::vector<platform::Control*> ordem = ControlsOf(*form);
  const auto lugar = [&](const platform::Control& controle) {
    return std::find(ordem.begin(), ordem.end(), &controle) - ordem.begin();
  };
  EXPECT_LT(lugar(form->List1), lugar(form->Command3));
  EXPECT_LT(lugar(form->Command3), lugar(form->Command1));
  EXPECT_LT(lugar(form->Command1), lugar(form->Command2));
  PressKey(form->List1, 40);
  EXPECT_EQ(Mostrados()[1], "C:\\Tolvaris\\ZZZ\\zsnes.cfg");
  PressKey(form->List1, 13);
  EXPECT_TRUE(form->IsClosed());
  EXPECT_EQ(Gravados()[3], "\\ZZZ\\zsnes.exe");
  EXPECT_EQ(Gravados()[4], "\\ZZZ\\zsnes.cfg");

  AbrirEProcurar();
  EXPECT_EQ(form->List1.Text(0), "C:\\Tolvaris\\ZZZ\\zsnes.exe") << "the one that is set comes first";
  Choose(form->List1, 1);
  DoubleClick(form->List1);
  EXPECT_EQ(Gravados(), Padroes);
}

TEST_F(Janela, WhatIsSetStaysUnlessThePersonChangesIt) {
  AddDisk('D', 1 << 20);
  PutFile("D:\\Meu Emulador\\zsnes.exe", "MZ");
  const Textos antes = {"D:\\Jogos\\", "\\Salvos\\", "-", "D:\\Meu Emulador\\zsnes.exe", "-"};
  const auto preparar = [&] {
    for (std::size_t i = 0; i < antes.size(); ++i) {
      if (antes[i] != "-") PutText(Chave, NomesDosAjustes[i].Nome, antes[i]);
    }
    AbrirEProcurar();
  };
  preparar();
  EXPECT_EQ(Lista(), (Textos{"D:\\Meu Emulador\\zsnes.exe", Emulador}));
  EXPECT_EQ(form->List1.Selected(), 0);
  Gravar();
  EXPECT_EQ(Gravados(), (Textos{"D:\\Jogos\\", "\\Salvos\\", "\\Imgs\\", "D:\\Meu Emulador\\zsnes.exe",
                                "D:\\Meu Emulador\\zsnes.cfg"}));
  preparar();
  Choose(form->List1, 1);
  Choose(form->List1, 0);  // and back: nothing has changed
  Gravar();
  EXPECT_EQ(Gravados()[3], "D:\\Meu Emulador\\zsnes.exe");
  preparar();
  Choose(form->List1, 1);
  Gravar();
  EXPECT_EQ(Gravados(), (Textos{"D:\\Jogos\\", "\\Salvos\\", "\\Imgs\\", Padroes[3], Padroes[4]}));
  EXPECT_EQ(Mensagens(), Textos());
}

TEST_F(Janela, AConfigurationFileThatIsSetStaysWithTheProposedEmulatorOnly) {
  for (const bool outro : {false, true}) {
    PutFile("C:\\Tolvaris\\ZSNES\\zsnes.exe", "MZ");
    PutText(Chave, "EmuExe", "");
    PutText(Chave, "EmuCFG", "D:\\meu.cfg");
    AbrirEProcurar();
    if (outro) Choose(form->List1, 1);
    Gravar();
    EXPECT_EQ(Gravados()[4], outro ? "\\ZSNES\\zsnes.cfg" : "D:\\meu.cfg");
  }
}

TEST_F(Janela, TheEmulatorIsWrittenSoThatAnUnquotedCommandLineStartsIt) {
  struct {
    const char *Programa, *Arquivo, *Gravado, *Configuracao;
    bool NomesCurtos = true;
  } const casos[] = {
      {"C:\\Tolvaris", "C:\\tolvaris\\zsnesw.exe", "\\zsnesw.exe", "\\zsnesw.cfg"},
      {"C:\\Tolvaris", "C:\\Tolvaris\\Meu Emulador\\zsnes.exe", "\\MEUEMU~1\\zsnes.exe", "\\Meu Emulador\\zsnes.cfg"},
      {"C:\\Tolvaris da Silva", "C:\\Tolvaris da Silva\\Z\\zsnesw.exe", "C:\\TOLVAR~1\\Z\\zsnesw.exe",
       "\\Z\\zsnesw.cfg"},
      {"C:\\TolvarisComprido", "C:\\TolvarisComprido\\Meu Emulador\\zsnesw.exe", "\\MEUEMU~1\\zsnesw.exe",
       "\\Meu Emulador\\zsnesw.cfg"},
      {"C:\\Tolvaris", "C:\\Tolvaris 2\\zsnesw.exe", "C:\\TOLVAR~1\\zsnesw.exe", "C:\\Tolvaris 2\\zsnesw.cfg"},
      {"C:\\Tolvaris", "C:\\EmuladorSemEspacos\\ZSNESW151.exe", "C:\\EmuladorSemEspacos\\ZSNESW151.exe",
       "C:\\EmuladorSemEspacos\\zsnesw.cfg"},
      {"C:\\", "C:\\Emu\\outro.exe", "\\Emu\\outro.exe", "\\Emu\\zsnesw.cfg"},
      {"C:\\Tolvaris", "C:\\Meu Emulador\\zsnes.exe", "C:\\Meu Emulador\\zsnes.exe", "C:\\Meu Emulador\\zsnes.cfg",
       false},
      {"C:\\Meu Tolvaris", "C:\\Meu Tolvaris\\Z\\zsnes.exe", "\\Z\\zsnes.exe", "\\Z\\zsnes.cfg", false},
  };
  for (const auto& caso : casos) {
    Reset();
    if (!caso.NomesCurtos) KeepNoShortNames();
    SetProgramDirectory(caso.Programa);
    PutFile(caso.Arquivo, "MZ");
    Abrir();
    QueueFileDialog(caso.Arquivo);
    Click(form->Command3);
    Gravar();
    EXPECT_EQ(Gravados()[3], caso.Gravado);
    EXPECT_EQ(Gravados()[4], caso.Configuracao);
    EXPECT_EQ(Gravados()[0], "\\Roms\\") << caso.Arquivo;
    const Textos aviso = {
        "Informação: O caminho do emulador tem espaços e o disco não tem um nome curto para ele.\r\n"
        "Se os jogos não abrirem, mude o emulador para um diretório sem espaços.\r\n\r\n"_ansi +
        std::string(caso.Arquivo)};
    EXPECT_EQ(Mensagens(), caso.NomesCurtos ? Textos() : aviso) << caso.Arquivo;
  }
  Reset();
  PutFile("C:\\E\\outro.exe", "MZ");
  PutFile("C:\\E\\zsnes.cfg", "x");
  EXPECT_EQ(ConfiguracaoDoEmulador("C:\\E\\outro.exe"), "C:\\E\\zsnes.cfg") << "the one that is there";
}

TEST_F(Janela, AnotherEmulatorIsChosenWithTheDialog) {
  PutFile("C:\\Outro\\zsnes.exe", "MZ");
  PutFile("C:\\Outro\\vazio.exe", "");
  AbrirEProcurar();
  Click(form->Command3);  // cancelled
  EXPECT_EQ(Lista().size(), 1U);
  QueueFileDialog("C:\\Outro\\zsnes.exe");
  Click(form->Command3);
  EXPECT_EQ(Mostrados()[0], "C:\\Outro\\zsnes.exe");
  QueueFileDialog("C:\\TOLVARIS\\zsnes\\ZSNESW.EXE");  // in the list already
  Click(form->Command3);
  EXPECT_EQ(Lista().size(), 2U);
  EXPECT_EQ(Mostrados()[0], Emulador);
  EXPECT_EQ(ShownFileDialogs().back().InitialDirectory, "C:\\Outro\\");
  QueueFileDialog("C:\\Outro\\vazio.exe");
  Click(form->Command3);
  Gravar();
  EXPECT_EQ(Mensagens(), Textos{"Erro: O emulador ZSnes não foi encontrado."_ansi});
  EXPECT_EQ(Gravados(), Nada);
  EXPECT_FALSE(form->IsClosed());
}

TEST_F(Janela, WhatStartUpCouldNotReadIsRefused) {
  EXPECT_EQ(Impedimento(std::string(254, 'x')), "");
  EXPECT_NE(Impedimento(std::string(255, 'x')), "");
  EXPECT_EQ(Impedimento("\\Roms\\"), "");
  EXPECT_NE(Impedimento("\\\\servidor\\zsnes\\zsnesw.exe"), "") << "read as relative to the program's directory";

  const std::string diretorio = "C:\\" + std::string(120, 'a') + "\\" + std::string(121, 'b') + "\\";
  PutFile(diretorio + "z.exe", "MZ");
  AbrirEProcurar();
  QueueFileDialog(diretorio + "z.exe");
  Click(form->Command3);
  Gravar();
  EXPECT_EQ(Mensagens(), Textos{"Erro: O caminho é longo demais: o Tolvaris lê no máximo 254 caracteres.\r\n\r\n"_ansi +
                                diretorio + "zsnesw.cfg"});
  EXPECT_EQ(Gravados(), Nada);
  EXPECT_FALSE(form->IsClosed());
}

TEST_F(Janela, NothingFoundIsSaidAndNothingCanBeSaved) {
  RemoveFile(Emulador);
  AbrirEProcurar();
  EXPECT_EQ(form->Label2.Caption(), "Nenhum emulador foi encontrado. Clique em 'Procurar outro...'.");
  EXPECT_FALSE(form->Command1.Enabled());
  PressKey(form->List1, 13);
  EXPECT_EQ(Gravados(), Nada);
  EXPECT_FALSE(form->IsClosed());
}

TEST_F(Janela, SettingsThatCannotBeWrittenAreSaid) {
  DenyKey(Chave);
  AbrirEProcurar();
  Gravar();
  EXPECT_EQ(Mensagens(), Textos{"Erro: Não foi possível gravar a configuração."_ansi});
  EXPECT_FALSE(form->IsClosed());
  DenyKey(Chave, false);
  Gravar();
  EXPECT_EQ(Gravados(), Padroes);
}

TEST_F(Janela, EveryTextCanBeTranslated) {
  PutFile("C:\\Tolvaris\\language.ini",
          "[TOLVARIS20]\r\nConfiguração do Tolvaris=Setup\r\nEmuladores encontrados:=Found:\r\n"
          "&Procurar outro...=&Other...\r\n Configuração =Settings\r\nEmulador:=Emulator:\r\nImagens:=Pictures:\r\n"
          "&Gravar=&Save\r\n&Cancelar=&Cancel\r\nBusca concluída.=Done.\r\n"_ansi);
  AbrirEProcurar();
  EXPECT_EQ(form->Caption() + form->Label1.Caption() + form->Command3.Caption() + form->Frame1.Caption() +
                form->Label3.front().Caption() + form->Label3.back().Caption() + form->Command1.Caption() +
                form->Command2.Caption() + form->Label2.Caption(),
            "SetupFound:&Other...SettingsEmulator:Pictures:&Save&CancelDone.");
}

// The emulator's configuration file in the newer form.
class FormaNovaNaJanela : public Janela {
 protected:
  static inline const std::string Arquivo = "C:\\Tolvaris\\ZSNES\\zsnesw.cfg";
  static inline const std::string Antes = "x=1\r\nROMPath=\"\"\r\nSRAMPath=\"\"\r\n";
  static inline const std::string Depois =
      "x=1\r\nROMPath=\"C:\\\\Tolvaris\\\\Roms\"\r\nSRAMPath=\"C:\\\\Tolvaris\\\\Saves\"\r\n";
};

TEST_F(FormaNovaNaJanela, ItsDirectoriesAreSetOnRequest) {
  struct {
    Answer Resposta;
    std::string Conteudo;
    bool Grava;
  } const casos[] = {{Answer::Cancel, Antes, false}, {Answer::No, Antes, true}, {Answer::Yes, Depois, true}};
  for (const auto& caso : casos) {
    PutFile(Arquivo, Antes);
    AbrirEProcurar();
    QueueAnswer(caso.Resposta);
    Gravar();
    ASSERT_EQ(ShownMessages().size(), 1U);
    EXPECT_NE(ShownMessages()[0].Text.find("disquete"), std::string::npos);
    ForgetMessages();
    EXPECT_EQ(Content(Arquivo), caso.Conteudo);
    EXPECT_EQ(Gravados(), caso.Grava ? Padroes : Nada);
    EXPECT_EQ(form->IsClosed(), caso.Grava);
  }
  for (const std::string& semPergunta : {Depois, std::string("SaveDirectory = C:\\S\r\n"), std::string()}) {
    PutFile(Arquivo, semPergunta);
    AbrirEProcurar();
    Gravar();
    EXPECT_EQ(Content(Arquivo), semPergunta);
    EXPECT_EQ(Mensagens(), Textos());
  }
}

// Whatever fails: the file is the old or the new one, whole, and what is not as it was asked for has been said.
TEST_F(FormaNovaNaJanela, EveryFaultLeavesWholeFilesAndIsSaid) {
  bool fechou = false;
  std::size_t abertos = 0;
  const int falhas = ComCadaFalha(
      [this] {
        PutFile(Emulador, "MZ");
        PutFile(Arquivo, Antes);
        AbrirEProcurar();
        QueueAnswer(Answer::Yes);
      },
      [&] {
        Gravar();
        fechou = form->IsClosed();
        abertos = OpenFiles() + OpenRegistryHandles();
        CutPower();
      },
      [&] {
        const std::string conteudo = Content(Arquivo).value_or("");
        EXPECT_TRUE(conteudo == Antes || conteudo == Depois) << conteudo;
        const Textos mensagens = Mensagens();
        const bool errou = !mensagens.empty() && mensagens.back().starts_with("Erro: ");
        EXPECT_EQ(fechou, !errou);
        const bool configurado = Gravados()[4] != "-";
        EXPECT_TRUE(Gravados() == Padroes || !(configurado || fechou)) << "configured is only what is complete";
        EXPECT_EQ(abertos, 0U);
      });
  EXPECT_GT(falhas, 20);
}

}  // namespace
