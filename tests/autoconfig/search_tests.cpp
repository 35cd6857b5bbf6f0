#include "autoconfig/procura.h"
#include "tests/autoconfig/programs.h"
#include "tests/fresh_machine.h"

namespace {

struct Search : FreshMachine {
  Texts FindAll(std::vector<Lugar> places) {
    Procura search(std::move(places));
    Texts found;
    for (steps = 0; !search.Terminou() && steps < 100000; ++steps) {
      for (const std::string& each : search.Passo()) found.push_back(each);
    }
    return found;
  }

 protected:
  int steps = 0;
};

TEST_F(Search, UsualPlacesInTheOrderOfTheirLikelihood) {
  AddDisk('D', 1 << 20);
  AddDisk('A', 1 << 20);
  SetEnvironment("programfiles", "C:\\Prog");
  SetEnvironment("ProgramFiles(x86)", "C:\\Prog 32\\");
  SetEnvironment("ProgramW6432", "E:");
  SetEnvironment("Path", ";\"D:\\No caminho\\\"; C:\\Emu no caminho ;\\\\servidor\\zsnes;A:\\zsnes;zsnes;");
  Texts inOrder = {"C:\\Tolvaris\\zsnesw.exe"};
  for (const std::string nearby :
       {"C:\\Tolvaris\\", "C:\\Tolvaris\\B\\", "C:\\Tolvaris\\A\\A\\A\\", "C:\\Prog\\Meu Emu\\", "C:\\Prog\\Um\\Dois\\",
        "C:\\Prog 32\\x\\", "C:\\ZSNES 1.51\\", "C:\\Emu\\1\\2\\", "D:\\Prog\\", "D:\\zsnes\\", "D:\\No caminho\\"}) {
    inOrder.push_back(nearby + "zsnes.exe");
  }
  for (const std::string& file : inOrder) PutFile(file, WindowsProgram);
  for (const std::string distant : {"C:\\Tolvaris\\A\\A\\A\\A", "C:\\Prog\\a\\b\\c", "C:\\Outro", "A:\\zsnes",
                                    "D:\\No caminho\\x", "C:\\Tolvaris\\Escondido"}) {
    PutFile(distant + "\\zsnesw.exe", WindowsProgram);
  }
  SetAttributes("C:\\Tolvaris\\Escondido", 0x12);
  PutFile("C:\\Emu no caminho\\zsnesw.exe", "");    // damaged
  PutDirectory("C:\\Tolvaris\\zsnes\\zsnesw.exe");  // not a file
  EXPECT_EQ(FindAll(LugaresUsuais()), inOrder);
}

TEST_F(Search, LeavesOutProgramsThatOnlyDosCanStart) {
  const std::string beyond = "MZ" + std::string(58, '\0') + "\xFF\xFF\xFF\xFF";
  const std::tuple<const char*, std::string, bool> cases[] = {
      {"for Windows", WindowsProgram, true},
      {"for DOS", DosProgram, false},
      {"for DOS, with more behind the header", DosProgram + "LE and so on", false},
      {"for 16-bit Windows", DosProgram + "NE and so on", false},
      {"whose other header would lie beyond the file", beyond, false},
      {"that is shorter than its header", "MZ", false},
      {"that is none", "#!/bin/sh", true},
  };
  for (const auto& [name, content, found] : cases) {
    PutFile("C:\\Z\\zsnes.exe", content);
    EXPECT_EQ(FindAll({{"C:\\Z\\", 0}}), found ? Texts{"C:\\Z\\zsnes.exe"} : Texts()) << "a program " << name;
  }
}

TEST_F(Search, EndsInAForestWithoutEndAndReportsNothingTwice) {
  for (int i = 0; i < 70 * 70; ++i) PutDirectory("C:\\Z\\" + std::to_string(i / 70) + "\\" + std::to_string(i % 70));
  PutFile("C:\\Z\\7\\zsnes.exe", WindowsProgram);
  PutFile("C:\\P\\Q\\zsnes.exe", WindowsProgram);
  const Texts expected = {"C:\\Z\\7\\zsnes.exe", "C:\\P\\Q\\zsnes.exe"};
  EXPECT_EQ(FindAll({{"C:\\Z\\", 50}, {"c:\\z\\7\\", 0}, {"C:\\P\\Q\\", 0}, {"C:\\p\\q\\", 3}}), expected);
  EXPECT_GT(steps, 1000);
  EXPECT_LT(steps, 4000);
  EXPECT_EQ(FindAll({{"Q:\\", 3}, {"C:\\Nada\\", 3}, {"C:\\Z\\7\\zsnes.exe\\", 3}}), Texts());
  EXPECT_EQ(FindAll({{"C:\\P\\", 0}, {"C:\\P\\", 1}}), Texts{expected[1]}) << "seen again with more levels";
  for (int i = 0; i < 3100; ++i) PutDirectory("C:\\R\\" + std::to_string(i));
  PutFile("C:\\R\\Zsnes\\zsnes.exe", WindowsProgram);
  EXPECT_EQ(FindAll({{"C:\\R\\", 2}}), Texts{"C:\\R\\Zsnes\\zsnes.exe"}) << "likely names go before very many";
  EXPECT_EQ(steps, 1 + 3000) << "the place and the most directories that are looked into at one";
}

}  // namespace
