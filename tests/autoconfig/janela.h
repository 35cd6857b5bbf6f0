// A machine in memory with an emulator, and the auto-configuration window on it.
#pragma once

#include <gtest/gtest.h>

#include <memory>
#include <string>
#include <vector>

#include "autoconfig/FormCfg.h"
#include "platform/simulated/simulated.h"
#include "platform/text.h"

namespace janela {

using namespace platform::simulated;  // NOLINT(google-build-using-namespace)
using platform::Answer;
using platform::Buttons;
using platform::Icon;
using Textos = std::vector<std::string>;

inline const std::string Chave = "Software\\Roms\\Tolvaris";
inline const std::string Emulador = "C:\\Tolvaris\\ZSNES\\zsnesw.exe";

class Janela : public testing::Test {
 protected:
  Janela() {
    Reset();
    PutFile(Emulador, "MZ");
  }

  void Abrir() {
    form = std::make_unique<FormCfg>();
    form->Form_Load();
    form->Show();
  }

  void AbrirEProcurar() {
    Abrir();
    Tick(form->Timer1);
  }

  void Gravar() { Click(form->Command1); }

  // RomDir, SaveDir, ImgDir, EmuExe and EmuCFG as they are stored; "-": not set.
  static Textos Gravados() {
    Textos textos;
    for (const NomeDeAjuste& cada : NomesDosAjustes) textos.push_back(StoredText(Chave, cada.Nome).value_or("-"));
    return textos;
  }
  static inline const Textos Nada = Textos(5, "-");

  Textos Lista() const {
    Textos textos;
    for (int i = 0; i < form->List1.Count(); ++i) textos.push_back(form->List1.Text(i));
    return textos;
  }

  Textos Mostrados() const {
    Textos textos;
    for (const platform::Label& cada : form->Label4) textos.push_back(cada.Caption());
    return textos;
  }

  // The messages shown since the last call, as "title: text".
  static Textos Mensagens() {
    Textos textos;
    for (const ShownMessage& cada : ShownMessages()) textos.push_back(cada.Title + ": " + cada.Text);
    ForgetMessages();
    return textos;
  }

  std::unique_ptr<FormCfg> form;
};

}  // namespace janela
