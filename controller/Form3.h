// The controller help window: which keys play the controller's buttons.
#pragma once

#include <deque>

#include "platform/controls.h"

class Form3 : public platform::Window {
 public:
  // Opens a fresh window over the program's other ones and returns when it is closed.
  static void ABRIR();

  // Closes the window, should it be open.
  static void Descarregar();

  // Writes the key names of the chosen player beside the buttons; nothing when no player is chosen.
  void MostrarTeclas();

  void Combo1_Click();
  void Timer1_Tick();
  void Command1_Click();

  platform::ComboBox Combo1;
  platform::Button Command1;
  std::deque<platform::Label> Label1;  // in the order of Teclas; a deque, because a label cannot be moved
  platform::Timer Timer1;

 private:
  Form3();
  void Preparar();
};
