// Under a translation that puts a mark before every text, every text that is shown bears the mark.
#include <set>

#include "autoconfig/FormCfg.h"
#include "controller/Form3.h"
#include "controller/teclas.h"
#include "mainwindow/Form1.h"
#include "savemanager/Form4.h"
#include "support/textos.h"
#include "tests/autoconfig/programs.h"
#include "tests/mainwindow/menu.h"

namespace {

using platform::Window;

const std::string Mark = "\xA4", Language = Home + "language.ini";

// Of a message: neither what it is about nor what stands around that, blanks and the ends of lines.
bool IsText(std::string_view piece) {
  return piece.find_first_not_of(" \r\n") != std::string_view::npos && piece != Peca::Valor;
}

void AddTextsOf(const Window& window, std::set<std::string>& texts) {
  texts.insert(window.Caption());
  for (const platform::Control* each : ControlsOf(window)) texts.insert({each->Caption(), each->ToolTip()});
}

std::set<std::string> AllTexts() {
  std::set<std::string> texts;
  const auto add = [&](std::string_view text) { texts.insert(platform::FromUtf8(text)); };
  for (const std::string_view text : TodosOsTextos()) add(text);
  for (const Tecla& key : Teclas) {
    add(key.Botao);
    for (const char* name : key.Nomes) add(name);
  }
  for (const DescricaoDeMensagem& message : TodasAsMensagens()) {
    add(message.Titulo);
    for (const std::string_view piece : message.Pecas) {
      if (IsText(piece)) add(piece);
    }
  }
  AddTextsOf(Form1(), texts);
  AddTextsOf(FormCfg(), texts);
  for (int i = 0; i < 2; ++i) QueueModal([&](const Window& window) { AddTextsOf(window, texts); });
  Form4::Mostrar();
  Form3::ABRIR();
  texts.erase("");
  return texts;
}

struct Translation : Menu {
  Translation() {
    std::string file = "[TOLVARIS20]\r\nValor=wrong\r\n";
    for (const std::string& text : AllTexts())
      file += text + "=" + Mark + text.substr(text.find_first_not_of(' ')) + "\r\n";
    SetUpMachine();
    PutFile(Language, file);
    ArquivoIdioma = Language;
  }

  // Paths, and what another program waits for, are no texts of the program's.
  static void ExpectMarked(const std::string& text) {
    const std::set<std::string> never = {"", "...", "Tolvaris"};
    if (!never.contains(text) && !text.starts_with("C:\\")) {
      EXPECT_EQ(text.substr(0, 1), Mark) << text;
    }
  }

  static void ExpectMarked(const Window& window) {
    ExpectMarked(window.Caption());
    for (const platform::Control* each : ControlsOf(window)) {
      ExpectMarked(each->Caption());
      ExpectMarked(each->ToolTip());
      ExpectMarked(each->AccessibleName());
    }
  }

  // The titles and the names of the types of the dialogs that were shown.
  static void ExpectMarkedDialogs(std::size_t count) {
    EXPECT_EQ(ShownFileDialogs().size(), count);
    for (const platform::OpenFileName& dialog : ShownFileDialogs()) {
      ExpectMarked(dialog.Title);
      bool isName = true;  // names and patterns by turns
      for (std::size_t start = 0; start < dialog.Filter.size(); isName = !isName) {
        const std::string part = dialog.Filter.c_str() + start;
        if (isName) ExpectMarked(part);
        start += part.size() + 1;
      }
    }
  }
};

TEST_F(Translation, OfTheMainWindow) {
  ASSERT_TRUE(Start());
  ExpectMarked(*form);
  QueueEvent([this] { ExpectMarked(*form); });
  form->CarregarLista(true);
  for (const char* game : {"Super Jogo", "Sem figura"}) {
    Pick(game);
    Click(form->Command5);
  }
  Click(form->Command4);
  ExpectMarkedDialogs(3);
}

TEST_F(Translation, OfTheSaveManager) {
  AddDisk('A', 1 << 20);
  DirSaves = Home + "Saves\\";
  PutFile("A:\\UM.srm", "um");
  PutFile(DirSaves + "DOIS.srm", "dois");
  QueueModal([](Window& window) {
    auto& manager = static_cast<Form4&>(window);
    ExpectMarked(window);
    Choose(manager.List1, 0);
    ExpectMarked(window);
    Choose(manager.List2, 0);
    ExpectMarked(window);
    QueueEvent([&] { EXPECT_EQ(window.Caption(), Mark + "Copiando..."); });
    Click(manager.Command1);
    ExpectMarked(window);
  });
  Form4::Mostrar();
  EXPECT_TRUE(Content("A:\\DOIS.srm")) << "it was copied";
}

TEST_F(Translation, OfTheControllerHelp) {
  QueueModal([](Window& window) {
    auto& help = static_cast<Form3&>(window);
    for (const int player : {0, 1}) {
      Choose(help.Combo1, player);
      ExpectMarked(window);
    }
    for (const std::string& entry : EntriesOf(help.Combo1)) ExpectMarked(entry);
  });
  Form3::ABRIR();
}

TEST_F(Translation, OfTheConfigurator) {
  for (const bool found : {false, true}) {
    if (found) PutFile(Home + "zsnesw.exe", WindowsProgram);
    FormCfg window;
    window.Form_Load();
    window.Show();
    QueueEvent([&] { EXPECT_EQ(window.Label2.Caption(), Mark + "Procurando..."); });
    Tick(window.Timer1);
    ExpectMarked(window);
    Click(window.Command3);
  }
  ExpectMarkedDialogs(2);
}

// Each piece by itself, and never what the message is about.
TEST_F(Translation, OfEveryMessage) {
  for (const DescricaoDeMensagem& each : TodasAsMensagens()) {
    std::string expected;
    for (const std::string_view piece : each.Pecas) {
      expected += (IsText(piece) ? Mark : "") + (piece == Peca::Valor ? "Valor" : platform::FromUtf8(piece));
    }
    MostrarMensagem(each.Qual, "Valor");
    EXPECT_EQ(ShownMessages().back().Text, expected);
    EXPECT_EQ(ShownMessages().back().Title, Mark + TitleOf(each.Qual));
  }
}

}  // namespace
