// The save-file manager's window: its two panes, picking in them, copying to the other side and deleting.
#include "catalog/cls_DAT.h"
#include "resources/ids.h"
#include "savemanager/Form4.h"
#include "tests/fresh_machine.h"

namespace {

using namespace platform;

const std::string NosDois = "Corrida 2 [State 0]", Velho = "velho no disquete", Novo = "novo no computador";
const std::string SemNome = "SEMNOME [State 2]", Fonte = "C:\\Saves\\SEMNOME.zs2", Alvo = "A:\\SEMNOME.zs2";

const std::string ErroAoGravar = Error + "Erro ao gravar arquivo.", ErroAoLer = Error + "Erro ao ler arquivo.";
const std::string DiscoCheio =
    "Disco cheio, OK, exclamation: Não há espaço livre suficiente em disco para completar a operação."_ansi;
const std::string Deletar = "Confirmar deleção, Yes/No/Cancel, question: "_ansi;

std::string JaExiste(const std::string& lado) {
  return "Salvamento já existente, Yes/No/Cancel, question: O salvamento selecionado já se encontra no "_ansi + lado +
         ".\r\nVocê deseja substituí-lo ?"_ansi;
}

// Saves: one on the floppy, one on the computer, and one on both.
struct Salvamentos : FreshMachine {
  Salvamentos() { Preparar(); }

  static void Preparar() {
    Renew();
    AddDisk('A', 1457664);
    DirSaves = "C:\\Saves\\";
    PutFile("C:\\Tolvaris\\tolvaris.dat", "|UM=Jogo Um||DOIS=Corrida 2|");
    PutFile("A:\\UM.srm", "um no disquete");
    PutFile("A:\\DOIS.zst", Velho);
    PutFile("C:\\Saves\\DOIS.zst", Novo);
    PutFile(Fonte, "sem nome");
    Catalogo().Fechar();
    Catalogo().Carregar();
  }

  // Opens the window with this user in front of it.
  static void Abrir(const std::function<void(Form4&)>& usuario) {
    int vezes = 0;
    QueueModal([&](Window& janela) { ++vezes, usuario(static_cast<Form4&>(janela)); });
    Form4::Mostrar();
    EXPECT_EQ(vezes, 1);
  }

  static void Escolher(ListBox& lista, const std::string& texto) { Choose(lista, lista.FindExact(texto)); }

