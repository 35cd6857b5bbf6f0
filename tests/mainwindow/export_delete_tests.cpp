#include "package/pacote.h"
#include "tests/mainwindow/menu.h"

namespace menu {
namespace {

const std::string Saved = "Ok: Arquivo salvo.";
const std::string ReadError = "Erro: Erro ao ler arquivo.";
const std::string WriteError = "Erro: Erro ao gravar arquivo.";
const std::string ExportError = "Erro: Erro ao salvar arquivo.";
const std::string Question = "Confirmar: Arquivo já existente.\r\n\r\nSubstituir ?"_ansi;
const std::string Unknown = "Erro: Erro interno: jogo não encontrado no sistema."_ansi;
const std::string Gone = "Erro: O jogo não foi encontrado."_ansi;

class Export : public Menu {
 protected:
  Export() {
    PutCatalogue("|SUPERJOG=Super Jogo||SEMFIG=Sem figura|");
    PutRom("SUPERJOG.ZIP", "123456789");
    PutRom("SEMFIG.SMC", "123456789");
    PutRom("Solto.smc", "123456789");
    PutFile(Home + "Imgs\\Super Jogo.bmp", "figura");
    PutFile(Home + "Imgs\\Solto.gif", "figura");
  }

  void ExportTo(const std::string& name, const std::string& target) {
    Pick(name);
    QueueFileDialog(target);
    Click(form->Command5);
  }
};

TEST_F(Export, OffersThePackageOnlyForACataloguedGameWithAPicture) {
  using namespace std::string_literals;
  struct Case {
    const char* Name;
    std::string Filter, Extension;
  };
  const Case cases[] = {
      {"Super Jogo", "Arquivo Tolvaris (*.tvk)\0*.tvk\0Arquivo ZIP (*.zip)\0*.zip\0"s, "tvk;zip"},
      {"Sem figura", "Arquivo SMC (*.smc)\0*.smc\0"s, "smc"},
      {"Solto", "Arquivo SMC (*.smc)\0*.smc\0"s, "smc"},
  };
  ASSERT_TRUE(Start());
  for (const Case& each : cases) {
    ExportTo(each.Name, "");
    const auto& asked = ShownFileDialogs().back();
    EXPECT_EQ(asked.Filter, each.Filter) << each.Name;
    EXPECT_EQ(asked.DefaultExtension, each.Extension) << each.Name;
    EXPECT_EQ(asked.Title, "Salvar como...");
    EXPECT_EQ(asked.File.substr(0, asked.File.find_last_not_of(' ') + 1), each.Name);
    EXPECT_EQ(Messages(), Texts{});
    EXPECT_EQ(States(), NothingSelected);  // the game commands wait for the next click
  }
}

TEST_F(Export, TheTargetsEndingDecidesWhatIsWritten) {
  const auto package = [](const char* name, const char* dosName, std::string_view picture) {
    return MontarPacote(name, dosName, "-873187034", static_cast<std::int64_t>(picture.size()), 9, picture,
                        "123456789");
  };
  struct Case {
    const char *Name, *Target;
    std::string Content;
  };
  const Case cases[] = {
      {"Super Jogo", "C:\\x.zip", "123456789"},
      {"Super Jogo", "C:\\x.TvK", package("Super Jogo", "SUPERJOG", "figura")},
      {"Sem figura", "C:\\y.zip", "123456789"},
      {"Sem figura", "C:\\y.tvk", package("Sem figura", "SEMFIG", "")},
      {"Solto", "C:\\z.tvk", package("Solto", "", "figura")},
      {"Solto", "C:\\z", "123456789"},
  };
  ASSERT_TRUE(Start());
  for (const Case& each : cases) {
    ExportTo(each.Name, each.Target);
    EXPECT_EQ(Content(each.Target), each.Content) << each.Target;
    EXPECT_EQ(Messages(), Texts{Saved}) << each.Target;
  }
}

TEST_F(Export, AnExistingFileIsReplacedOnlyOnYes) {
  PutFile("C:\\x.zip", "old");
  ASSERT_TRUE(Start());
  for (const Answer answer : {Answer::No, Answer::Cancel, Answer::Yes}) {
    EXPECT_EQ(Content("C:\\x.zip"), "old");
    QueueAnswer(answer);
    ExportTo("Super Jogo", "C:\\x.zip");
    EXPECT_EQ(Messages(), answer == Answer::Yes ? (Texts{Question, Saved}) : Texts{Question});
  }
  EXPECT_EQ(Content("C:\\x.zip"), "123456789");
}

TEST_F(Export, FailuresAreToldAndLeaveNoHalfFile) {
  struct Case {
    const char* Name;
    std::function<void()> Spoil;
    const char* Target;  // empty: it ends before asking for one
    std::string Message;
    const char* Left;  // content of the target afterwards; null: none
  };
  const std::string rom = Home + "Roms\\SUPERJOG.ZIP", picture = Home + "Imgs\\Super Jogo.bmp";
  const Case cases[] = {
      {"unknown game", [&] { form->Jogos.clear(); }, "", Unknown, nullptr},
      {"nothing selected", [&] { form->List1.Select(-1); }, "", Unknown, nullptr},
      {"ROM gone", [&] { RemoveFile(rom); }, "", Gone, nullptr},
      {"ROM locked", [&] { LockFile(rom); }, "C:\\n.zip", ReadError, nullptr},
      {"ROM locked, package", [&] { LockFile(rom); }, "C:\\n.tvk", ExportError, nullptr},
      {"picture locked", [&] { LockFile(picture); }, "C:\\n.tvk", ExportError, nullptr},
      {"a ROM of the checksum's chunk", [&] { PutFile(rom, std::string(1048576, 'x')); }, "C:\\n.tvk", ExportError,
       nullptr},
      {"no such disk", [] {}, "Q:\\n.zip", WriteError, nullptr},
      {"full disk, new file", [] { SetFreeSpace('C', 3); }, "C:\\n.zip", WriteError, nullptr},
      {"full disk, old file", [] { PutFile("C:\\o.tvk", "old"), SetFreeSpace('C', 3); }, "C:\\o.tvk", WriteError,
       "old"},
  };
  for (const Case& each : cases) {
    SetFreeSpace('C', 10'000'000);
    PutFile(rom, "123456789");
    for (const std::string& file : {rom, picture}) LockFile(file, false);
    ASSERT_TRUE(Start());
    Pick("Super Jogo");
    each.Spoil();
    if (*each.Target) QueueFileDialog(each.Target);
    QueueAnswer(each.Left ? Answer::Yes : Answer::Ok);
    Click(form->Command5);
    const Texts shown = Messages();
    ASSERT_FALSE(shown.empty()) << each.Name;
    EXPECT_EQ(shown.back(), each.Message) << each.Name;
    EXPECT_EQ(Content(each.Target), each.Left ? std::optional<std::string>(each.Left) : std::nullopt) << each.Name;
    EXPECT_TRUE(form->Command4.Enabled()) << each.Name;
  }
}

class Delete : public Menu {};

TEST_F(Delete, AsksDeletesTheRomAndSelectsTheNeighbour) {
  struct Case {
    const char* Deleted;
    const char* Selected;
  };
  PutCatalogue("|B=Jogo B|");
  PutFile(Home + "Imgs\\Jogo B.gif", Bitmap('b'));
  for (const char* each : {"A.zip", "B.zip", "C.zip", "D.zip"}) PutRom(each);
  ASSERT_TRUE(Start());
  Pick("Jogo B");
  for (const Answer answer : {Answer::No, Answer::Cancel}) {
    QueueAnswer(answer);
    Click(form->Command6);
    EXPECT_EQ(form->List1.Count(), 4);
    EXPECT_EQ(States(), GameSelected);
  }
  const ShownMessage question{"Deletar o jogo ' Jogo B ' ?", "Confirmar deleção"_ansi, Buttons::YesNoCancel,
                              Icon::Exclamation};
  EXPECT_EQ(ShownMessages(), std::vector<ShownMessage>(2, question));
  ForgetMessages();

  for (const Case& each : {Case{"Jogo B", "D"}, Case{"D", "C"}, Case{"A", "C"}, Case{"C", ""}}) {
    Pick(each.Deleted);
    QueueAnswer(Answer::Yes);
    Click(form->Command6);
    EXPECT_EQ(form->List1.Text(form->List1.Selected()), each.Selected) << each.Deleted;
    EXPECT_EQ(States(), *each.Selected ? GameSelected : NothingSelected) << each.Deleted;
  }
  EXPECT_EQ(Catalogue(), "|B=Jogo B|");
  EXPECT_EQ(Content(Home + "Imgs\\Jogo B.gif"), Bitmap('b'));
  EXPECT_TRUE(Names().empty());
}

TEST_F(Delete, WhatCannotBeDeletedStays) {
  PutRom("A.zip");
  PutRom("B.zip");
  ASSERT_TRUE(Start());
  Pick("A");
  SetAttributes(Home + "Roms\\A.zip", 0x21);
  QueueAnswer(Answer::Yes);
  Click(form->Command6);
  EXPECT_EQ(Names(), (Texts{"A", "B"}));
  Messages();
  Pick("B");
  RemoveFile(Home + "Roms\\B.zip");
  Click(form->Command6);
  form->List1.Select(-1);
  Click(form->Command6);
  EXPECT_EQ(Messages(), (Texts{Gone, Unknown}));
}

}  // namespace
}  // namespace menu
