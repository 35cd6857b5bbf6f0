// The C++ code beside pacote.py, which was written from the format alone: each reads what the other writes, and both
// refuse the same packages.
#include <gtest/gtest.h>
#include <sys/wait.h>
#include <unistd.h>

#include <cstdio>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <string>
#include <string_view>

#include "package/cls_CRC.h"
#include "package/pacote.h"
#include "platform/simulated/simulated.h"
#include "platform/text.h"

namespace {

struct Resposta {
  std::string Texto;  // what was printed
  int Codigo;         // the exit code
};

class PacotePython : public testing::Test {
 protected:
  PacotePython() { std::filesystem::create_directories(Pasta); }
  ~PacotePython() override { std::filesystem::remove_all(Pasta); }

  std::string Caminho(const std::string& nome) const { return Pasta + "/" + nome; }

  void Gravar(const std::string& nome, const std::string& bytes) const {
    std::ofstream(Caminho(nome), std::ios::binary) << bytes;
  }

  std::string Ler(const std::string& nome) const {
    std::ifstream arquivo(Caminho(nome), std::ios::binary);
    return {std::istreambuf_iterator<char>(arquivo), {}};
  }

  Resposta Rodar(const std::string& argumentos) const {
    const std::string comando =
        "cd '" + Pasta + "' && LC_ALL=C.UTF-8 python3 '" TOLVARIS_PACOTE_PY "' " + argumentos + " 2>/dev/null";
    FILE* const cano = popen(comando.c_str(), "r");
    std::string texto;
    for (int letra; (letra = std::fgetc(cano)) != EOF;) texto += static_cast<char>(letra);
    const int estado = pclose(cano);
    return {texto, WIFEXITED(estado) ? WEXITSTATUS(estado) : -1};
  }

 private:
  const std::string Pasta = std::filesystem::temp_directory_path() / ("tolvaris-pacote-" + std::to_string(getpid()));
};

std::string TextoDoCRC(const std::string& rom) {
  platform::simulated::Reset();
  platform::simulated::PutFile("C:\\JOGO.ZIP", rom);
  platform::File arquivo("C:\\JOGO.ZIP", platform::Access::Read);
  const auto valor = cls_CRC().CRC(arquivo);
  return valor ? TextoCRC(*valor) : "none";
}

TEST_F(PacotePython, EachReadsWhatTheOtherWrites) {
  std::string rom(2'500'000, '\0');
  for (std::size_t i = 0; i < rom.size(); ++i) rom[i] = static_cast<char>(i * i >> 7);
  const struct {
    std::string Nome, DOSName, Imagem, Rom;  // the names in UTF-8
  } casos[] = {
      {"Super Jogo", "SUPERJOG", "GIF89a", "123456789"},
      {"Ação & Emoção - não|é=isso", "AÇÃO", std::string("\0\r\n|IMGROMDAT|\0", 14), rom},
      {"", "", "x", std::string(1'048'577, '\0')},
      {"Jogo (B) [!] \"1\"", "JOGO~1", "BM", "\r\n\r\nCRC=1\r\n"},
  };
  for (const auto& [nome, dosName, imagem, conteudo] : casos) {
    const std::string crc = TextoDoCRC(conteudo);
    Gravar("imagem", imagem);
    Gravar("rom", conteudo);
    ASSERT_EQ(Rodar("montar deles '" + nome + "' '" + dosName + "' imagem rom").Codigo, 0) << nome;
    const std::string deles = Ler("deles");
    const auto lido = LerPacote(deles);
    ASSERT_TRUE(lido) << nome;
    EXPECT_EQ(lido->Nome, platform::FromUtf8(nome));
    EXPECT_EQ(lido->DOSName, platform::FromUtf8(dosName));
    EXPECT_EQ(lido->CRC, crc);
    EXPECT_TRUE(lido->Imagem == imagem && lido->Rom == conteudo) << nome;

    Gravar("nosso", MontarPacote(platform::FromUtf8(nome), platform::FromUtf8(dosName), crc,
                                 static_cast<std::int64_t>(imagem.size()), static_cast<std::int64_t>(conteudo.size()),
                                 imagem, conteudo));
    EXPECT_EQ(Rodar("ler nosso imagem2 rom2").Texto, nome + "\n" + dosName + "\n" + crc + "\n" + crc + "\n");
    EXPECT_TRUE(Ler("imagem2") == imagem && Ler("rom2") == conteudo) << nome;
  }
}

TEST_F(PacotePython, BothRefuseTheSamePackages) {
  const std::string_view conteudos[] = {
      "",
      "TOLVARIS",
      "tolvaris nome=A\r\nNOMEDOS=B\r\nCRC=1\r\nIIMG= 1\t\r\ntIMG=01\r\niROM=2\r\ntROM=99\r\n|imgromdat|IR",
      "TOLVARISNOME=A CRC=5\r\nNOMEDOS=B\r\nCRC=1\r\niIMG=1\r\ntIMG=1\r\niROM=2\r\ntROM=1\r\n|IMGROMDAT|IR",
      "TOLVARISNOME=A NOMEDOS=.\\\r\nNOMEDOS=B\r\nCRC=1\r\niIMG=1\r\ntIMG=1\r\niROM=2\r\ntROM=1\r\n|IMGROMDAT|IR",
      "TOLVARISNOME=A\r\nNOMEDOS=Lpt1 .\r\nCRC=1\r\niIMG=1\r\ntIMG=1\r\niROM=2\r\ntROM=1\r\n|IMGROMDAT|IR",
      "TOLVARISNOME=A\r\nNOMEDOS=B\r\nCRC=1\r\niIMG=1\r\ntIMG=0\r\niROM=1\r\ntROM=1\r\n|IMGROMDAT|R",
      "TOLVARISNOME=A\r\nNOMEDOS=B\r\nCRC=1\r\niIMG=1\r\ntIMG=1\r\niROM=2\r\ntROM=2147483648\r\n|IMGROMDAT|IR",
      "TOLVARISNOME=A\r\nNOMEDOS=B\r\nCRC=1\r\niIMG=1\r\ntIMG=1\r\niROM=2\r\ntROM=1|IMGROMDAT|IR",
  };
  int lidos = 0;
  for (const std::string_view conteudo : conteudos) {
    Gravar("pacote", std::string(conteudo));
    const auto nosso = LerPacote(conteudo);
    const Resposta deles = Rodar("ler pacote imagem rom");
    ASSERT_EQ(deles.Codigo, nosso ? 0 : 3) << conteudo;
    if (!nosso) continue;
    ++lidos;
    EXPECT_TRUE(deles.Texto.starts_with(nosso->Nome + "\n" + nosso->DOSName + "\n" + nosso->CRC + "\n")) << conteudo;
    EXPECT_TRUE(Ler("imagem") == nosso->Imagem && Ler("rom") == nosso->Rom) << conteudo;
  }
  EXPECT_EQ(lidos, 2);
}

}  // namespace
