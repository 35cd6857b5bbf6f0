// The auto-configuration window, on a machine in memory with an emulator.
#include <memory>

#include "autoconfig/FormCfg.h"
#include "support/mod_Configuracao.h"
#include "tests/fresh_machine.h"

namespace {

const std::string Chave = ChaveConfiguracao, ParaDos = "C:\\Tolvaris\\ZSNES\\zsnes.exe";
const std::string Emulador = "C:\\Tolvaris\\ZSNES\\zsnesw.exe", Configuracao = "C:\\Tolvaris\\ZSNES\\zsnesw.cfg";
const Texts Nada(5, "-");
const Texts Padroes = {"\\Roms\\", "\\Saves\\", "\\Imgs\\", "\\ZSNES\\zsnesw.exe", "\\ZSNES\\zsnesw.cfg"};

struct Janela : FreshMachine {
  Janela() { PutFile(Emulador, "MZ"); }

  void Abrir() {
    form = std::make_unique<FormCfg>();
    form->Form_Load();
    form->Show();
  }
  void AbrirEProcurar() { Abrir(), Tick(form->Timer1); }
  void Gravar() { Click(form->Command1); }
  void Outro(const std::string& caminho) { QueueFileDialog(caminho), Click(form->Command3); }

  // RomDir, SaveDir, ImgDir, EmuExe and EmuCFG as they are stored; "-": not set.
  static Texts Gravados() {
    Texts textos;
    for (const NomeDeAjuste& cada : NomesDosAjustes) textos.push_back(StoredText(Chave, cada.Nome).value_or("-"));
    return textos;
  }

