// Filling the list of the real window with 10,000 files, in turn with the least that any such list costs: the search
// for the files, and a sorted list box of the same names. Then with 100,000 files.
#include <windows.h>

#include "benchmarks/games.h"
#include "benchmarks/median.h"
#include "catalog/cls_DAT.h"
#include "mainwindow/Form1.h"
#include "platform/files.h"

namespace {

using namespace benchmarks;

constexpr int Games = 10000, ManyGames = 100000;
constexpr int Rounds = 15, RoundsOfMany = 5;

double FillOfTheProgram(Form1& window) {
  const Stopwatch watch;
  window.CarregarLista(true);
  return watch.Milliseconds();
}

double BareSearch() {
  const Stopwatch watch;
  WIN32_FIND_DATAA data;
  const HANDLE find = ::FindFirstFileA((DirRoms + "*").c_str(), &data);
  int files = 0;
  while (find != INVALID_HANDLE_VALUE && ::FindNextFileA(find, &data)) ++files;
  ::FindClose(find);
  return files >= Games ? watch.Milliseconds() : -1;
}

double BareList(HWND list, const std::vector<Jogo>& games) {
  const Stopwatch watch;
  ::SendMessageA(list, LB_RESETCONTENT, 0, 0);
  ::SendMessageA(list, WM_SETREDRAW, FALSE, 0);
  for (const Jogo& game : games) {
    ::SendMessageA(list, LB_ADDSTRING, 0, reinterpret_cast<LPARAM>(game.Nome.c_str()));
  }
  ::SendMessageA(list, WM_SETREDRAW, TRUE, 0);
  ::InvalidateRect(list, nullptr, TRUE);
  ::UpdateWindow(list);
  return watch.Milliseconds();
}

HWND MakeBareList(HWND window) {
  RECT area;
  ::GetClientRect(window, &area);
  return ::CreateWindowExA(WS_EX_CLIENTEDGE, "LISTBOX", "", WS_CHILD | WS_VISIBLE | WS_VSCROLL | LBS_SORT | LBS_NOTIFY,
                           8, 16, 241, 238, window, nullptr, nullptr, nullptr);
}

}  // namespace

int main() {
  if (!InstallGames(platform::ProgramDirectory() + "\\list\\", Games)) return 1;
  Form1 window;
  window.Show();
  const HWND bareWindow = ::CreateWindowExA(0, "STATIC", "bare", WS_OVERLAPPEDWINDOW | WS_VISIBLE, 0, 0, 529, 300,
                                            nullptr, nullptr, nullptr, nullptr);
  const HWND bareList = MakeBareList(bareWindow);
  std::vector<double> program, bare;
  for (int round = 0; round < Rounds; ++round) {
    program.push_back(FillOfTheProgram(window));
    if (window.List1.Count() != Games || !window.Jogos.back().Catalogado) return 1;
    const double search = BareSearch();
    const double list = BareList(bareList, window.Jogos);
    if (search < 0 || ::SendMessageA(bareList, LB_GETCOUNT, 0, 0) != Games) return 1;
    bare.push_back(search + list);
  }
  Tell("list fill wine", program);
  Tell("list fill wine, bare", bare);

  if (!InstallGames(platform::ProgramDirectory() + "\\list\\", ManyGames)) return 1;
  Catalogo().Fechar();
  std::vector<double> many;
  for (int round = 0; round < RoundsOfMany; ++round) {
    many.push_back(FillOfTheProgram(window));
    if (window.List1.Count() != ManyGames || !window.Jogos.back().Catalogado) return 1;
  }
  Tell("list fill wine, 100,000", many);
  return 0;
}
