#include <gtest/gtest.h>

#include "autoconfig/procura.h"
#include "platform/simulated/simulated.h"
#include "support/mod_Globais.h"

namespace {

using namespace platform::simulated;  // NOLINT(google-build-using-namespace)
using Textos = std::vector<std::string>;

struct Procurando : testing::Test {
  void SetUp() override { Reset(), DirPrograma = "C:\\Tolvaris\\"; }

  Textos Tudo(std::vector<Lugar> lugares) {
    Procura busca(std::move(lugares));
    Textos achados;
    for (passos = 0; !busca.Terminou() && passos < 100000; ++passos) {
      for (const std::string& achado : busca.Passo()) achados.push_back(achado);
    }
    EXPECT_EQ(busca.Passo(), Textos());
    return achados;
  }

  int passos = 0;
};

TEST_F(Procurando, UsualPlacesInTheOrderOfTheirLikelihood) {
  AddDisk('D', 1 << 20);
  AddDisk('A', 1 << 20);
  SetEnvironment("programfiles", "C:\\Arquivos de Programas");
  SetEnvironment("ProgramFiles(x86)", "C:\\Programas 32\\");
  SetEnvironment("ProgramW6432", "E:");
  SetEnvironment("Path", ";\"D:\\No caminho\\\"; C:\\Emu no caminho ;\\\\servidor\\zsnes;A:\\zsnes;zsnes;");
  const Textos emOrdem = {
      "C:\\Tolvaris\\zsnesw.exe",
      "C:\\Tolvaris\\zsnes.exe",
      "C:\\Tolvaris\\B\\zsnes.exe",
      "C:\\Tolvaris\\A\\A\\A\\zsnesw.exe",
      "C:\\Arquivos de Programas\\Meu Emulador\\zsnesw.exe",
      "C:\\Arquivos de Programas\\Jogos\\Outro\\zsnes.exe",
      "C:\\Programas 32\\x\\zsnesw.exe",
      "C:\\ZSNES 1.51\\zsnesw.exe",
      "C:\\Emulador\\um\\dois\\zsnes.exe",
      "D:\\Arquivos de Programas\\zsnesw.exe",
      "D:\\zsnes\\zsnes.exe",
      "D:\\No caminho\\zsnesw.exe",
  };
  for (const std::string& arquivo : emOrdem) PutFile(arquivo, "MZ");
  for (const char* longe : {"C:\\Tolvaris\\A\\A\\A\\A\\zsnesw.exe", "C:\\Arquivos de Programas\\a\\b\\c\\zsnes.exe",
                            "C:\\Outro\\zsnesw.exe", "A:\\zsnes\\zsnesw.exe", "D:\\No caminho\\x\\zsnesw.exe",
                            "C:\\Tolvaris\\Escondido\\zsnesw.exe"}) {
    PutFile(longe, "MZ");
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
  const Textos esperados = {"C:\\Z\\7\\zsnes.exe", "C:\\P\\Q\\zsnes.exe"};
  EXPECT_EQ(Tudo({{"C:\\Z\\", 50}, {"c:\\z\\7\\", 0}, {"C:\\P\\Q\\", 0}, {"C:\\p\\q\\", 3}}), esperados);
  EXPECT_TRUE(passos > 1000 && passos < 4000) << passos;
  EXPECT_EQ(Tudo({{"Q:\\", 3}, {"C:\\Nada\\", 3}, {"C:\\Z\\7\\zsnes.exe\\", 3}}), Textos());
  EXPECT_EQ(Tudo({{"C:\\P\\", 0}, {"C:\\P\\", 1}}), Textos{esperados[1]}) << "seen again with more levels";
  for (int i = 0; i < 3100; ++i) PutDirectory("C:\\R\\" + std::to_string(i));
  PutFile("C:\\R\\Zsnes 1.42\\zsnes.exe", "MZ");
  EXPECT_EQ(Tudo({{"C:\\R\\", 2}}), Textos{"C:\\R\\Zsnes 1.42\\zsnes.exe"}) << "likely names go before very many";
}

}  // namespace
