#include "autoconfig/procura.h"
#include "tests/fresh_machine.h"

namespace {

struct Procurando : FreshMachine {
  Texts Tudo(std::vector<Lugar> lugares) {
    Procura busca(std::move(lugares));
    Texts achados;
    for (passos = 0; !busca.Terminou() && passos < 100000; ++passos) {
      for (const std::string& achado : busca.Passo()) achados.push_back(achado);
    }
    return achados;
  }

  int passos = 0;
};

TEST_F(Procurando, UsualPlacesInTheOrderOfTheirLikelihood) {
  AddDisk('D', 1 << 20);
  AddDisk('A', 1 << 20);
  SetEnvironment("programfiles", "C:\\Prog");
  SetEnvironment("ProgramFiles(x86)", "C:\\Prog 32\\");
  SetEnvironment("ProgramW6432", "E:");
  SetEnvironment("Path", ";\"D:\\No caminho\\\"; C:\\Emu no caminho ;\\\\servidor\\zsnes;A:\\zsnes;zsnes;");
  Texts emOrdem = {"C:\\Tolvaris\\zsnesw.exe"};
  for (const std::string perto :
       {"C:\\Tolvaris\\", "C:\\Tolvaris\\B\\", "C:\\Tolvaris\\A\\A\\A\\", "C:\\Prog\\Meu Emu\\", "C:\\Prog\\Um\\Dois\\",
        "C:\\Prog 32\\x\\", "C:\\ZSNES 1.51\\", "C:\\Emu\\1\\2\\", "D:\\Prog\\", "D:\\zsnes\\", "D:\\No caminho\\"}) {
    emOrdem.push_back(perto + "zsnes.exe");
  }
  for (const std::string& arquivo : emOrdem) PutFile(arquivo, "MZ");
  for (const std::string longe : {"C:\\Tolvaris\\A\\A\\A\\A", "C:\\Prog\\a\\b\\c", "C:\\Outro", "A:\\zsnes",
                                  "D:\\No caminho\\x", "C:\\Tolvaris\\Escondido"}) {
    PutFile(longe + "\\zsnesw.exe", "MZ");
  }
  SetAttributes("C:\\Tolvaris\\Escondido", 0x12);
  PutFile("C:\\Emu no caminho\\zsnesw.exe", "");    // damaged
  PutDirectory("C:\\Tolvaris\\zsnes\\zsnesw.exe");  // not a file
  EXPECT_EQ(Tudo(LugaresUsuais()), emOrdem);
}

TEST_F(Procurando, EndsInAForestWithoutEndAndReportsNothingTwice) {
  for (int i = 0; i < 70 * 70; ++i) PutDirectory("C:\\Z\\" + std::to_string(i / 70) + "\\" + std::to_string(i % 70));
  PutFile("C:\\Z\\7\\zsnes.exe", "MZ");
  PutFile("C:\\P\\Q\\zsnes.exe", "MZ");
  const Texts esperados = {"C:\\Z\\7\\zsnes.exe", "C:\\P\\Q\\zsnes.exe"};
  EXPECT_EQ(Tudo({{"C:\\Z\\", 50}, {"c:\\z\\7\\", 0}, {"C:\\P\\Q\\", 0}, {"C:\\p\\q\\", 3}}), esperados);
  EXPECT_TRUE(passos > 1000 && passos < 4000) << passos;
  EXPECT_EQ(Tudo({{"Q:\\", 3}, {"C:\\Nada\\", 3}, {"C:\\Z\\7\\zsnes.exe\\", 3}}), Texts());
  EXPECT_EQ(Tudo({{"C:\\P\\", 0}, {"C:\\P\\", 1}}), Texts{esperados[1]}) << "seen again with more levels";
  for (int i = 0; i < 3100; ++i) PutDirectory("C:\\R\\" + std::to_string(i));
  PutFile("C:\\R\\Zsnes\\zsnes.exe", "MZ");
  EXPECT_EQ(Tudo({{"C:\\R\\", 2}}), Texts{"C:\\R\\Zsnes\\zsnes.exe"}) << "likely names go before very many";
}

}  // namespace
