// Import and export of a game of 6 MiB as a package, in turn with copying that package by plainly reading and writing
// it, and with the same copy when it is to be on the disk itself. The commands are the window's own, from the moment a
// file is named to the message that tells the end; dialogs and messages are answered at once, here.
#include "benchmarks/games.h"
#include "benchmarks/median.h"
#include "mainwindow/Form1.h"
#include "platform/files.h"
#include "platform/messages.h"

namespace {

using namespace benchmarks;

constexpr int Rounds = 31;
constexpr std::size_t RomLength = (6 << 20) + 512;  // with the header that old copiers put before a ROM
constexpr std::size_t PictureLength = 20'000;

std::string package;  // what the dialogs answer with
Stopwatch sinceDialog;
double untilMessage = 0;
std::string message;  // title of the last one

bool AnswerDialog(platform::OpenFileName& request) {
  request.File = package;
  sinceDialog = {};
  return true;
}

}  // namespace

// Linked instead of the platform's own.
namespace platform {

bool GetOpenFileNameA(OpenFileName& request) { return AnswerDialog(request); }
bool GetSaveFileNameA(OpenFileName& request) { return AnswerDialog(request); }

Answer MessageBoxA(const std::string&, const std::string& title, Buttons, Icon) {
  untilMessage = sinceDialog.Milliseconds();
  message = title;
  return Answer::Ok;
}

}  // namespace platform

namespace {

bool Write(const std::string& path, std::string_view content) {
  return platform::File(path, platform::Access::ReadWrite).Write(0, content);
}

std::string Bytes(std::size_t length) {
  std::string bytes(length, '\0');
  std::uint32_t state = 1;
  for (char& byte : bytes) byte = static_cast<char>((state = state * 1'664'525 + 1'013'904'223) >> 24);
  return bytes;
}

// True when the command ended well.
bool Command(Form1& window, void (Form1::*click)(), std::vector<double>& times) {
  message.clear();
  (window.*click)();
  times.push_back(untilMessage);
  return message == "Ok";
}

bool Copy(const std::string& to, bool flush, std::vector<double>& times) {
  platform::DeleteFileA(to);
  const Stopwatch watch;
  platform::File source(package, platform::Access::Read);
  std::string bytes(static_cast<std::size_t>(source.Size()), '\0');
  bool done = source.Read(0, bytes.data(), bytes.size()) == static_cast<std::int64_t>(bytes.size());
  platform::File target(to, platform::Access::ReadWrite);
  done = target.Write(0, bytes) && done && (!flush || target.Flush());
  source.Close();
  target.Close();
  times.push_back(watch.Milliseconds());
  return done;
}

}  // namespace

int main() {
  const std::string directory = platform::ProgramDirectory() + "\\package\\";
  if (!InstallGames(directory, 1)) return 1;
  package = directory + "jogo.tvk";
  const std::string rom = DirRoms + DOSNameOf(0) + ".zip", picture = DirImgs + NameOf(0) + ".gif";
  platform::DeleteFileA(DirRoms + DOSNameOf(0) + ".SMC");
  bool done = Write(rom, Bytes(RomLength)) && Write(picture, Bytes(PictureLength));
  Form1 window;
  window.Show();
  std::vector<double> exported, imported, copied, flushed;
  for (int round = 0; done && round < Rounds; ++round) {
    window.CarregarLista(true);
    window.SelecionarNome(NameOf(0));
    platform::DeleteFileA(package);
    done = Command(window, &Form1::Command5_Click, exported);
    platform::DeleteFileA(rom);
    platform::DeleteFileA(picture);
    window.CarregarLista(true);
    done = done && Command(window, &Form1::Command4_Click, imported);
    done = done && Copy(directory + "copia", false, copied) && Copy(directory + "copia", true, flushed);
  }
  if (!done || platform::FileSize(rom) != static_cast<std::int64_t>(RomLength)) return 1;
  Tell("export of a package", exported);
  Tell("import of a package", imported);
  Tell("copy of a package", copied);
  Tell("copy of a package, flushed", flushed);
  return 0;
}
