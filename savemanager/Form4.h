// The save-file manager: the emulator's save files on the floppy disk and on the computer, copied and deleted under the
// names of their games.
#pragma once

#include <array>
#include <cstdint>
#include <string>

#include "platform/controls.h"
#include "support/mensagens.h"
#include "support/textos.h"

// Where the picked entry lies, and so which way a copy would go.
enum class Origem : std::uint8_t { Nenhuma = 0, Disquete = 1, Computador = 2 };

class Form4 : public platform::Window {
 public:
  // Opens a fresh window over the program's other ones and returns when it is closed.
  static void Mostrar();

  // Read the pane's directory again. Nothing is picked afterwards, whichever pane the entry was in.
  void ListarDisquete();
  void ListarComputador();

  void Form_Load();
  void List1_Click();
  void List2_Click();
  void List1_KeyDown(int KeyCode);
  void List2_KeyDown(int KeyCode);
  void Image1_Click();
  void Image2_Click();
  void Command1_Click();
  void Command2_Click();

  platform::Frame Frame1;
  platform::ListBox List1;
  platform::ImageButton Image1;
  platform::Button Command1;
  platform::Frame Frame2;
  platform::ListBox List2;
  platform::ImageButton Image2;
  platform::Button Command2;

  std::array<std::string, 2> Diretorios;  // of the floppy's and of the computer's pane
  Origem Direcao = Origem::Nenhuma;
  std::string ArquivoAtual;  // the name, without directory, of the file picked last

 private:
  // What differs between the two panes.
  struct Painel {
    Origem Lado;
    const std::string& Diretorio;
    platform::ListBox& Lista;
    platform::ImageButton& Lixeira;
    int Seta;           // on the copy button: the icon of a copy from here
    Texto Copiar;       // and its tool tip
    Mensagem JaExiste;  // here, before a copy replaces it
    Mensagem Deletar;
  };

  Form4();
  const Painel& Outro(const Painel& Este) const { return Este.Lado == Origem::Disquete ? computador_ : disquete_; }
  std::string CaminhoAtual(const Painel& Este) const;

  void Listar(const Painel& Este);
  void Preencher(const Painel& Este);
  void Escolher(const Painel& Este);
  void Copiar(const Painel& De, const Painel& Para);
  void MostrarAndamento(const std::string& Quanto);  // behind the title of a copy
  void RecolherEscolha();
  void Deletar(const Painel& Este);

  const Painel disquete_;
  const Painel computador_;
};
