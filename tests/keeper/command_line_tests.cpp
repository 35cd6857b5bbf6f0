#include <fstream>
#include <iterator>
#include <sstream>

#include "tests/keeper/keeper.h"

namespace {

struct CommandLine : Keeper {
  static void TranslateIntoEnglish() {
    std::ifstream file(TRANSLATION, std::ios::binary);
    const std::string content{std::istreambuf_iterator<char>(file), {}};
    PutFile("C:\\Tolvaris\\language.ini", platform::FromUtf8(content));
  }

  static Texts NineMirrors() {
    Texts arguments = {"publicar", "--chave", "k", "--repositorio", "r", "x"};
    for (int i = 0; i < 9; ++i) arguments.insert(arguments.end(), {"--espelho", "https://a.example/"});
    return arguments;
  }

  static void PutPackages() {
    for (const char* name : {"Um", "Dois", "Três"}) {
      PutFile("C:\\Tolvaris\\p\\"s + platform::FromUtf8(name) + ".tvk", Package(platform::FromUtf8(name), "UM"));
    }
  }
};

TEST_F(CommandLine, HelpFitsOneScreenInBothLanguages) {
  const std::pair<Texts, Texts> cases[] = {
      // the arguments, and words that the help has
      {{"--ajuda"},
       {"criar ", "listar ", "verificar ", "extrair ", "instalar ", "nomear ", "desfazer ", "chave ", "publicar "}},
      {{"criar", "--ajuda"}, {"--nome", "--dos", "--figura", "--saida", "--instalacao", "--lista"}},
      {{"listar", "--ajuda"}, {"--csv"}},
      {{"verificar", "x", "--ajuda"}, {"--csv"}},
      {{"extrair", "--ajuda"}, {"--saida"}},
      {{"instalar", "--ajuda"}, {"--instalacao", "--substituir"}},
      {{"nomear", "--ajuda"}, {"--instalacao", "--simular"}},
      {{"desfazer", "--ajuda"}, {"--instalacao"}},
      {{"chave", "--ajuda"}, {"tvk chave ARQUIVO"}},
      {{"publicar", "--ajuda"},
       {"--titulo", "--espelho", "--validade", "--lista", "--limpar", "--simular", "--chave", "--repositorio"}},
  };
  for (const bool english : {false, true}) {
    if (english) TranslateIntoEnglish();
    for (const auto& [arguments, words] : cases) {
      const Outcome told = RunTvk(arguments);
      EXPECT_EQ(told.Status, 0);
      for (const std::string& word : words) EXPECT_NE(told.Output.find(word), std::string::npos) << word;
      std::istringstream lines(told.Output);
      int count = 0;
      for (std::string line; std::getline(lines, line); ++count) EXPECT_LT(line.size(), 80U) << line;
      EXPECT_LT(count, 25);
    }
    EXPECT_EQ(RunTvk({"--ajuda"}).Output.find("Packages") == 0, english);
  }
}

TEST_F(CommandLine, WhatIsWrongIsToldAndEndsWith2) {
  const struct {
    const char* Name;
    Texts Arguments;
    std::string Said;
  } cases[] = {
      {"no verb", {}, "falta o verbo"},
      {"another verb", {"limpar"}, "verbo desconhecido: limpar"},
      {"no files", {"listar"}, "faltam os arquivos"},
      {"no files for an installation", {"instalar", "--instalacao", "C:\\T"}, "faltam os arquivos"},
      {"another option", {"listar", "--tudo", "x"}, "opção desconhecida: --tudo"},
      {"an option of another verb", {"listar", "--saida", "x"}, "opção desconhecida: --saida"},
      {"an option twice", {"listar", "--csv", "--csv", "x"}, "opção repetida: --csv"},
      {"no value", {"extrair", "x", "--saida"}, "falta o valor da opção --saida"},
      {"a value outside the code page",
       {"extrair", "--saida", "日本", "x"},
       "--saida: tem um caractere que a página de código do Windows não tem"},
      {"no installation", {"nomear", "l.csv"}, "falta a opção --instalacao"},
      {"two files where one can be", {"desfazer", "--instalacao", "C:\\T", "a", "b"}, "só pode vir um arquivo"},
      {"a list and files",
       {"criar", "--lista", "l.csv", "x.smc"},
       "--instalacao, --lista e arquivos não podem vir juntos"},
      {"a name for two games",
       {"criar", "--nome", "X", "a.smc", "b.smc"},
       "--nome, --dos e --figura valem para um jogo só"},
      {"two keys", {"chave", "a", "b"}, "só pode vir um arquivo"},
      {"no key", {"publicar", "--repositorio", "r", "x"}, "falta a opção --chave"},
      {"no repository", {"publicar", "--chave", "k", "--repositorio", "", "x"}, "falta a opção --repositorio"},
      {"an empty title",
       {"publicar", "--chave", "k", "--repositorio", "r", "--titulo", "", "x"},
       "--titulo é uma linha de texto, nem vazia nem longa demais"},
      {"a mirror of another kind",
       {"publicar", "--chave", "k", "--repositorio", "r", "--espelho", "http://a/", "x"},
       "--espelho http://a/ não serve: https://, sem usuário, ? nem #, e com / no fim"},
      {"nine mirrors", NineMirrors(), "--espelho pode vir até 8 vezes"},
      {"no days",
       {"publicar", "--chave", "k", "--repositorio", "r", "--validade", "0", "x"},
       "--validade é um número de dias, de 1 a 36500"},
      {"too many days",
       {"publicar", "--chave", "k", "--repositorio", "r", "--validade", "36501", "x"},
       "--validade é um número de dias, de 1 a 36500"},
  };
  for (const auto& [name, arguments, said] : cases) {
    EXPECT_EQ(RunTvk(arguments), (Outcome{2, "", "tvk: " + said + "\nVeja tvk --ajuda.\n"})) << name;
  }
  EXPECT_EQ(AllFiles(), Texts{});
}

TEST_F(CommandLine, FilesComeFromWildcardsDirectoriesAndLists) {
  PutPackages();
  PutFile("C:\\Tolvaris\\p\\outro.txt", "x");
  PutFile("C:\\Tolvaris\\lista.txt", "\xEF\xBB\xBFp\\Um.tvk\r\n\r\n  p/Três.tvk\n--csv");
  PutFile("C:\\Tolvaris\\ansi.txt", "p\\Três.tvk"_ansi);
  PutDirectory("C:\\Tolvaris\\vazio");
  const std::string um = "p\\Um.tvk", dois = "p\\Dois.tvk", tres = "p\\Três.tvk";
  const struct {
    const char* Name;
    Texts Arguments;
    Texts Listed;
    std::string Refused = {};
  } cases[] = {
      {"a wildcard", {"p/*s.tvk"}, {dois, tres}},
      {"a directory", {"p"}, {dois, tres, um}},
      {"a list with its mark", {"@lista.txt"}, {um, tres}},
      {"a list of the ANSI code page", {"@ansi.txt"}, {tres}},
      {"behind the end of the options",
       {"--", "p\\Um.tvk", "@ansi.txt", "-x"},
       {um},
       "@ansi.txt: não existe\n-x: não existe\n"},
      {"no such file", {um, "p\\*.zip"}, {um}, "p\\*.zip: nenhum arquivo tem um nome assim\n"},
      {"no packages", {"vazio", um}, {um}, "vazio: não há pacotes neste diretório\n"},
      {"no such list", {"@falta.txt", um}, {um}, "falta.txt: não existe\n"},
      {"a name outside the code page",
       {"日本.tvk", um},
       {um},
       "日本.tvk: tem um caractere que a página de código do Windows não tem\n"},
  };
  for (const auto& [name, arguments, listed, refused] : cases) {
    Texts all = {"listar", "--csv"};
    if (name == "a list with its mark"s) all.pop_back();
    all.insert(all.end(), arguments.begin(), arguments.end());
    SetArguments(all);
    EXPECT_EQ(Tvk(), refused.empty() ? 0 : 1) << name;
    std::istringstream lines(TakeStream(platform::Stream::Output));
    Texts found;
    for (std::string line; std::getline(lines, line);) found.push_back(line.substr(0, line.find(',')));
    Texts expected = {"arquivo"};
    expected.insert(expected.end(), listed.begin(), listed.end());
    EXPECT_EQ(found, expected) << name;
    std::string errors = TakeStream(platform::Stream::Error);
    std::erase(errors, '\r');
    EXPECT_EQ(errors, refused) << name;
  }
}

TEST_F(CommandLine, OutputThatCannotBeWrittenEndsWith1) {
  int failed = 0;
  for (int call = 1; call <= 3; ++call) {
    FailCall(call);
    const Outcome told = RunTvk({"--versao"});
    EXPECT_EQ(told.Status, told.Output.empty() ? 1 : 0);
    failed += told.Status;
  }
  EXPECT_EQ(failed, 1);
}

TEST_F(CommandLine, ProgressIsShownOnAConsoleOnly) {
  PutPackages();
  EXPECT_EQ(RunTvk({"verificar", "p\\Um.tvk", "p\\Dois.tvk", "p"}).Errors.find("MB/s"), std::string::npos);
  UseConsole();
  SetArguments({"verificar", "p\\Um.tvk", "p\\Um.tvk", "p\\Um.tvk"});
  Tvk();
  const std::string errors = TakeStream(platform::Stream::Error);
  EXPECT_NE(errors.find("2 de 3, "), std::string::npos) << errors;
  EXPECT_NE(errors.find(" MB/s\r                "), std::string::npos) << "it is wiped out again: " << errors;
}

}  // namespace
