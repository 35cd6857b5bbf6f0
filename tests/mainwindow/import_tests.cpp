#include "mainwindow/arquivos_de_jogos.h"
#include "package/pacote.h"
#include "platform/files.h"
#include "tests/mainwindow/menu.h"

namespace menu {
namespace {

const std::string Added = "Ok: Jogo adicionado com sucesso.";
const std::string ReadError = "Erro: Erro ao ler arquivo.";
const std::string WriteError = "Erro: Erro ao gravar arquivo.";
const std::string Corrupt =
    "Erro: Houve uma diferença na medição dos códigos CRC.\r\nEssa mudança indica que o arquivo está corrompido."_ansi;
const std::string Question = "Confirmar: O jogo a ser adiciona já existe.\r\n\r\nSubstituir ?"_ansi;

class Import : public Menu {
 protected:
  // The example package: the checksum of its ROM "123456789" is -873187034.
  static std::string Package(const std::string& name = "Super Jogo", const std::string& dosName = "SUPERJOG",
                             const std::string& rom = "123456789", const std::string& crc = "-873187034") {
    return MontarPacote(name, dosName, crc, 6, static_cast<std::int64_t>(rom.size()), "figura", rom);
  }

  void ImportFile(const std::string& path, const std::string& content) {
    PutFile(path, content);
    QueueFileDialog(path);
    Click(form->Command4);
  }

