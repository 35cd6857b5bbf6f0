// A configured installation with three games on the machine in memory, and the main window on it. The list shows them
// in another order than their files have: a row of the list is none of the table's.
#pragma once

#include <map>
#include <memory>
#include <optional>
#include <string>

#include "catalog/cls_DAT.h"
#include "mainwindow/Form1.h"
#include "package/pacote.h"
#include "tests/fresh_machine.h"

using Files = std::map<std::string, std::optional<std::string>>;  // contents by full path

inline const std::string Key = "Software\\Roms\\Tolvaris";
inline const std::string Home = "C:\\Tolvaris\\", Roms = Home + "Roms\\", Imgs = Home + "Imgs\\";
inline const std::string Emulator = "C:\\Emu\\zsnesw.exe", EmulatorConfig = "C:\\Emu\\zsnesw.cfg";
inline const std::string Rom = "123456789";

// A package with the checksum of Rom.
inline std::string Package(const std::string& name, const std::string& dosName, const std::string& picture = "figura",
                           const std::string& rom = Rom) {
  return MontarPacote(name, dosName, "-873187034", static_cast<std::int64_t>(picture.size()),
                      static_cast<std::int64_t>(rom.size()), picture, rom);
}

struct Menu : FreshMachine {
  Menu() { SetUpMachine(); }
  ~Menu() override { End(); }

  void End() {
    form.reset();
    Catalogo().Fechar();
  }

  void SetUpMachine() {
    End();
    Renew();
    for (const char* shown : {"AvisoControle", "AvisoALTF4"}) PutText(Key, shown, "1");
    PutText(Key, "EmuExe", Emulator);
    PutText(Key, "EmuCFG", EmulatorConfig);
    PutFile(Emulator, "MZ");
    PutFile(EmulatorConfig, "x\r\nSaveDirectory = C:\\Somewhere\\else\\before\r\nGameDirectory = C:\\Old2\r\ny");
    PutFile(Home + "tolvaris.dat", "|SUPERJOG=Super Jogo||ULTIMO=Sem figura|");
    for (const char* rom : {"SUPERJOG.zip", "ULTIMO.SMC", "Nome comprido.smc"}) PutFile(Roms + rom, Rom);
    for (const char* picture : {"Super Jogo.gif", "Nome comprido.bmp"}) PutFile(Imgs + picture, "figura");
  }

  // Starts the program; false when it ended before its window was to be shown.
  bool Start() {
    form = std::make_unique<Form1>();
    const bool goesOn = form->Form_Load();
    if (goesOn) form->Show();
    return goesOn;
  }

  // Starts the program and selects a game as the user would.
  void StartAndPick(const std::string& name) {
    ASSERT_TRUE(Start());
    Pick(name);
  }

  void Pick(const std::string& name) const {
    const int index = form->List1.FindExact(name);
    ASSERT_GE(index, 0) << name;
    Choose(form->List1, index);
  }

  // Clicks a command that shows a file dialog, and chooses the path there.
  static void ChooseFile(platform::Button& command, const std::string& path) {
    QueueFileDialog(path);
    Click(command);
  }

  static Files Standing() {
    Files files;
    for (const std::string& path : AllFiles()) files[path] = Content(path);
    return files;
  }

  std::string Selected() const { return form->List1.Text(form->List1.Selected()); }

  // The controls that are enabled, and "picture" when one is shown.
  std::string States() const {
    const std::pair<const char*, const platform::Control*> controls[] = {
        {"play ", &form->Command1},   {"saves ", &form->Command2},  {"download ", &form->Command3},
        {"import ", &form->Command4}, {"export ", &form->Command5}, {"delete ", &form->Command6},
        {"floppy ", &form->Check1},   {"list ", &form->List1},
    };
    std::string states;
    for (const auto& [name, control] : controls) states += control->Enabled() ? name : "";
    return states + (form->Image1.Visible() ? "picture" : "");
  }

 protected:
  std::unique_ptr<Form1> form;
};

inline constexpr char NothingSelected[] = "saves download import floppy list picture";
inline constexpr char GameSelected[] = "play saves download import export delete floppy list picture";
inline constexpr char Busy[] = "list picture";
