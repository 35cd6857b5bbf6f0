// A configured installation with three games on the machine in memory, and the main window on it.
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
    PutFile(Home + "tolvaris.dat", "|SUPERJOG=Super Jogo||SEMFIG=Sem figura|");
    for (const char* rom : {"SUPERJOG.zip", "SEMFIG.SMC", "Nome comprido.smc"}) PutFile(Roms + rom, Rom);
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

  // The commands that are enabled by their numbers, then "k" for Check1, "l" for the list and "i" for a shown picture.
  std::string States() const {
    const platform::Control* controls[] = {&form->Command1, &form->Command2, &form->Command3, &form->Command4,
                                           &form->Command5, &form->Command6, &form->Check1,   &form->List1};
    std::string letters;
    for (std::size_t i = 0; i < std::size(controls); ++i) letters.append(controls[i]->Enabled() ? 1 : 0, "123456kl"[i]);
    if (form->Image1.Visible()) letters += 'i';
    return letters;
  }

  std::unique_ptr<Form1> form;
};

inline constexpr char NothingSelected[] = "234kli", GameSelected[] = "123456kli", Busy[] = "li";
