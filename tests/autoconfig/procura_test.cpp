#include "autoconfig/procura.h"

#include <gtest/gtest.h>

#include "platform/simulated/simulated.h"
#include "support/mod_Globais.h"

namespace {

using namespace platform::simulated;  // NOLINT(google-build-using-namespace)
using Textos = std::vector<std::string>;

class Procurando : public testing::Test {
 protected:
  Procurando() {
    Reset();
    DirPrograma = "C:\\Tolvaris\\";
  }

  static Textos Tudo(std::vector<Lugar> lugares) {
    Procura busca(std::move(lugares));
    Textos achados;
    for (passos = 0; !busca.Terminou() && passos < 100000; ++passos) {
      for (const std::string& achado : busca.Passo()) achados.push_back(achado);
    }
    EXPECT_EQ(busca.Passo(), Textos());
    return achados;
  }

  static inline int passos = 0;
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
                            "C:\\Outro\\zsnesw.exe", "A:\\zsnes\\zsnesw.exe", "D:\\No caminho\\x\\zsnesw.exe"}) {
    PutFile(longe, "MZ");
  }
  PutFile("C:\\Emu no caminho\\zsnesw.exe", "");    // damaged
  PutDirectory("C:\\Tolvaris\\zsnes\\zsnesw.exe");  // not a file
  PutFile("C:\\Tolvaris\\Escondido\\zsnesw.exe", "MZ");
  SetAttributes("C:\\Tolvaris\\Escondido", 0x12);
  EXPECT_EQ(Tudo(LugaresUsuais()), emOrdem);
}

TEST_F(Procurando, EndsInAForestWithoutEndAndReportsNothingTwice) {
  for (int i = 0; i < 70; ++i) {
    for (int j = 0; j < 70; ++j) PutDirectory("C:\\Z\\" + std::to_string(i) + "\\" + std::to_string(j));
  }
  PutFile("C:\\Z\\7\\zsnes.exe", "MZ");
  PutFile("C:\\Depois\\zsnes.exe", "MZ");
  const Textos esperados = {"C:\\Z\\7\\zsnes.exe", "C:\\Depois\\zsnes.exe"};
  EXPECT_EQ(Tudo({{"C:\\Z\\", 50}, {"c:\\z\\7\\", 0}, {"C:\\Depois\\", 0}, {"C:\\depois\\", 3}}), esperados);
  EXPECT_GT(passos, 1000);
  EXPECT_LT(passos, 4000);
  EXPECT_EQ(Tudo({{"Q:\\", 3}, {"C:\\Nada\\", 3}, {"C:\\Z\\7\\zsnes.exe\\", 3}}), Textos());
}

TEST_F(Procurando, LikelyNamesAreNotLeftOutAmongVeryMany) {
  for (int i = 0; i < 3100; ++i) PutDirectory("C:\\P\\" + std::to_string(i));
  PutFile("C:\\P\\Zsnes 1.42\\zsnes.exe", "MZ");
  EXPECT_EQ(Tudo({{"C:\\P\\", 2}}), Textos{"C:\\P\\Zsnes 1.42\\zsnes.exe"});
}

// A place that is seen again with more levels is gone into as deep as that.
TEST_F(Procurando, TheDeeperSearchCounts) {
  PutFile("C:\\P\\Q\\zsnes.exe", "MZ");
  EXPECT_EQ(Tudo({{"C:\\P\\", 0}, {"C:\\", 2}}), Textos{"C:\\P\\Q\\zsnes.exe"});
}

}  // namespace
