// The only window of the auto-configuration program: the emulators found, and what will be written to the settings.
#pragma once

#include <deque>
#include <string>
#include <vector>

#include "autoconfig/ajustes.h"
#include "platform/controls.h"
#include "support/cls_REG.h"

class FormCfg : public platform::Window {
 public:
  FormCfg();

  // Reads the settings and translates the window. The search begins with the timer, once the window is shown.
  void Form_Load();

  // --- Controls, in tab order.
  platform::Label Label1;              // above the list
  platform::ListBox List1;             // the emulators
  platform::Label Label2;              // how the search goes
  platform::Button Command3;           // choose another emulator
  platform::Frame Frame1;              // what will be written
  std::deque<platform::Label> Label3;  // its captions; a deque, because a label cannot be moved
  std::deque<platform::Label> Label4;  // its paths
  platform::Button Command1;           // save
  platform::Button Command2;           // cancel
  platform::Timer Timer1;              // begins the search

  // --- Handlers.
  void Timer1_Tick();
  void List1_Click();
  void List1_KeyDown(int KeyCode);
  void Command1_Click();
  void Command2_Click();
  void Command3_Click();

 private:
  void TraduzirControles();
  void Procurar();

  // Adds an emulator that the list does not have yet. Its place in the list.
  int Acrescentar(const std::string& Emulador);
  // The same, and selects it when nothing is selected yet.
  void Propor(const std::string& Emulador);

  void Selecionar(int Indice);
  void MostrarEscolha();
  std::string Selecionado() const;  // full path; empty when none is

  // Save (FormCfg_gravar.cpp). Each step is false when nothing more is to be written.
  bool Conferir(const Ajustes& Novos) const;
  bool PrepararConfiguracao(const Ajustes& Novos) const;

  Ajustes AjustesEscolhidos() const;

  cls_REG registro_;
  Ajustes atuais_;                       // as the settings were at the start
  std::vector<std::string> emuladores_;  // full paths, in the order of List1
  std::string proposto_;                 // the emulator that was selected without the person
};
