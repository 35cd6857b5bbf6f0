// The keeper's tool, run as on a console, and what other programs make of its packages.
#include <array>
#include <cstdlib>
#include <filesystem>

#include "tests/windows/installation.h"

namespace {

const std::string Keeper = Home + "tvk.exe";

struct Ended {
  DWORD Status;
  std::string Output, Errors;
  bool operator==(const Ended&) const = default;
};

void PrintTo(const Ended& ended, std::ostream* out) {
  *out << "status " << ended.Status << "\noutput:\n" << ended.Output << "errors:\n" << ended.Errors;
}

HANDLE CreateInheritable(const std::string& path) {
  SECURITY_ATTRIBUTES inherited{sizeof inherited, nullptr, TRUE};
  return CreateFileA(path.c_str(), GENERIC_WRITE, FILE_SHARE_READ, &inherited, CREATE_ALWAYS, 0, nullptr);
}

std::string TakeText(const std::string& path) {
  std::string text = ContentOf(path);
  std::erase(text, '\r');
  return text;
}

class Tvk : public Installation {
 protected:
  Tvk() { Put("tvk.exe", ContentOf(TVK_PROGRAM)); }

  // Runs it in the directory Outside with its output in files; the arguments are of UTF-16, as any program gives them.
  static Ended RunTvk(const std::wstring& arguments) {
    STARTUPINFOW how{};
    how.cb = sizeof how;
    how.dwFlags = STARTF_USESTDHANDLES;
    how.hStdOutput = CreateInheritable("C:\\saida");
    how.hStdError = CreateInheritable("C:\\erros");
    PROCESS_INFORMATION process{};
    std::wstring line = L"C:\\Ensaio\\tvk.exe " + arguments;
    EXPECT_TRUE(CreateProcessW(nullptr, line.data(), nullptr, nullptr, TRUE, 0, nullptr, L"C:\\Fora", &how, &process));
    EXPECT_EQ(WaitForSingleObject(process.hProcess, Limit), WAIT_OBJECT_0);
    DWORD status = 99;
    GetExitCodeProcess(process.hProcess, &status);
    for (const HANDLE each : {how.hStdOutput, how.hStdError, process.hProcess, process.hThread}) CloseHandle(each);
    return {status, TakeText("C:\\saida"), TakeText("C:\\erros")};
  }

