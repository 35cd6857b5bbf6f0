// The key of a repository, and packages that are put into one.
#include "repository/chave.h"
#include "tests/keeper/client.h"
#include "tests/repository/repository.h"

namespace {

const std::string Place = "C:\\R\\", Key = "C:\\k.pem", EntryFile = Place + "entrada.txt";
constexpr const char* Fingerprint = "Impressão digital da chave: ";

class Publishing : public Keeper {
 protected:
  Publishing() { SetUp(); }

  // With a key, and two packages; it is 10 o'clock of 2026-11-23.
  void SetUp() override {
    Renew();
    PassTime(1'794'428'000);
    RunTvk({"chave", Key});
    PutFile("C:\\p\\um.tvk", Package("Um Jogo", "UM"));
    PutFile("C:\\p\\dois.tvk", Package("Ação"_ansi, "DOIS", Rom, contract::SmallJpeg()));
  }

  static Outcome Publish(const Texts& more = {}) {
    Texts arguments = {"publicar", "--chave", Key, "--repositorio", "C:/R", "C:\\p"};
    arguments.insert(arguments.end(), more.begin(), more.end());
    return RunTvk(arguments);
  }

  static Outcome PublishFirst() { return Publish({"--titulo", "Clube São João", "--espelho", "https://a.example/"}); }

  static std::string PrintOfKey() {
    return ImpressaoDigital(LerChave(Content(Key).value_or("")).value().Public).value();
  }
};

TEST_F(Publishing, AKeyIsMadeOnceAndNeverReplaced) {
  const auto before = Content(Key);
  EXPECT_TRUE(LerChave(before.value_or("")));
  EXPECT_EQ(RunTvk({"chave", Key}), (Outcome{1, "", Key + ": já existe, e nenhuma chave é gravada por cima\n"}));
  EXPECT_EQ(Content(Key), before);
  const Outcome another = RunTvk({"chave", "C:\\outra.pem"});
  EXPECT_EQ(another.Status, 0);
  EXPECT_EQ(another.Output.substr(0, another.Output.find('\n')).size(), std::string(Fingerprint).size() + 64);
  EXPECT_NE(another.Output.find("Guarde uma cópia da chave"), std::string::npos);
  EXPECT_NE(Content("C:\\outra.pem"), before);
}

TEST_F(Publishing, GivesARepositoryAndLeavesItAloneWhenNothingChanges) {
  const Outcome told = PublishFirst();
  EXPECT_EQ(told, (Outcome{0,
                           "novo     DOIS      Ação\nnovo     UM        Um Jogo\n"
                           "Jogos no repositório: 2; novos: 2; mudados: 0; saíram: 0.\n"
                           "Publicado com o número de série 1795428000; vale até 2027-11-23T10:00:00Z.\n" +
                               std::string(Fingerprint) + PrintOfKey() + "\n",
                           ""}));
  const Seen seen = LookAt(Place);
  EXPECT_EQ(seen.Fault, "");
  EXPECT_EQ(seen.Entry.Titulo + seen.Entry.Espelhos.at(0), "Clube São Joãohttps://a.example/");
  ASSERT_EQ(seen.Games.size(), 2U);
  EXPECT_EQ(seen.Games[0].Nome + seen.Games[0].ExtensaoDaFigura, "Açãojpg");
  EXPECT_EQ(Content(Place + "pacotes\\" + seen.Games[1].Pacote.Soma + ".tvk"), Content("C:\\p\\um.tvk"));
  const std::uint64_t writes = WritesEver();
  PassTime(180 * 86'400);
  EXPECT_EQ(Publish().Output.find("Jogos no repositório: 2; novos: 0; mudados: 0; saíram: 0.\n"
                                  "Nada mudou: entrada.txt fica como está e vale até 2027-11-23T10:00:00Z.\n"),
            0U);
  EXPECT_EQ(WritesEver(), writes);
  PassTime(3 * 86'400);  // now half of its time is over
  EXPECT_NE(Publish().Output.find("vale até 2028-05-24T10:00:00Z"), std::string::npos);
  EXPECT_EQ(WritesEver(), writes + 2) << "the entry alone, written and renamed";
}

TEST_F(Publishing, ChangesWhatIsAskedForAndKeepsTheRest) {
  PutFile("C:\\l.csv", "dos;autor;licenca;descricao;versao\num;Ana;Livre;Um jogo;1.0\nDOIS;;;;2\n");
  Publish({"--titulo", "Clube", "--espelho", "https://a.example/", "--espelho", "https://b.example/x/", "--validade",
           "30", "--lista", "C:\\l.csv"});
  const struct {
    const char* Name;
    Texts Options;
    std::string Title;
    std::size_t Mirrors;
    int Days;
    std::string Author;
  } cases[] = {
      {"nothing", {}, "Clube", 2, 30, "Ana"},
      {"the title", {"--titulo", "Outro"}, "Outro", 2, 30, "Ana"},
      {"the mirrors", {"--espelho", "https://c.example/"}, "Clube", 1, 30, "Ana"},
      {"no mirror any more", {"--espelho", ""}, "Clube", 0, 30, "Ana"},
      {"the days", {"--validade", "31"}, "Clube", 2, 31, "Ana"},
      {"the list", {"--lista", "C:\\vazia.csv"}, "Clube", 2, 30, ""},
  };
  const Files before = Standing();
  for (const auto& [name, options, title, mirrors, days, author] : cases) {
    SCOPED_TRACE(name);
    for (const auto& [path, content] : before) PutFile(path, content);
    PutFile("C:\\vazia.csv", "dos\n");
    EXPECT_EQ(Publish(options).Errors, "");
    const Seen seen = LookAt(Place);
    EXPECT_EQ(seen.Fault, "");
    EXPECT_EQ(seen.Entry.Titulo, title);
    EXPECT_EQ(seen.Entry.Espelhos.size(), mirrors);
    EXPECT_EQ(seen.Entry.Validade - seen.Entry.Publicado, days * 86'400);
    EXPECT_EQ(seen.Games.at(1).Autor, author);
    EXPECT_EQ(Content(EntryFile) == before.at(EntryFile), options.empty());
    EXPECT_EQ(seen.Entry.Serie, options.empty() ? 1'795'428'000 : 1'795'428'001) << "the clock stands still";
  }
}

TEST_F(Publishing, TellsWhatComesChangesAndGoesAndWritesItOnlyWhenItIsMeant) {
  PublishFirst();
  RemoveFile("C:\\p\\um.tvk");
  PutFile("C:\\p\\dois.tvk", Package("Ação 2"_ansi, "DOIS"));
  PutFile("C:\\p\\tres.tvk", Package("Zebra", "TRES"));
  const Files before = Standing();
  const std::string changes =
      "mudou    DOIS      Ação 2\nnovo     TRES      Zebra\nsaiu     UM        Um Jogo\n"
      "Jogos no repositório: 2; novos: 1; mudados: 1; saíram: 1.\n";
  const Outcome said = Publish({"--simular"});
  EXPECT_EQ(said.Output.find(changes + "Simulação: nada foi gravado.\n"), 0U) << said.Output;
  EXPECT_EQ(Standing(), before);
  EXPECT_EQ(Publish().Output.find(changes), 0U);
  for (const auto& [path, content] : before) EXPECT_TRUE(path == EntryFile || Content(path) == content) << path;
  const Seen seen = LookAt(Place);
  EXPECT_EQ(seen.Fault, "");
  EXPECT_EQ(seen.Games.size(), 2U);
}

TEST_F(Publishing, CleansWhatNeitherThisNorTheLastIndexNames) {
  PublishFirst();
  const Seen first = LookAt(Place);
  const std::string old = Place + "pacotes\\" + first.Games[0].Pacote.Soma + ".tvk",
                    oldIndex = Place + "indice\\" + first.Entry.Indice.Soma + ".txt";
  RemoveFile("C:\\p\\dois.tvk");
  PutFile(Place + "pacotes\\leia.txt", "mine");
  PutFile(Place + "pacotes\\meu.tvk", "mine");
  PutFile(Place + "pacotes\\" + std::string(64, '0') + ".tvk", "");
  PutFile(Place + "pacotes\\x.tvk.01234567.novo~", "half");
  SetAge(Place + "pacotes\\x.tvk.01234567.novo~", 4'000);
  const std::string unknown = "apagado  " + Place + "pacotes\\" + std::string(64, '0') + ".tvk\n";
  const Files before = Standing();
  EXPECT_NE(Publish({"--limpar", "--simular"}).Output.find(unknown), std::string::npos);
  EXPECT_EQ(Standing(), before);
  LockFile(Place + "pacotes\\" + std::string(64, '0') + ".tvk");
  EXPECT_NE(Publish({"--limpar"}).Errors.find(".tvk: não pode ser apagado\n"), std::string::npos);
  LockFile(Place + "pacotes\\" + std::string(64, '0') + ".tvk", false);
  for (const auto& [path, content] : before) PutFile(path, content);
  SetAge(Place + "pacotes\\x.tvk.01234567.novo~", 4'000);
  EXPECT_NE(Publish({"--limpar"}).Output.find(unknown), std::string::npos);
  EXPECT_TRUE(Content(old) && Content(oldIndex)) << "some have read the last index and not yet its packages";
  EXPECT_FALSE(Content(Place + "pacotes\\" + std::string(64, '0') + ".tvk"));
  EXPECT_FALSE(Content(Place + "pacotes\\x.tvk.01234567.novo~"));
  Publish({"--limpar", "--titulo", "Outro"});
  EXPECT_FALSE(Content(old) || Content(oldIndex));
  EXPECT_TRUE(Content(Place + "pacotes\\leia.txt") && Content(Place + "pacotes\\meu.tvk"));
  EXPECT_EQ(LookAt(Place).Fault, "");
}

TEST_F(Publishing, MendsADamagedPackageAndRefusesADamagedIndex) {
  PublishFirst();
  const Seen seen = LookAt(Place);
  const std::string package = Place + "pacotes\\" + seen.Games[0].Pacote.Soma + ".tvk";
  PutFile(package, "damaged");
  EXPECT_EQ(Publish().Status, 0);
  EXPECT_EQ(LookAt(Place).Fault, "");
  // One that is named as another is replaced before its own turn comes.
  PutFile(package, Package("Outro", "OUTRO"));
  EXPECT_EQ(Publish({package}), (Outcome{1, "Nada foi publicado.\n", package + ": mudou enquanto era publicado\n"}));
  EXPECT_EQ(LookAt(Place).Fault, "");
  const std::string index = Place + "indice\\" + seen.Entry.Indice.Soma + ".txt";
  PutFile(index, *Content(index) + "\n");
  EXPECT_EQ(Publish(), (Outcome{1, "", index + ": o índice está danificado\n"}));
  RemoveFile(index);
  EXPECT_EQ(Publish(), (Outcome{1, "", index + ": não existe\n"}));
}

// Whatever is refused, nothing is published, and the repository stays as it is.
TEST_F(Publishing, RefusesByNameAndPublishesNothing) {
  const std::string none = "Nada foi publicado.\n", inList = "C:\\l.csv:2: ";
  const auto entry = [] { return *Content(EntryFile); };
  const struct {
    const char* Name;
    std::function<void()> Prepare;
    Texts Options;
    Outcome Told;
  } cases[] = {
      {"a package of many that is none",
       [] { PutFile("C:\\p\\mau.tvk", "x"); },
       {},
       {1, none, "C:\\p\\mau.tvk: não é um pacote\n"}},
      {"a name",
       [] { PutFile("C:\\p\\mau.tvk", Package("A|B", "AB")); },
       {},
       {1, none, "C:\\p\\mau.tvk: o nome 'A|B' não pode ter o caractere |\n"}},
      {"a picture",
       [] { PutFile("C:\\p\\mau.tvk", Package("A", "A", Rom, contract::SmallPng())); },
       {},
       {1, none, "C:\\p\\mau.tvk: a figura não é .gif, .bmp nem .jpg\n"}},
      {"a missing file", [] {}, {"C:\\falta.tvk"}, {1, none, "C:\\falta.tvk: não existe\n"}},
      {"two packages of one name",
       [] { PutFile("C:\\p\\x.tvk", Package("AÇÃO"_ansi, "X")); },
       {},
       {1, none, "C:\\p\\x.tvk: o nome 'AÇÃO' já é de C:\\p\\dois.tvk\n"}},
      {"a key in the repository",
       [] { PutFile("C:\\R\\Sub\\k.pem", *Content(Key)); },
       {"--chave", "C:\\p\\..\\r\\SUB\\k.pem"},
       {1, "", "C:\\p\\..\\r\\SUB\\k.pem: a chave está dentro do repositório, e todos a teriam\n"}},
      {"no key", [] {}, {"--chave", "C:\\p\\um.tvk"}, {1, "", "C:\\p\\um.tvk: não é uma chave como as de tvk chave\n"}},
      {"a missing key", [] {}, {"--chave", "C:\\falta"}, {1, "", "C:\\falta: não existe\n"}},
      {"another key",
       [] {
         RunTvk({"chave", "C:\\outra.pem"});
       },
       {"--chave", "C:\\outra.pem"},
       {1, "", EntryFile + ": foi assinado com outra chave\n"}},
      {"an entry that was changed",
       [&] { PutFile(EntryFile, With(entry(), "Clube", "CLUBE")); },
       {},
       {1, "", EntryFile + ": a assinatura não confere: o arquivo foi mudado\n"}},
      {"an entry that is cut",
       [&] { PutFile(EntryFile, entry().substr(0, 60)); },
       {},
       {1, "", EntryFile + ": a linha 4 não serve\n"}},
      {"an empty entry", [] { PutFile(EntryFile, ""); }, {}, {1, "", EntryFile + ": está vazio\n"}},
      {"an entry without its key",
       [&] { PutFile(EntryFile, With(entry(), "Chave: ", "X: ")); },
       {},
       {1, "", EntryFile + ": falta a linha Chave\n"}},
      {"an entry of a newer format",
       [&] { PutFile(EntryFile, With(entry(), "Formato: 1", "Formato: 2")); },
       {},
       {1, "", EntryFile + ": é de uma versão mais nova do tvk\n"}},
      {"a large entry",
       [] { PutFile(EntryFile, std::string(65'537, 'x')); },
       {},
       {1, "", EntryFile + ": é maior do que pode ser\n"}},
      {"a locked entry", [] { LockFile(EntryFile); }, {}, {1, "", EntryFile + ": não pode ser lido\n"}},
      {"a directory that cannot be written to",
       [] { TakeNoNewFiles(Place); },
       {"--titulo", "Outro"},
       {1, none, EntryFile + ": não pode ser gravado\n"}},
      {"a file in place of the repository",
       [] {},
       {"--repositorio", "C:\\k.pem"},
       {1, "", "C:\\k.pem: não é um diretório\n"}},
      {"no title the first time",
       [] {},
       {"--repositorio", "C:\\novo"},
       {2, none, "tvk: falta a opção --titulo: este repositório ainda não tem um\nVeja tvk --ajuda.\n"}},
      {"a line of the list without its package",
       [] { PutFile("C:\\l.csv", "dos\nTRES\n"); },
       {"--lista", "C:\\l.csv"},
       {1, none, inList + "nenhum dos pacotes tem o nome DOS 'TRES'\n"}},
      {"a line of the list twice",
       [] { PutFile("C:\\l.csv", "dos\nUM\num\n"); },
       {"--lista", "C:\\l.csv"},
       {1, none, "C:\\l.csv:3: o nome DOS 'UM' já é de outro destes jogos\n"}},
      {"a list with a line break in a field",
       [] { PutFile("C:\\l.csv", "dos,descricao\nUM,\"a\nb\"\n"); },
       {"--lista", "C:\\l.csv"},
       {1, none, inList + "a coluna descricao tem mais de uma linha, um caractere de controle ou texto demais\n"}},
      {"a list with a long field",
       [] { PutFile("C:\\l.csv", "dos,autor\nUM," + std::string(4'090, 'x')); },
       {"--lista", "C:\\l.csv"},
       {1, none, inList + "a coluna autor tem mais de uma linha, um caractere de controle ou texto demais\n"}},
      {"a missing list", [] {}, {"--lista", "C:\\falta.csv"}, {1, none, "C:\\falta.csv: não existe\n"}},
  };
  for (const auto& each : cases) {
    SCOPED_TRACE(each.Name);
    SetUp();
    PublishFirst();
    each.Prepare();
    const Files before = Standing();
    Texts arguments = {"publicar", "C:\\p"};
    if (std::ranges::find(each.Options, "--chave") == each.Options.end())
      arguments.insert(arguments.end(), {"--chave", Key});
    if (std::ranges::find(each.Options, "--repositorio") == each.Options.end()) {
      arguments.insert(arguments.end(), {"--repositorio", "C:\\R"});
    }
    arguments.insert(arguments.end(), each.Options.begin(), each.Options.end());
    EXPECT_EQ(RunTvk(arguments), each.Told);
    EXPECT_EQ(Standing(), before);
  }
}

}  // namespace
