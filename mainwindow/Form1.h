// The main window: the list of games, the picture of the chosen one, and the commands.
#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

#include "collection/jogo.h"
#include "platform/controls.h"
#include "platform/files.h"
#include "platform/pictures.h"
#include "support/cls_REG.h"

class Form1 : public platform::Window {
 public:
  Form1();

  // Start-up: settings, catalogue, translation, list. False when the program is to end before the window is shown; the
  // window is closed then.
  bool Form_Load();

  // --- Controls.
  platform::ListBox List1;           // the games, by name
  platform::Button Command1;         // play
  platform::CheckBox Check1;         // keep the emulator's saves on floppy
  platform::Button Command2;         // save-file manager
  platform::Button Command3;         // downloader
  platform::Button Command4;         // import
  platform::Button Command5;         // export
  platform::Button Command6;         // delete
  platform::ImageBox Image1;         // picture of the chosen game
  platform::Timer Timer1;            // waits for the downloader
  const platform::Picture Picture1;  // the picture of a game that has none

  // --- List and busy state (Form1_lista.cpp).

  // Rebuilds the list from the ROM directory. With IgnorarUltimo nothing is selected afterwards, else the last game
  // played, when it is in the list.
  void CarregarLista(bool IgnorarUltimo);

  // Disables the commands around a long operation; with Total also the list, and hides the picture.
  void Desativar(bool Total = false);

  // Enables the list and the commands again; those on a game (play, export, delete) only when one is selected and
  // NemTudo is false.
  void Ativar(bool NemTudo = false);

  bool InList1(const std::string& Entrada) const;  // an entry equals the text, without regard to letter case

  // Selects the entry that equals the text, as a click of the user would; no entry when none does.
  void SelecionarNome(const std::string& Nome);

  // --- Preview and look-ups (Form1_previa.cpp).

  void MostrarImagem();                                         // the picture of the selected game, or the default one
  std::string CaminhoImagem(int Linha) const;                   // picture file of a row of Jogos, or the empty text
  int IndiceJogo(const std::string& Nome) const;                // first row of that name in any letter case, or -1
  static std::string CaminhoCurto(const std::string& Caminho);  // 8.3 form, or the path itself
  static bool DisqueteNoDrive();                                // a disk is ready in drive A:

  // --- Handlers.
  void Form_Help();  // F1: the controller help, unless a command is under way
  void Form_Unload();
  void List1_Click();
  void List1_DblClick();
  void List1_KeyDown(int KeyCode);
  void Timer1_Tick();
  void Command1_Click();
  void Command2_Click();
  void Command3_Click();
  void Command4_Click();
  void Command5_Click();
  void Command6_Click();

  // The game table, in ascending order of the file names. An empty ROM directory leaves it as it was.
  std::vector<Jogo> Jogos;

  bool JogoIniciado = false;  // the emulator has been started in this run

  cls_REG Registro;

 private:
  // Start-up (Form1_inicio.cpp).
  enum class Configuracao { Pronta, Repetir, Desistir };
  void RestaurarJanela();
  Configuracao VerificarConfiguracao();
  void TraduzirControles();
  void MostrarControleNaPrimeiraVez();

  // Settings.
  std::string LerTexto(const std::string& Ajuste) const;  // empty when it is not set
  void GravarAjuste(const std::string& Ajuste, const std::string& Texto) const;

  // List.
  void EncherLista(const std::vector<platform::DirectoryEntry>& Arquivos);
  void SelecionarUltimo();

  // Play (Form1_jogar.cpp).
  bool EsperarDisquete();  // false: the user gave up
  std::optional<std::string> DirSavesDoJogo();
  void AvisarALTF4();
  void GravarPartida(const std::string& UltimoJogo);
  void IniciarEmulador(const Jogo& Escolhido);

  // A copy of the selected game's row (pending events may rebuild the table) when it and its ROM file are there and can
  // be reached; otherwise says what is missing.
  std::optional<Jogo> JogoSelecionado() const;

  std::string NomeSelecionado() const;  // text of the selected entry; empty when there is none

  // Export and delete.
  void Exportar(const Jogo& Escolhido);
  void SelecionarVizinho(int IndiceAntigo);
};
