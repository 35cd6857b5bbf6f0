// The C++ code beside pacote.py, which was written from the format alone: each reads what the other writes, and both
// refuse the same packages.
#include <gtest/gtest.h>
#include <sys/wait.h>
#include <unistd.h>

#include <filesystem>
#include <fstream>
#include <iterator>
#include <string>

#include "package/cls_CRC.h"
#include "package/pacote.h"
#include "platform/text.h"

namespace {

class PacotePython : public testing::Test {
 protected:
  PacotePython() { std::filesystem::create_directories(Pasta); }
  ~PacotePython() override { std::filesystem::remove_all(Pasta); }

  void Gravar(const std::string& nome, const std::string& bytes) const {
    std::ofstream(Pasta + "/" + nome, std::ios::binary) << bytes;
  }

  std::string Ler(const std::string& nome) const {
    std::ifstream arquivo(Pasta + "/" + nome, std::ios::binary);
    return {std::istreambuf_iterator<char>(arquivo), {}};
  }

  // The exit code; what was printed is in the file "saida".
  int Rodar(const std::string& argumentos) const {
    const std::string comando = "cd '" + Pasta + "' && LC_ALL=C.UTF-8 python3 '" TOLVARIS_PACOTE_PY "' " + argumentos;
    const int estado = std::system((comando + " >saida 2>/dev/null").c_str());
    return WIFEXITED(estado) ? WEXITSTATUS(estado) : -1;
  }

 private:
  const std::string Pasta = std::filesystem::temp_directory_path() / ("tolvaris-pacote-" + std::to_string(getpid()));
};

TEST_F(PacotePython, EachReadsWhatTheOtherWrites) {
  std::string rom(2'500'000, '\0');
  for (std::size_t i = 0; i < rom.size(); ++i) rom[i] = static_cast<char>(i * i >> 7);
  const std::tuple<std::string, std::string, std::string, std::string> casos[] = {
      // the names in UTF-8
      {"Super Jogo", "SUPERJOG", "GIF89a", "123456789"},
      {"Ação & Emoção - não|é=isso", "AÇÃO", std::string("\0\r\n|IMGROMDAT|\0", 14), rom},
      {"", "", "x", std::string(1'048'577, '\0')},
      {"Jogo (B) [!] \"1\"", "JOGO~1", "BM", "\r\n\r\nCRC=1\r\n"},
  };
  for (const auto& [nome, dosName, imagem, conteudo] : casos) {
    const std::string crc = TextoCRC(cls_CRC().CRC(conteudo).value_or(0));
    const std::string nomeAnsi = platform::FromUtf8(nome), dosNameAnsi = platform::FromUtf8(dosName);
    Gravar("imagem", imagem);
    Gravar("rom", conteudo);
    ASSERT_EQ(Rodar("montar deles '" + nome + "' '" + dosName + "' imagem rom"), 0) << nome;
    const std::string nosso =
        MontarPacote(nomeAnsi, dosNameAnsi, crc, std::ssize(imagem), std::ssize(conteudo), imagem, conteudo);
    const std::string deles = Ler("deles");
    EXPECT_TRUE(deles == nosso) << nome;
    const auto lido = LerPacote(deles);
    ASSERT_TRUE(lido && lido->Imagem == imagem && lido->Rom == conteudo) << nome;
    EXPECT_EQ(lido->Nome + "\n" + lido->DOSName + "\n" + lido->CRC, nomeAnsi + "\n" + dosNameAnsi + "\n" + crc);
    Gravar("nosso", nosso);
    EXPECT_EQ(Rodar("ler nosso imagem2 rom2"), 0) << nome;
    EXPECT_EQ(Ler("saida"), nome + "\n" + dosName + "\n" + crc + "\n" + crc + "\n");
    EXPECT_TRUE(Ler("imagem2") == imagem && Ler("rom2") == conteudo) << nome;
  }
}

TEST_F(PacotePython, BothRefuseTheSamePackages) {
  const std::string fim = "\r\niIMG=1\r\ntIMG=1\r\niROM=2\r\ntROM=1\r\n|IMGROMDAT|IR";
  const std::pair<std::string, bool> conteudos[] = {
      {"", false},
      {"TOLVARIS", false},
      {"tolvaris nome=A\r\nNOMEDOS=B\r\nCRC=1\r\nIIMG= 1\t\r\ntIMG=01\r\niROM=2\r\ntROM=99\r\n|imgromdat|IR", true},
      {"TOLVARISNOME=A CRC=5\r\nNOMEDOS=B\r\nCRC=1" + fim, true},
      {"TOLVARISNOME=A NOMEDOS=.\\\r\nNOMEDOS=B\r\nCRC=1" + fim, false},
      {"TOLVARISNOME=A\r\nNOMEDOS=Lpt1 .\r\nCRC=1" + fim, false},
      {"TOLVARISNOME=A\r\nNOMEDOS=B\r\nCRC=1\r\ntIMG=0" + fim, false},
      {"TOLVARISNOME=A\r\nNOMEDOS=B\r\nCRC=1\r\ntROM=2147483648" + fim, false},
      {"TOLVARISNOME=A\r\nNOMEDOS=B\r\nCRC=1\r\niIMG=1\r\ntIMG=1\r\niROM=2\r\ntROM=1|IMGROMDAT|IR", false},
  };
  for (const auto& [conteudo, aceito] : conteudos) {
    Gravar("pacote", conteudo);
    const auto nosso = LerPacote(conteudo);
    EXPECT_EQ(nosso.has_value(), aceito) << conteudo;
    ASSERT_EQ(Rodar("ler pacote imagem rom"), nosso ? 0 : 3) << conteudo;
    if (!nosso) continue;
    EXPECT_TRUE(Ler("saida").starts_with(nosso->Nome + "\n" + nosso->DOSName + "\n" + nosso->CRC + "\n")) << conteudo;
    EXPECT_TRUE(Ler("imagem") == nosso->Imagem && Ler("rom") == nosso->Rom) << conteudo;
  }
}

}  // namespace
