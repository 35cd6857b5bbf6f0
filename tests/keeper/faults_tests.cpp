// The verbs that write, with each call of the platform failing in turn.
#include "tests/keeper/client.h"

namespace {

struct Faults : Keeper {};

bool Has(const Files& files, const std::string& path, const std::string& content) {
  const auto found = files.find(path);
  return found != files.end() && found->second == content;
}

// Each file is old or new, whole, and what is not done is told.
TEST_F(Faults, LeaveOldOrNewFilesAndAreTold) {
  const struct {
    const char* Name;
    Texts Arguments;
    Texts Directories;
  } verbs[] = {
      {"criar",
       {"criar", "--saida", "C:\\saida", "C:\\jogos\\Super Jogo.smc", "C:\\jogos\\outro.smc"},
       {"C:\\saida\\"}},
      {"criar --lista", {"criar", "--saida", "C:\\saida", "--lista", "C:\\jogos\\l.csv"}, {"C:\\saida\\"}},
      {"criar --instalacao", {"criar", "--saida", "C:\\saida", "--instalacao", "C:\\T"}, {"C:\\saida\\"}},
      {"extrair", {"extrair", "--saida", "C:\\saida", "C:\\p.tvk"}, {"C:\\saida\\"}},
      {"instalar",
       {"instalar", "--instalacao", "C:\\T", "--substituir", "C:\\p.tvk"},
       {"C:\\T\\Roms\\", "C:\\T\\Imgs\\"}},
  };
  for (const auto& verb : verbs) {
    SCOPED_TRACE(verb.Name);
    Files before, after;
    Outcome told{};
    const auto prepare = [&] {
      for (const char* game : {"Super Jogo", "outro"}) {
        PutFile("C:\\jogos\\"s + game + ".smc", Rom);
        PutFile("C:\\jogos\\"s + game + ".gif", Picture);
      }
      PutFile("C:\\jogos\\l.csv", "arquivo\nSuper Jogo.smc\n");
      PutFile("C:\\p.tvk", Package("Super Jogo", "SUPER"));
      PutFile("C:\\saida\\Super Jogo.tvk", "old");
      PutFile("C:\\T\\tolvaris.dat", "|X=Outro|");
      PutFile("C:\\T\\Roms\\SUPER.zip", "old rom" + std::string(32'761, 'x'));
      PutFile("C:\\T\\Imgs\\SUPER.gif", Picture);
      PutFile("C:\\T\\Imgs\\Super Jogo.gif", Picture);
      before = Standing();
    };
    const auto operate = [&] { told = RunTvk(verb.Arguments); };
    const auto check = [&] {
      for (const auto& [path, content] : after) {
        EXPECT_TRUE(Content(path) == content || told.Status == 1) << path << " is not told of";
      }
      EXPECT_EQ(OpenFiles(), 0U);
      EXPECT_EQ(Leftovers(verb.Directories), Texts{});
      for (const bool cut : {false, true}) {
        if (cut) CutPower();
        for (const auto& [path, content] : Standing()) {
          const bool part = path == "C:\\T\\tolvaris.dat" && after[path].starts_with(content);
          const bool whole = Has(before, path, content) || Has(after, path, content);
          EXPECT_TRUE(whole || part) << path;
        }
        for (const auto& [path, content] : before) EXPECT_TRUE(Content(path)) << path << " is gone";
      }
    };
    Renew();
    prepare();
    operate();
    after = Standing();
    EXPECT_EQ(told.Status, 0) << told.Errors;
    EXPECT_GT(WithEachFault(prepare, operate, check), 5);
  }
}

// Whatever fails, a client finds a repository that is whole: the one before, or the new one when that was told.
TEST_F(Faults, LeaveARepositoryThatAClientCanUse) {
  const std::string place = "C:\\R\\", key = "C:\\k.pem";
  const auto publish = [&](const Texts& more) {
    Texts arguments = {"publicar", "--chave", key, "--repositorio", "C:\\R", "C:\\p"};
    arguments.insert(arguments.end(), more.begin(), more.end());
    return RunTvk(arguments);
  };
  Outcome told{};
  std::int64_t serial = 0;
  bool first = true;
  const auto prepare = [&] {
    RunTvk({"chave", key});
    PutFile("C:\\p\\um.tvk", Package("Um Jogo", "UM"));
    PutFile("C:\\p\\dois.tvk", Package("Dois", "DOIS"));
    if (first) return;
    publish({"--titulo", "Clube"});
    RemoveFile("C:\\p\\um.tvk");
    PutFile("C:\\p\\tres.tvk", Package("Tres", "TRES", Rom, contract::SmallJpeg()));
    PutFile(place + "pacotes\\" + std::string(64, '0') + ".tvk", "");
    CutPower();  // all of this is on the disk
    serial = LookAt(place).Entry.Serie;
  };
  const auto operate = [&] { told = publish({"--titulo", "Novo", "--limpar"}); };
  const auto check = [&] {
    FailCall(0);
    const auto look = [&] {
      const Seen seen = LookAt(place);
      const bool isNew = seen.Entry.Titulo == "Novo";
      if (first && !isNew) {
        EXPECT_FALSE(Content(place + "entrada.txt")) << "half a repository: " << seen.Fault;
      } else {
        EXPECT_EQ(seen.Fault, "");
      }
      EXPECT_TRUE(isNew || told.Status == 1);
      EXPECT_TRUE(first || isNew == (seen.Entry.Serie > serial));
    };
    look();
    CutPower();
    look();
    EXPECT_EQ(OpenFiles(), 0U);
    EXPECT_EQ(Leftovers({place, place + "indice\\", place + "pacotes\\", place + "figuras\\"}), Texts{});
    EXPECT_EQ(publish({"--titulo", "Novo"}).Status, 0) << "it goes on from there";
    EXPECT_EQ(LookAt(place).Entry.Titulo, "Novo");
  };
  for (const bool isFirst : {true, false}) {
    SCOPED_TRACE(isFirst ? "the first time" : "over another state");
    first = isFirst;
    EXPECT_GT(WithEachFault(prepare, operate, check), 30);
  }
}

// The key is there, whole and told of, or it is not there.
TEST_F(Faults, LeaveAWholeKeyOrNone) {
  Outcome told{};
  const auto operate = [&] { told = RunTvk({"chave", "C:\\chaves\\k.pem"}); };
  const auto check = [&] {
    const auto key = Content("C:\\chaves\\k.pem");
    EXPECT_TRUE(!key || LerChave(*key)) << "half a key";
    EXPECT_TRUE(key || told.Status == 1);
    EXPECT_EQ(Leftovers({"C:\\chaves\\"}), Texts{});
  };
  EXPECT_GT(WithEachFault([] {}, operate, check), 5);
}

}  // namespace