  // What a program of the machine that Wine runs on says in that directory.
  static std::string Machine(const std::string& command) {
    const Program shell("/bin/sh -c \"(" + command + ") >saida- 2>&1; mv saida- saida\"", Outside);
    EXPECT_SOON(std::filesystem::exists(Outside + "saida")) << command;
    const std::string said = ContentOf(Outside + "saida");
    DeleteFileA((Outside + "saida").c_str());
    return said;
  }
};

TEST_F(Tvk, IsSmall) { EXPECT_LT(ContentOf(TVK_PROGRAM).size(), 1'000'000u); }

TEST_F(Tvk, PacksVerifiesInstallsAndPacksTheSameAgain) {
  PutFile(Outside + "jogos\\Ação Máxima.sfc", Bytes(1, 300'000));
  PutFile(Outside + "jogos\\Ação Máxima.gif", Gif(RGB(10, 200, 60)));
  PutFile(Outside + "jogos\\ZEBRA.smc", Bytes(2, 512 + 32'768));
  PutFile(Outside + "jogos\\ZEBRA.gif", Gif(RGB(220, 20, 40)));
  EXPECT_EQ(RunTvk(L"criar --saida p jogos\\*.s?c"),
            (Ended{0,
                   "ACAOCBUM  p\\A\xC3\xA7\xC3\xA3o M\xC3\xA1xima.tvk\nZEBRA     p\\ZEBRA.tvk\n"
                   "Pacotes gravados: 2; iguais aos que j\xC3\xA1 estavam l\xC3\xA1: 0.\n",
                   ""}));
  EXPECT_EQ(RunTvk(L"verificar p"), (Ended{0, "Pacotes bons: 2; recusados: 0.\n", ""}));
  EXPECT_NE(RunTvk(L"listar --csv p")
                .Output.find("p\\A\xC3\xA7\xC3\xA3o M\xC3\xA1xima.tvk,A\xC3\xA7\xC3\xA3o "
                             "M\xC3\xA1xima,ACAOCBUM,"),
            std::string::npos);

  // By the Python implementation, and by those of archives.
  EXPECT_EQ(PackageFormat(Outside, "read p/ZEBRA.tvk figura rom.zip").substr(0, 12), "ZEBRA\nZEBRA\n");
  EXPECT_EQ(ContentOf(Outside + "figura"), Gif(RGB(220, 20, 40)));
  EXPECT_EQ(Machine("unzip -tqq rom.zip && unzip -p rom.zip ZEBRA.smc | cmp - jogos/ZEBRA.smc && echo ok"), "ok\n");
  EXPECT_EQ(RunTvk(L"extrair --saida e p\\*.tvk").Status, 0u);
  EXPECT_EQ(Machine("python3 -m zipfile -t e/ACAOCBUM.zip && python3 -m zipfile -l e/ACAOCBUM.zip | tail -n 1"),
            "Done testing\nA\xC3\xA7\xC3\xA3o M\xC3\xA1xima.smc                                1980-01-01 00:00:00     "
            "  300000\n");

  std::filesystem::create_directories(Outside + "T");
  EXPECT_EQ(RunTvk(L"instalar --instalacao T p").Status, 0u);
  EXPECT_EQ(ContentOf(Outside + "T\\tolvaris.dat"), "|ACAOCBUM=Ação Máxima||ZEBRA=ZEBRA|");
  EXPECT_EQ(RunTvk(L"criar --instalacao T --saida p2").Status, 0u);
  ExpectFiles(FilesIn(Outside + "p\\"), FilesIn(Outside + "p2\\"));
}

TEST_F(Tvk, InstallsIntoTheCollectionThatTheMenuLists) {
  PutFile(Outside + "n.tvk", Package("Coração à Vista", "CORACAO", "-873187034", Gif(RGB(220, 20, 40)), "123456789"));
  EXPECT_EQ(RunTvk(L"instalar n.tvk").Status, 0u);
  Start();
  Texts expected = Games;
  expected.insert(expected.begin() + 2, "Coração à Vista");
  EXPECT_SOON_EQ(expected, Entries(window->List));
  Select("Coração à Vista");
  EXPECT_SOON_EQ(RGB(220, 20, 40), window->Preview());
  window->Play.Click();
  ExpectPlayed("CORACAO.zip");
}

TEST_F(Tvk, NamesGamesWhileNobodyHasTheCatalogueOpenAndTakesItBack) {
  Put("Imgs\\Zebra.gif", Gif(RGB(220, 20, 40)));
  Put("Imgs\\Élan.gif", Gif(RGB(10, 200, 60)));
  PutFile(Outside + "n.csv", "dos;nome\r\nZEBRA;Élan\r\nELAN;Zebra\r\nABELHA;Abelha\r\n");
  const std::string catalogue = Content("tolvaris.dat");
  const Files pictures = FilesIn(Home + "Imgs\\");
  const std::wstring name = L"nomear --instalacao C:\\Ensaio n.csv";
  const Ended refused = {
      1, "",
      "C:\\Ensaio\\tolvaris.dat: est\xC3\xA1 aberto em outro programa, ou n\xC3\xA3o pode ser gravado; "
      "feche o Tolvaris\n"};
  Start();
  EXPECT_EQ(RunTvk(name), (Ended{1, "Nada mudou.\n", refused.Errors}));
  program.reset();
  const Ended named = RunTvk(name);
  EXPECT_EQ(named.Status, 0u) << named.Errors;
  Start();
  Select("Élan");
  EXPECT_SOON_EQ(RGB(220, 20, 40), window->Preview());
  EXPECT_EQ(Entries(window->List).front(), "Abelha");
  window->Play.Click();
  ExpectPlayed("ZEBRA.SMC");

  const std::string file =
      named.Output.substr(named.Output.rfind(' ') + 1, named.Output.size() - named.Output.rfind(' ') - 2);
  const std::wstring undo = L"desfazer --instalacao C:\\Ensaio " + std::wstring(file.begin(), file.end());
  EXPECT_EQ(RunTvk(undo), refused);
  program.reset();
  EXPECT_EQ(RunTvk(undo), (Ended{0, "Desfeito. Figuras que voltaram: 2.\n", ""}));
  EXPECT_EQ(Content("tolvaris.dat"), catalogue);
  ExpectFiles(pictures, FilesIn(Home + "Imgs\\"));
}

// Keys and signatures as OpenSSL has them, and the whole as a reader in Python.
TEST_F(Tvk, PublishesWhatOtherProgramsConfirm) {
  PutFile(Outside + "p\\um.tvk", Package("Ação", "ACAO", "-873187034", Gif(RGB(220, 20, 40)), "123456789"));
  PutFile(Outside + "p\\dois.tvk", Package("Dois", "DOIS", "-873187034", Gif(RGB(1, 2, 3)), "123456789"));
  const Ended made = RunTvk(L"chave k.pem");
  EXPECT_EQ(made.Status, 0u);
  const Ended again = RunTvk(L"chave k.pem");
  EXPECT_EQ(again.Status, 1u);
  const std::wstring publish = L"publicar --chave k.pem --repositorio r p";
  const Ended first = RunTvk(publish + L" --titulo \"Clube S\x00E3o Jo\x00E3o\" --espelho https://a.example/");
  EXPECT_EQ(first.Errors, "");
  EXPECT_NE(first.Output.find("Publicado com o n\xC3\xBAmero de s\xC3\xA9rie "), std::string::npos) << first.Output;

  EXPECT_EQ(Machine("openssl ec -in k.pem -noout -check 2>&1 | tail -n 1"), "EC Key valid.\n");
  const std::string print =
      Machine("openssl ec -in k.pem -pubout -outform DER 2>&- | tail -c 65 | sha256sum | cut -c 1-64");
  EXPECT_NE(made.Output.find(" da chave: " + print), std::string::npos) << print << made.Output;
  EXPECT_NE(first.Output.find(" da chave: " + print), std::string::npos);
  const std::string read = Machine("python3 '" READ_REPOSITORY_PY "' r");
  EXPECT_EQ(read.substr(0, 17), "Clube S\xC3\xA3o Jo\xC3\xA3o ") << read;
  EXPECT_LT(std::abs(std::stoll(Machine("date +%s")) - std::stoll(read.substr(17))), 60)
      << "the serial number is the time";
  EXPECT_EQ(read.substr(read.find('\n')), "\nA\xC3\xA7\xC3\xA3o\nDois\n");
  EXPECT_EQ(Machine("cd r && for f in */*; do n=${f#*/}; sha256sum $f | grep -q ^${n%.*} || echo $f; done"), "");

  const Files published = FilesIn(Outside + "r\\");
  EXPECT_EQ(published.size(), 6u);
  EXPECT_EQ(RunTvk(publish).Errors, "");
  ExpectFiles(published, FilesIn(Outside + "r\\"));
  EXPECT_EQ(Machine("openssl genpkey -algorithm EC -pkeyopt ec_paramgen_curve:P-256 -out outra.pem"), "");
  EXPECT_EQ(RunTvk(L"publicar --chave outra.pem --repositorio r2 --titulo X p").Errors, "");
  EXPECT_EQ(Machine("python3 '" READ_REPOSITORY_PY "' r2").substr(0, 2), "X ");
}

TEST_F(Tvk, RefusesByNameWhatTheCodePageLacks) {
  EXPECT_EQ(RunTvk(L"verificar \x65E5\x672C.tvk"),
            (Ended{1, "",
                   "\xE6\x97\xA5\xE6\x9C\xAC.tvk: tem um caractere que a p\xC3\xA1gina de c\xC3\xB3"
                   "digo do Windows n\xC3\xA3o tem\n"}));
}

// A console of its own, whose screen is read back.
TEST_F(Tvk, SpeaksOnEveryConsoleAndInUtf8Elsewhere) {
  EXPECT_NE(RunTvk(L"--ajuda")
                .Output.find("p\xC3\xB5"
                             "e os jogos"),
            std::string::npos);
  FreeConsole();  // that of the test, where it has one
  ASSERT_TRUE(AllocConsole());
  const HANDLE screen = CreateFileA("CONOUT$", GENERIC_READ | GENERIC_WRITE, FILE_SHARE_READ | FILE_SHARE_WRITE,
                                    nullptr, OPEN_EXISTING, 0, nullptr);
  for (const UINT codePage : {437u, 850u, 1252u}) {
    SetConsoleOutputCP(codePage);
    SetConsoleCursorPosition(screen, {0, 0});
    STARTUPINFOA how{};
    how.cb = sizeof how;
    how.dwFlags = STARTF_USESTDHANDLES;
    how.hStdOutput = how.hStdError = screen;
    SetHandleInformation(screen, HANDLE_FLAG_INHERIT, HANDLE_FLAG_INHERIT);
    PROCESS_INFORMATION process{};
    std::string line = Keeper + " --ajuda";
    EXPECT_TRUE(CreateProcessA(nullptr, line.data(), nullptr, nullptr, TRUE, 0, nullptr, "C:\\", &how, &process));
    EXPECT_EQ(WaitForSingleObject(process.hProcess, Limit), WAIT_OBJECT_0);
    std::array<wchar_t, 80> shown{};
    DWORD read = 0;
    ReadConsoleOutputCharacterW(screen, shown.data(), 75, {0, 8}, &read);
    EXPECT_EQ(std::wstring(shown.data()).substr(14, 12),
              L"p\x00F5"
              L"e os jogos")
        << codePage;
    CloseHandle(process.hProcess);
    CloseHandle(process.hThread);
  }
  CloseHandle(screen);
  FreeConsole();
}

}  // namespace