  std::string Selected() const { return form->List1.Text(form->List1.Selected()); }
};

TEST_F(Import, EveryKindOfFileEndsAsItShould) {
  struct Case {
    std::string Path, Content;
    Texts Messages;
    const char* Selected;
    const char* NewFile;  // in the installation; empty: none
  };
  const Case cases[] = {
      {"D:\\NOVO.SMC", "rom", {Added}, "NOVO", "Roms\\NOVO.SMC"},
      {"D:\\a.b.zip", "zip", {Added}, "a.b", "Roms\\a.b.zip"},
      {"D:\\x.gzip", "zip", {Added}, "", "Roms\\x.gzip"},  // copied, but no name that the list shows
      {"D:\\p.tVk", Package(), {Added}, "Super Jogo", "Roms\\SUPERJOG.zip"},
      {"D:\\longo.tvk", Package("Longo", "LONGO", std::string(1048576, 'x'), "1"), {ReadError}, "", "Roms\\LONGO.zip"},
      {"", "cancelled", {}, "", ""},
      {"D:\\vazio.zip", "", {ReadError}, "", ""},
      {"D:\\semponto", "x", {ReadError}, "", ""},
      {"D:\\x.txt", "x", {}, "", ""},
      {"D:\\nada.tvk", "no package", {ReadError}, "", ""},
      {"D:\\fora.tvk", Package("..\\Jogo"), {ReadError}, "", ""},
      {"D:\\soma.tvk", Package("Super Jogo", "SUPERJOG", "123456788"), {Corrupt}, "", ""},
      {"D:\\curto.tvk", Package().substr(0, 118), {Corrupt}, "", ""},
  };
  for (const Case& each : cases) {
    SetUpMachine();
    AddDisk('D', 100'000'000);
    PutRom("outro.smc");
    ASSERT_TRUE(Start());
    const auto before = AllFiles().size();
    if (!each.Path.empty()) PutFile(each.Path, each.Content);
    QueueFileDialog(each.Path);
    Click(form->Command4);
    EXPECT_EQ(Messages(), each.Messages) << each.Path;
    EXPECT_EQ(Selected(), each.Selected) << each.Path;
    EXPECT_EQ(States(), *each.Selected ? GameSelected : NothingSelected) << each.Path;
    if (*each.NewFile) {
      EXPECT_TRUE(Content(Home + each.NewFile)) << each.Path;
    } else {
      EXPECT_EQ(AllFiles().size(), before + !each.Path.empty()) << each.Path;
    }
    End();
  }
}

TEST_F(Import, APackageBringsNamePictureAndRom) {
  ASSERT_TRUE(Start());
  ImportFile("C:\\p.tvk", Package("Ação | Jogo=CRC"_ansi, "ação"_ansi));
  EXPECT_EQ(Messages(), Texts{ReadError});  // "|" cannot be in a file name: the picture is not written, nor the ROM
  EXPECT_EQ(Content(Home + "Roms\\AÇÃO.zip"_ansi), std::nullopt);
  ImportFile("C:\\p.tvk", Package("Ação=Jogo"_ansi, "ação"_ansi));
  EXPECT_EQ(Content(Home + "Imgs\\Ação=Jogo.gif"_ansi), "figura");
  EXPECT_EQ(Catalogue(), "|AÇÃO=Ação=Jogo|"_ansi);
  EXPECT_EQ(Selected(), "Ação=Jogo"_ansi);
  const auto asked = ShownFileDialogs().at(0);
  EXPECT_EQ(asked.Title, "Adicionar...");
  EXPECT_EQ(asked.Filter, std::string("Arquivos suportados\0*.zip;*.smc;*.tvk\0", 38));
  EXPECT_EQ(asked.Flags, 4U);
}

TEST_F(Import, AGameThatIsThereIsReplacedOnlyOnYes) {
  PutCatalogue("|SUPERJOG=Super Jogo|");
  PutRom("SUPERJOG.ZIP", "old");
  PutFile(Home + "Imgs\\super jogo.gif", "old");
  ASSERT_TRUE(Start());
  for (const Answer answer : {Answer::No, Answer::Cancel}) {
    QueueAnswer(answer);
    ImportFile("C:\\p.tvk", Package("SUPER jogo"));
    EXPECT_EQ(Messages(), Texts{Question});
    EXPECT_EQ(Content(Home + "Roms\\SUPERJOG.ZIP"), "old");
    EXPECT_EQ(States(), NothingSelected);
  }
  // A damaged package replaces nothing.
  QueueAnswer(Answer::Yes);
  ImportFile("C:\\p.tvk", Package("Super Jogo", "SUPERJOG", "987654321"));
  EXPECT_EQ(Messages(), (Texts{Question, Corrupt}));
  EXPECT_EQ(Content(Home + "Roms\\SUPERJOG.ZIP"), "old");
  EXPECT_EQ(Content(Home + "Imgs\\super jogo.gif"), "old");

  QueueAnswer(Answer::Yes);
  ImportFile("C:\\p.tvk", Package());
  EXPECT_EQ(Messages(), (Texts{Question, Added}));
  EXPECT_EQ(Content(Home + "Roms\\SUPERJOG.ZIP"), "123456789");
  EXPECT_EQ(Catalogue(), "|SUPERJOG=Super Jogo|");
  EXPECT_EQ(Selected(), "Super Jogo");
}

// With any one call failing, the collection holds only whole files, and the person is told one thing.
TEST_F(Import, NoFailureLeavesHalfAGame) {
  for (const bool package : {false, true}) {
    for (int n = 1;; ++n) {
      PutRom("SUPERJOG.ZIP", "old");
      PutFile(Home + "Imgs\\Super Jogo.gif", "old");
      PutCatalogue("|A=B|");
      ASSERT_TRUE(Start());
      const std::string path = package ? "C:\\p.tvk" : "C:\\SUPERJOG.ZIP";
      PutFile(path, package ? Package() : "123456789");
      QueueFileDialog(path);
      FailCall(n);
      Click(form->Command4);
      const bool failed = CallFailed();
      FailCall(0);
      const std::string rom = Content(Home + "Roms\\SUPERJOG.ZIP").value_or("(none)");
      EXPECT_TRUE(rom == "old" || rom == "123456789") << n << ": " << rom;
      const std::string picture = Content(Home + "Imgs\\Super Jogo.gif").value_or("(none)");
      EXPECT_TRUE(picture == "old" || picture == "figura") << n << ": " << picture;
      const std::string catalogue = Catalogue();
      EXPECT_TRUE(catalogue == "|A=B|" || catalogue == "|A=B||SUPERJOG=Super Jogo|") << n << ": " << catalogue;
      const Texts shown = Messages();
      EXPECT_LE(shown.size(), 1U) << n;
      EXPECT_TRUE(shown != Texts{Added} || rom == "123456789") << n;
      EXPECT_TRUE(form->Command4.Enabled()) << n;
      End();
      if (!failed) break;
    }
  }
}

TEST_F(Import, AFullDiskIsToldAndCostsNothing) {
  PutRom("cheio.smc", "old");
  ASSERT_TRUE(Start());
  AddDisk('D', 100'000);
  PutFile("D:\\cheio.smc", std::string(5000, 'n'));
  SetFreeSpace('C', 100);
  QueueFileDialog("D:\\cheio.smc");
  Click(form->Command4);
  EXPECT_EQ(Messages(), Texts{WriteError});
  EXPECT_EQ(Content(Home + "Roms\\cheio.smc"), "old");
  const auto files = AllFiles().size();
  PutFile("D:\\novo.smc", std::string(5000, 'n'));
  QueueFileDialog("D:\\novo.smc");
  Click(form->Command4);
  EXPECT_EQ(Messages(), Texts{WriteError});
  EXPECT_EQ(AllFiles().size(), files + 1);  // only the source: nothing half-written stays
}

}  // namespace
}  // namespace menu
