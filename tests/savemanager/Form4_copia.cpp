// Copying a save to the other side: questions, refusals and failures.
#include "tests/savemanager/janela.h"

namespace {

using namespace platform;

const simulated::ShownMessage Erro = {"Erro ao gravar arquivo.", "Erro", Buttons::Ok, Icon::Critical};
const simulated::ShownMessage DiscoCheio = {"Não há espaço livre suficiente em disco para completar a operação."_ansi,
                                            "Disco cheio", Buttons::Ok, Icon::Exclamation};

simulated::ShownMessage JaExiste(const std::string& lado) {
  return {"O salvamento selecionado já se encontra no "_ansi + lado + "\r\nVocê deseja substituí-lo ?"_ansi,
          "Salvamento já existente"_ansi, Buttons::YesNoCancel, Icon::Question};
}
const simulated::ShownMessage NoDisquete = JaExiste("Disquete (A:).");
const simulated::ShownMessage NoComputador = JaExiste("Computador.");

TEST_F(Salvamentos, AreCopiedBothWays) {
  Abrir([](Form4& janela) {
    Escolher(janela.List1, "Jogo Um");
    simulated::QueueEvent([&] { EXPECT_EQ(janela.Caption(), "Copiando..."); });
    simulated::Click(janela.Command1);
    EXPECT_EQ(simulated::Pending(), 0);
    EXPECT_EQ(Textos(janela.List2), "Corrida 2 [State 0]|Jogo Um|SEMNOME [State 2]|");
    EXPECT_EQ(simulated::Focused(), &janela.List1) << "the keyboard stays where the copy came from";
    Escolher(janela.List2, "SEMNOME [State 2]");
    simulated::RemoveFile("C:\\Saves\\UM.srm");
    simulated::Click(janela.Command1);
    EXPECT_EQ(Textos(janela.List1), "Corrida 2 [State 0]|Jogo Um|SEMNOME [State 2]|");
    EXPECT_EQ(janela.List2.Count(), 3) << "the pane of the source is not filled again";
    EXPECT_TRUE(NadaEscolhido(janela));
    EXPECT_EQ(janela.Caption(), "Salvamentos dos jogos");
    Escolher(janela.List1, "Jogo Um");
    janela.Diretorios[1].clear();
    simulated::Click(janela.Command1);
    EXPECT_FALSE(NadaEscolhido(janela)) << "there is nowhere to copy to";
  });
  EXPECT_EQ(simulated::Content("A:\\SEMNOME.zs2"), "sem nome no computador");
  EXPECT_TRUE(simulated::ShownMessages().empty());
}

TEST_F(Salvamentos, AreReplacedOnlyAfterYes) {
  for (const bool paraDisquete : {false, true}) {
    for (const Answer resposta : {Answer::Yes, Answer::No, Answer::Cancel}) {
      Preparar();
      simulated::QueueAnswer(resposta);
      const bool sim = resposta == Answer::Yes;
      Abrir([&](Form4& janela) {
        ListBox& lista = paraDisquete ? janela.List2 : janela.List1;
        Escolher(lista, "Corrida 2 [State 0]");
        simulated::Click(janela.Command1);
        EXPECT_EQ(NadaEscolhido(janela), sim);
        EXPECT_EQ(janela.Command1.Visible() && lista.Selected() == 0, !sim);
      });
      const std::string disquete = "velho no disquete", computador = "novo no computador";
      EXPECT_EQ(simulated::Content("A:\\DOIS.zst"), sim && paraDisquete ? computador : disquete);
      EXPECT_EQ(simulated::Content("C:\\Saves\\DOIS.zst"), sim && !paraDisquete ? disquete : computador);
      EXPECT_EQ(simulated::ShownMessages(), Mensagens{paraDisquete ? NoDisquete : NoComputador});
    }
  }
}

const std::string Fonte = "C:\\Saves\\SEMNOME.zs2", Alvo = "A:\\SEMNOME.zs2";

void PorVelho() { simulated::PutFile(Alvo, "velho"); }
void Esvaziar() { simulated::PutFile(Fonte, ""); }
void TirarDisquete() { simulated::RemoveDisk('A'); }
void DeixarLivres(std::uint64_t bytes) { simulated::SetFreeSpace('A', bytes); }

TEST_F(Salvamentos, ThatCannotBeCopiedLeaveTheOldOneWholeAndAreToldOf) {
  const auto nada = [] {};
  const std::string novo = "sem nome no computador";
  const struct {
    const char* nome;
    std::function<void()> antes, durante;  // what happens before the copy button is pressed, and during the copy
    Mensagens mensagens;
    std::optional<std::string> noDisquete;
  } casos[] = {
      {"just room", [] { DeixarLivres(512); }, nada, {}, novo},
      {"no room", [] { DeixarLivres(0); }, nada, {DiscoCheio}, {}},
      {"no disk", TirarDisquete, nada, {DiscoCheio}, {}},
      {"nothing to copy, no disk", [] { Esvaziar(), TirarDisquete(); }, nada, {Erro}, {}},
      {"an empty save", Esvaziar, nada, {}, ""},
      {"over an empty save", [] { simulated::PutFile(Alvo, ""); }, nada, {}, novo},
      {"source gone", [] { simulated::RemoveFile(Fonte); }, nada, {Erro}, {}},
      {"full half-way", nada, [] { DeixarLivres(10); }, {Erro}, {}},
      {"full half-way over an old save", PorVelho, [] { DeixarLivres(10); }, {NoDisquete, Erro}, "velho"},
      {"disk taken out", nada, TirarDisquete, {Erro}, {}},
      {"old save in use", PorVelho, [] { simulated::LockFile(Alvo); }, {NoDisquete, Erro}, "velho"},
  };
  for (const auto& caso : casos) {
    SCOPED_TRACE(caso.nome);
    Preparar();
    if (caso.mensagens.size() == 2) simulated::QueueAnswer(Answer::Yes);
    Abrir([&](Form4& janela) {
      Escolher(janela.List2, "SEMNOME [State 2]");
      caso.antes();
      simulated::QueueEvent(caso.durante);
      simulated::Click(janela.Command1);
      const bool tentado = caso.mensagens != Mensagens{DiscoCheio};
      EXPECT_EQ(NadaEscolhido(janela), tentado);
      EXPECT_EQ(janela.List1.FindExact("SEMNOME [State 2]") >= 0, tentado && caso.noDisquete.has_value());
      EXPECT_EQ(janela.Caption(), "Salvamentos dos jogos");
    });
    EXPECT_EQ(simulated::ShownMessages(), caso.mensagens);
    EXPECT_EQ(simulated::Content(Alvo), caso.noDisquete);
  }
}

// The save of the computer that is on both sides is copied over the floppy's one, or the floppy's one is deleted.
TEST_F(Salvamentos, AreOldOrNewButWholeWhateverCallOfThePlatformFails) {
  for (const bool copiar : {true, false}) {
    int avisos = 0;
    bool falhou = true;
    for (int n = 1; falhou; ++n) {
      SCOPED_TRACE(n);
      Preparar();
      std::vector<std::string> arquivos = simulated::AllFiles();
      simulated::QueueAnswer(Answer::Yes);
      Abrir([&](Form4& janela) {
        Escolher(copiar ? janela.List2 : janela.List1, "Corrida 2 [State 0]");
        simulated::FailCall(n);
        copiar ? simulated::Click(janela.Command1) : simulated::Click(janela.Image1);
        falhou = simulated::CallFailed();
        simulated::FailCall(0);
        EXPECT_TRUE(janela.List1.Enabled());
      });
      const Mensagens& mensagens = simulated::ShownMessages();
      const bool avisado = !mensagens.empty() && (mensagens.back() == Erro || mensagens.back() == DiscoCheio);
      const bool apagado = !copiar && !(falhou && n == 1);  // only the first call deletes
      if (apagado) std::erase(arquivos, "A:\\DOIS.zst");
      EXPECT_EQ(simulated::AllFiles(), arquivos) << "a temporary file is left, or a file is gone";
      EXPECT_EQ(simulated::Content("C:\\Saves\\DOIS.zst"), "novo no computador");
      if (!apagado) {
        EXPECT_EQ(simulated::Content("A:\\DOIS.zst"), copiar && !avisado ? "novo no computador" : "velho no disquete");
      }
      avisos += avisado ? 1 : 0;
    }
    EXPECT_EQ(avisos > 0, copiar);
  }
}

TEST_F(Salvamentos, PickedOrClosedWhileACopyRunsDoNotDisturbIt) {
  for (const bool fechar : {false, true}) {
    Preparar();
    Abrir([&](Form4& janela) {
      Escolher(janela.List1, "Jogo Um");
      simulated::QueueEvent([&] {
        simulated::PressKey(janela.List1, 46);
        Escolher(janela.List1, "Corrida 2 [State 0]");
        if (fechar) simulated::CloseWindow(janela);
      });
      simulated::Click(janela.Command1);
      EXPECT_EQ(janela.IsClosed(), fechar);
      EXPECT_TRUE(fechar || NadaEscolhido(janela));
    });
    EXPECT_EQ(simulated::Content("C:\\Saves\\UM.srm"), "um no disquete");
    EXPECT_EQ(simulated::Content("C:\\Saves\\DOIS.zst"), "novo no computador");
    EXPECT_TRUE(simulated::ShownMessages().empty());
  }
}

}  // namespace
