// Stands in for the downloader: waits until it is told to go on, adds a game with its catalogue entry to the program's
// directory, and gives the program its window back by the handle of its command line.
#include "tests/windows/standins/recording.h"

namespace {

// Opened for nobody else: the program has closed its catalogue.
void Append(const std::string& path, const std::string& text) {
  const HANDLE file = CreateFileA(path.c_str(), FILE_APPEND_DATA, 0, nullptr, OPEN_ALWAYS, 0, nullptr);
  DWORD written = 0;
  WriteFile(file, text.data(), static_cast<DWORD>(text.size()), &written, nullptr);
  CloseHandle(file);
}

}  // namespace

int WINAPI WinMain(HINSTANCE, HINSTANCE, LPSTR arguments, int) {
  const HANDLE wanted = OpenEventA(SYNCHRONIZE, FALSE, "TolvarisDownload");
  standins::RecordCall();
  if (WaitForSingleObject(wanted, 60'000) != WAIT_OBJECT_0) return 1;
  const std::string path = standins::OwnPath();
  const std::string directory = path.substr(0, path.rfind('\\') + 1);
  Append(directory + "Roms\\NOVO.zip", "jogo");
  Append(directory + "tolvaris.dat", "|NOVO=Nave Nova|");
  EnableWindow(reinterpret_cast<HWND>(std::strtoll(arguments, nullptr, 10)), TRUE);
  return 0;
}