  std::unique_ptr<FormCfg> form;
};

TEST_F(Janela, ShowsWhatItFoundInEachLanguageAndWritesIt) {
  const std::string diretorios = "|Jogos:|C:\\Tolvaris\\Roms\\|Salvamentos:|C:\\Tolvaris\\Saves\\|";
  RemoveFile(Emulador);
  AbrirEProcurar();
  EXPECT_EQ(TextsOf(*form),
            "Configuração do Tolvaris|Emuladores encontrados:||Nenhum emulador foi encontrado. Clique em 'Procurar "
            "outro...'.|&Procurar outro...| Configuração |&Gravar|&Cancelar|Emulador:||Arquivo de configuração:|"_ansi +
                diretorios + "Imagens:|C:\\Tolvaris\\Imgs\\");
  EXPECT_FALSE(form->Command1.Enabled()) << "there is nothing to save";
  PressKey(form->List1, 13);
  EXPECT_TRUE(Gravados() == Nada && !form->IsClosed());
  PutFile(Emulador, "MZ");
  PutFile("C:\\Tolvaris\\language.ini",
          "[TOLVARIS20]\r\nConfiguração do Tolvaris=Setup\r\nEmuladores encontrados:=Found\r\n"
          "&Procurar outro...=Other\r\n Configuração =Settings\r\nImagens:=Pictures\r\n"
          "&Gravar=Save\r\n&Cancelar=Cancel\r\nBusca concluída.=Done\r\n"_ansi);
  AbrirEProcurar();
  EXPECT_FALSE(form->Timer1.Enabled());
  EXPECT_EQ(EntriesOf(form->List1), Emulador + "|");
  EXPECT_EQ(TextsOf(*form), "Setup|Found||Done|Other|Settings|Save|Cancel|Emulador:|" + Emulador +
                                "|Arquivo de configuração:|"_ansi + Configuracao + diretorios +
                                "Pictures|C:\\Tolvaris\\Imgs\\");
  DenyKey(Chave);
  Gravar();
  EXPECT_EQ(TakeMessages(), Texts{Error + "Não foi possível gravar a configuração."_ansi});
  EXPECT_FALSE(form->IsClosed());
  DenyKey(Chave, false);
  Gravar();
  EXPECT_EQ(Gravados(), Padroes);
  EXPECT_TRUE(form->IsClosed() && ShownMessages().empty());
  LerCaminhos({});
  EXPECT_EQ(ArquivoEmulador, Emulador) << "as start-up reads it";
}

TEST_F(Janela, CancelWritesNothingEvenInTheMiddleOfTheSearch) {
  for (int i = 0; i < 200; ++i) PutDirectory("C:\\Tolvaris\\" + std::to_string(i));
  Abrir();
  QueueEvent([this] {
    EXPECT_EQ(form->Label2.Caption(), "Procurando...");
    QueueEvent([this] { Click(form->Command2); });
  });
  Tick(form->Timer1);
  EXPECT_TRUE(form->IsClosed());
  EXPECT_LT(PendingEventRuns(), 10) << "the search has ended at once";
  EXPECT_TRUE(Gravados() == Nada && WritesEver() == 0);
}

TEST_F(Janela, WhatIsSetStaysAndComesFirstUnlessThePersonChangesIt) {
  const std::string meu = "D:\\Meu Emulador\\zsnes.exe", cfg = "D:\\Meu Emulador\\zsnes.cfg";
  const Texts tudo = {"D:\\Jogos\\", "\\Salvos\\", "-", meu, "-"}, soCfg = {"-", "-", "-", "", "D:\\meu.cfg"};
  const std::tuple<Texts, std::vector<int>, Texts> casos[] = {
      // what is set, what is chosen in the list, and what is set afterwards
      {tudo, {1, 0}, {"D:\\Jogos\\", "\\Salvos\\", "\\Imgs\\", meu, cfg}},
      {tudo, {1}, {"D:\\Jogos\\", "\\Salvos\\", "\\Imgs\\", Padroes[3], Padroes[4]}},
      {soCfg, {}, {"\\Roms\\", "\\Saves\\", "\\Imgs\\", Padroes[3], "D:\\meu.cfg"}},
      {soCfg, {1}, {"\\Roms\\", "\\Saves\\", "\\Imgs\\", "\\ZSNES\\zsnes.exe", "\\ZSNES\\zsnes.cfg"}},
  };
  for (const auto& [antes, escolhidos, depois] : casos) {
    Reset();
    AddDisk('D', 1 << 20);
    for (const std::string& arquivo : {meu, Emulador, ParaDos}) PutFile(arquivo, "MZ");
    for (std::size_t i = 0; i < antes.size(); ++i) {
      if (antes[i] != "-") PutText(Chave, NomesDosAjustes[i].Nome, antes[i]);
    }
    AbrirEProcurar();
    EXPECT_EQ(form->List1.Selected(), 0);
    for (const int indice : escolhidos) Choose(form->List1, indice);
    if (escolhidos.empty()) {
      PressKey(form->List1, 13);
    } else {
      DoubleClick(form->List1);
    }
    EXPECT_EQ(Gravados(), depois);
    EXPECT_EQ(TakeMessages(), Texts());
  }
}

TEST_F(Janela, TheEmulatorIsWrittenSoThatAnUnquotedCommandLineStartsIt) {
  const std::tuple<bool, std::string, std::string, std::string, std::string> casos[] = {
      // short names, the program's directory, the emulator; and how it and its configuration file are set
      {true, "C:\\Tolvaris", "C:\\tolvaris\\zsnesw.exe", "\\zsnesw.exe", "\\zsnesw.cfg"},
      {true, "C:\\Tolvaris da", "C:\\Tolvaris da\\Z\\zsnesw.exe", "C:\\TOLVAR~1\\Z\\zsnesw.exe", "\\Z\\zsnesw.cfg"},
      {true, "C:\\TolvarisX", "C:\\TolvarisX\\Meu Emu\\zsnes.exe", "\\MEUEMU~1\\zsnes.exe", "\\Meu Emu\\zsnes.cfg"},
      {true, "C:\\Tolvaris", "C:\\Tolvaris 2\\zsnesw.exe", "C:\\TOLVAR~1\\zsnesw.exe", "C:\\Tolvaris 2\\zsnesw.cfg"},
      {true, "C:\\Tolvaris", "C:\\Comprido9\\ZSNESW15.exe", "C:\\Comprido9\\ZSNESW15.exe", "C:\\Comprido9\\zsnesw.cfg"},
      {true, "C:\\", "C:\\Emu\\outro.exe", "\\Emu\\outro.exe", "\\Emu\\zsnesw.cfg"},
      {false, "C:\\Meu Tolvaris", "C:\\Meu Tolvaris\\Z\\zsnes.exe", "\\Z\\zsnes.exe", "\\Z\\zsnes.cfg"},
  };
  const std::string aviso =
      "Informação, OK, exclamation: O caminho do emulador tem espaços e o disco não tem um nome curto para ele.\r\n"
      "Se os jogos não abrirem, mude o emulador para um diretório sem espaços.\r\n\r\n"_ansi;
  for (const auto& [curtos, programa, arquivo, gravado, configuracao] : casos) {
    Reset();
    if (!curtos) KeepNoShortNames();
    SetProgramDirectory(programa);
    PutFile(arquivo, "MZ");
    Abrir();
    Outro(arquivo);
    Gravar();
    EXPECT_EQ(Gravados(), (Texts{"\\Roms\\", "\\Saves\\", "\\Imgs\\", gravado, configuracao})) << arquivo;
    EXPECT_EQ(TakeMessages(), curtos ? Texts() : Texts{aviso + arquivo});
  }
  PutFile("C:\\E\\zsnes.cfg", "x");
  EXPECT_EQ(ConfiguracaoDoEmulador("C:\\E\\outro.exe"), "C:\\E\\zsnes.cfg") << "the one that is there";
}

TEST_F(Janela, AnotherEmulatorIsChosenWithTheDialogAndWhatCannotBeUsedIsRefused) {
  const std::string longo = "C:\\" + std::string(120, 'a') + "\\" + std::string(121, 'b') + "\\";
  for (const std::string& arquivo : {"C:\\Outro\\zsnes.exe"s, longo + "z.exe"}) PutFile(arquivo, "MZ");
  PutFile("C:\\Outro\\vazio.exe", "");
  AbrirEProcurar();
  for (const char* arquivo : {"C:\\Outro\\zsnes.exe", "", "C:\\TOLVARIS\\zsnes\\ZSNESW.EXE"}) Outro(arquivo);
  EXPECT_EQ(form->List1.Count(), 2) << "nothing when it is cancelled, and nothing twice";
  EXPECT_EQ(form->Label4[0].Caption(), Emulador) << "the last one that was chosen";
  const auto& pedido = ShownFileDialogs().back();
  EXPECT_EQ(pedido.InitialDirectory, "C:\\Outro\\");
  EXPECT_EQ(pedido.Title + pedido.Filter,
            "Procurar emuladorEmulador ZSnes (zsnes*.exe)\0zsnes*.exe\0Programas (*.exe)\0*.exe\0"s);
  const std::string demais = Error + "O caminho é longo demais: o Tolvaris lê no máximo 254 caracteres.\r\n\r\n"_ansi;
  for (const auto& [arquivo, mensagem] :
       {std::pair("C:\\Outro\\vazio.exe"s, Error + "O emulador ZSnes não foi encontrado."_ansi),
        {longo + "z.exe", demais + longo + "zsnesw.cfg"}}) {
    Outro(arquivo);
    Gravar();
    EXPECT_EQ(TakeMessages(), Texts{mensagem});
    EXPECT_TRUE(Gravados() == Nada && !form->IsClosed());
  }
  EXPECT_EQ(Impedimento(std::string(254, 'x')), std::nullopt);
  EXPECT_EQ(Impedimento("\\\\servidor\\zsnes\\zsnesw.exe"), Mensagem::CaminhoEmRede)
      << "read as relative to the program's directory";
}

// The emulator's configuration file in the newer form.
const std::string Antes = "x=1\r\nROMPath=\"\"\r\nSRAMPath=\"\"\r\n";
const std::string Depois = "x=1\r\nROMPath=\"C:\\\\Tolvaris\\\\Roms\"\r\nSRAMPath=\"C:\\\\Tolvaris\\\\Saves\"\r\n";

TEST_F(Janela, TheDirectoriesOfTheNewerFormAreSetOnRequest) {
  const std::string antiga = "SaveDirectory = C:\\S\r\n";
  const Texts pergunta = {
      "Confirmar, Yes/No/Cancel, question: Este emulador guarda a configuração em uma forma mais nova, que o Tolvaris "
      "não altera ao jogar.\r\n"
      "Com ele a opção de usar disquete não tem efeito.\r\n\r\n"
      "Gravar agora nessa configuração os diretórios de jogos e de salvamentos do Tolvaris ?"_ansi};
  const std::tuple<std::string, Answer, std::string, bool> casos[] = {
      // the file before, the answer to the question, the file afterwards, and whether the settings are written
      {Antes, Answer::Cancel, Antes, false}, {Antes, Answer::No, Antes, true},   {Antes, Answer::Yes, Depois, true},
      {Depois, Answer::Ok, Depois, true},    {antiga, Answer::Ok, antiga, true},
  };
  for (const auto& [antes, resposta, depois, grava] : casos) {
    PutFile(Configuracao, antes);
    AbrirEProcurar();
    QueueAnswer(resposta);
    Gravar();
    EXPECT_EQ(TakeMessages(), antes == Antes ? pergunta : Texts()) << antes;
    EXPECT_EQ(Content(Configuracao), depois);
    EXPECT_EQ(Gravados(), grava ? Padroes : Nada);
    EXPECT_EQ(form->IsClosed(), grava);
  }
}

// Whatever fails: the file is the old or the new one, whole, and what is not as it was asked for has been said.
TEST_F(Janela, EveryFaultLeavesWholeFilesAndIsSaid) {
  bool fechou = false;
  std::size_t abertos = 0;
  const auto preparar = [this] {
    PutFile(Emulador, "MZ");
    PutFile(Configuracao, Antes);
    AbrirEProcurar();
    QueueAnswer(Answer::Yes);
  };
  const auto operar = [&] {
    Gravar();
    fechou = form->IsClosed();
    abertos = OpenFiles() + OpenRegistryHandles();
    CutPower();
  };
  const auto conferir = [&] {
    const std::string conteudo = Content(Configuracao).value_or("");
    EXPECT_TRUE(conteudo == Antes || conteudo == Depois) << conteudo;
    const Texts mensagens = TakeMessages();
    EXPECT_EQ(fechou, mensagens.empty() || !mensagens.back().starts_with("Erro, "));
    EXPECT_TRUE(Gravados() == Padroes || (Gravados()[4] == "-" && !fechou)) << "configured is only what is complete";
    EXPECT_EQ(abertos, 0U);
  };
  EXPECT_GT(WithEachFault(preparar, operar, conferir), 20);
}

}  // namespace