  // The direction, the selections of both lists, which delete pictures are seen, the copy button, and the file.
  static std::string Escolha(const Form4& janela) {
    std::string texto = std::to_string(static_cast<int>(janela.Direcao));
    for (const ListBox* lista : {&janela.List1, &janela.List2}) texto += " " + std::to_string(lista->Selected());
    texto += std::string(janela.Image1.Visible() ? " left" : "") + (janela.Image2.Visible() ? " right" : "");
    if (!janela.Command1.Visible()) return texto;
    texto += IconOf(janela.Command1) == ICONE_SETA_DIREITA ? " -> " : " <- ";
    return texto + janela.Command1.ToolTip() + ": " + janela.ArquivoAtual;
  }
  static bool NadaEscolhido(const Form4& janela) { return Escolha(janela) == "0 -1 -1"; }
};

TEST_F(Salvamentos, AreListedUnderTheNamesOfTheirGamesAndThePickedOneDecides) {
  for (const char* const arquivo : {"A:\\UM.ZS3", "A:\\um.zst", "A:\\UM.txt"}) PutFile(arquivo, "x");
  const std::string doDisquete = " -1 left -> Copiar do disquete para o computador: ";
  const std::tuple<ListBox Form4::*, int, std::string> passos[] = {
      {&Form4::List1, 1, "1 1" + doDisquete + "UM.srm"},
      {&Form4::List1, 0, "1 0" + doDisquete + "DOIS.zst"},
      {&Form4::List2, 1, "2 -1 1 right <- Copiar do computador para o disquete: SEMNOME.zs2"},
      {&Form4::List1, 1, "1 1" + doDisquete + "UM.srm"},
  };
  Abrir([&](Form4& janela) {
    EXPECT_EQ(EntriesOf(janela.List1), "Corrida 2 [State 0]|Jogo Um|Jogo Um [State 0]|Jogo Um [State 3]|");
    EXPECT_EQ(EntriesOf(janela.List2), "Corrida 2 [State 0]|SEMNOME [State 2]|");
    janela.List2_Click();
    janela.Command1_Click();
    EXPECT_TRUE(NadaEscolhido(janela) && ShownMessages().empty()) << "nothing is picked yet";
    for (const auto& [lista, indice, depois] : passos) {
      Choose(janela.*lista, indice);
      EXPECT_EQ(Escolha(janela), depois);
    }
    Click(janela.Command2);
    EXPECT_TRUE(janela.IsClosed());
  });
}

// A long save: the title tells how far its copy is, events run between its pieces, and the window takes no input.
TEST_F(Salvamentos, AreCopiedInPiecesWhateverIsClickedMeanwhile) {
  const std::string longo(131'073, 'l');  // three pieces
  PutFile("A:\\UM.srm", longo);
  PutFile("A:\\RESTO.srm.0f3a99c2.novo~", "of a copy that was broken off");
  PassTime(3601);
  Texts titulos;
  Abrir([&](Form4& janela) {
    Escolher(janela.List1, "Jogo Um");
    const std::function<void()> olhar = [&] {
      titulos.push_back(janela.Caption());
      PressKey(janela.List1, 46);
      Escolher(janela.List1, NosDois);
      Click(janela.Command1);
      Click(janela.Command2);
      CloseWindow(janela);
      PutFile("A:\\UM.zst", "x");
      QueueEvent(olhar);
    };
    QueueEvent(olhar);
    Click(janela.Command1);
    EXPECT_EQ(titulos, (Texts{"Copiando...", "Copiando... 49%", "Copiando... 99%"}));
    EXPECT_EQ(janela.Caption(), "Salvamentos dos jogos");
    EXPECT_FALSE(janela.IsClosed());
    EXPECT_EQ(Focused(), &janela.List1) << "the copy button is hidden: the keyboard goes where the copy came from";
    EXPECT_TRUE(NadaEscolhido(janela));
    EXPECT_EQ(EntriesOf(janela.List1), "Corrida 2 [State 0]|Jogo Um|") << "the pane of the source is not filled again";
    EXPECT_EQ(EntriesOf(janela.List2), "Corrida 2 [State 0]|Jogo Um|SEMNOME [State 2]|");
  });
  EXPECT_EQ(Content("C:\\Saves\\UM.srm"), longo);
  EXPECT_EQ(Content("C:\\Saves\\DOIS.zst"), Novo);
  EXPECT_TRUE(ShownMessages().empty());
}

// The save that is on both sides: the other one of it is copied over it, or it is deleted.
TEST_F(Salvamentos, AreReplacedAndDeletedOnlyAfterYes) {
  for (int caso = 0; caso < 12; ++caso) {
    SCOPED_TRACE(caso);
    const bool disquete = caso % 2 == 0, apagar = caso % 4 < 2, sim = caso < 4;
    Preparar();
    QueueAnswer(sim ? Answer::Yes : caso < 8 ? Answer::No : Answer::Cancel);
    Abrir([&](Form4& janela) {
      ListBox &lista = disquete ? janela.List1 : janela.List2, &outra = disquete ? janela.List2 : janela.List1;
      Escolher(outra, NosDois);
      if (apagar) Escolher(lista, NosDois);
      PressKey(outra, apagar ? 46 : 13);  // nothing is picked there any more; Enter does nothing
      apagar ? Click(disquete ? janela.Image1 : janela.Image2) : Click(janela.Command1);
      EXPECT_EQ(NadaEscolhido(janela), sim);
      EXPECT_EQ(lista.Count(), sim && apagar ? 1 : 2);
      EXPECT_EQ(Focused() == (apagar ? &lista : &outra), sim);
    });
    const auto resto = apagar ? std::nullopt : std::optional(disquete ? Novo : Velho);
    EXPECT_EQ(Content("A:\\DOIS.zst"), sim && disquete ? resto : Velho);
    EXPECT_EQ(Content("C:\\Saves\\DOIS.zst"), sim && !disquete ? resto : Novo);
    const std::string lado = disquete ? "Disquete (A:)" : "Computador";
    const std::string pergunta = "Deletar o salvamento do jogo '" + NosDois + "' que está no "_ansi + lado + " ?";
    EXPECT_EQ(TakeMessages(), Texts{apagar ? Deletar + pergunta : JaExiste(lado)});
  }
}

TEST_F(Salvamentos, ThatCannotBeCopiedLeaveTheOldOneWholeAndAreToldOf) {
  using Fazer = std::function<void()>;
  const Fazer nada = [] {}, tirar = [] { RemoveDisk('A'); };
  const Fazer restoNovo = [] {
    PutFile("A:\\X.srm.0f3a99c2.novo~", std::string(600, 'h'));
    SetFreeSpace('A', 0);
  };
  const Fazer resto = [&] { restoNovo(), SetAge("A:\\X.srm.0f3a99c2.novo~", 3601); };
  const std::string existe = JaExiste("Disquete (A:)");
  // What happens before the copy button is pressed, and during the copy; what is said; what the floppy holds then.
  const std::tuple<const char*, Fazer, Fazer, Texts, std::optional<std::string>> casos[] = {
      {"just room", [] { SetFreeSpace('A', 512); }, nada, {}, "sem nome"},
      {"no room", [] { SetFreeSpace('A', 0); }, nada, {DiscoCheio}, {}},
      {"no disk", tirar, nada, {DiscoCheio}, {}},
      {"an empty save", [] { PutFile(Fonte, ""); }, nada, {}, ""},
      {"over an empty save", [] { PutFile(Alvo, ""); }, nada, {}, "sem nome"},
      {"source gone", [] { RemoveFile(Fonte); }, nada, {ErroAoLer}, {}},
      {"source cannot be read", [] { LockFile(Fonte); }, nada, {ErroAoLer}, {}},
      {"full of a broken copy", resto, nada, {}, "sem nome"},
      {"full of what may still be a copy", restoNovo, nada, {DiscoCheio}, {}},
      {"a stick with more than 2 GiB free", [] { AddDisk('A', std::uint64_t{3} << 30); }, nada, {}, "sem nome"},
      {"full half-way", [] { PutFile(Alvo, "velho"); }, [] { SetFreeSpace('A', 2); }, {existe, ErroAoGravar}, "velho"},
      {"disk taken out", nada, tirar, {ErroAoGravar}, {}},
  };
  for (const auto& [nome, antes, durante, ditas, noDisquete] : casos) {
    SCOPED_TRACE(nome);
    Preparar();
    QueueAnswer(Answer::Yes);
    const bool tentado = ditas != Texts{DiscoCheio};
    Abrir([&, &antes = antes, &durante = durante, &noDisquete = noDisquete](Form4& janela) {
      Escolher(janela.List2, SemNome);
      antes();
      QueueEvent(durante);
      Click(janela.Command1);
      EXPECT_EQ(NadaEscolhido(janela), tentado);
      EXPECT_EQ(janela.List1.FindExact(SemNome) >= 0, tentado && noDisquete);
      EXPECT_EQ(janela.Caption(), "Salvamentos dos jogos");
    });
    EXPECT_EQ(TakeMessages(), ditas);
    EXPECT_EQ(Content(Alvo), noDisquete);
  }
}

// The save of the computer that is on both sides is copied over the floppy's one. Where a pane could not be read there
// is nothing to pick, and nothing happens.
TEST_F(Salvamentos, AreOldOrNewButWholeWhateverCallOfThePlatformFails) {
  bool oferecido = false;
  int avisos = 0;
  const auto copiar = [&] {
    QueueAnswer(Answer::Yes);
    Abrir([&](Form4& janela) {
      Escolher(janela.List2, NosDois);
      oferecido = janela.Command1.Visible();
      Click(janela.Command1);
      EXPECT_TRUE(janela.List1.Enabled());
    });
  };
  const auto conferir = [&] {
    const Texts ditas = TakeMessages();
    const bool avisado = !ditas.empty() && ditas.back() != JaExiste("Disquete (A:)");
    avisos += avisado ? 1 : 0;
    EXPECT_EQ(Content("A:\\DOIS.zst"), oferecido && !avisado ? Novo : Velho);
    EXPECT_EQ(Content("C:\\Saves\\DOIS.zst"), Novo);
    EXPECT_EQ(Leftovers({"A:\\"}), Texts{});
  };
  EXPECT_GE(WithEachFault(Preparar, copiar, conferir), 3);
  EXPECT_TRUE(oferecido && avisos > 0);
}

TEST_F(Salvamentos, AreShownAndDeletedInTheLanguageOfTheTranslation) {
  ArquivoIdioma = "C:\\Tolvaris\\language.ini";
  PutFile(
      ArquivoIdioma,
      "[TOLVARIS20]\r\nSalvamentos dos jogos=Saves\r\nExcluir=Delete\r\n Disquete =| Floppy |\r\n Computador =PC\r\n"
      "&Fechar=&Close\r\nCopiar do computador para o disquete=To the floppy\r\n"
      "Deletar o salvamento do jogo '=|Delete '|\r\n' que está no Computador ?=|' here?|"_ansi);
  Abrir([](Form4& janela) {
    Escolher(janela.List2, SemNome);
    EXPECT_EQ(TextsOf(janela), "Saves| Floppy ||Delete|To the floppy|PC||Delete|&Close");
    PressKey(janela.List2, 46);
  });
  EXPECT_EQ(TakeMessages(), Texts{Deletar + "Delete 'SEMNOME [State 2]' here?"});
}

}  // namespace
