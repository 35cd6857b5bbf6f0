// Looking for the emulator on the disks, one directory at a time.
#pragma once

#include <deque>
#include <map>
#include <string>
#include <vector>

// A directory to look into (with a backslash at its end), and so many levels of directories in it. Of the first level
// only those whose names match one of the patterns.
struct Lugar {
  std::string Diretorio;
  int Niveis;
  std::string Nomes = "*";
};

// Where an emulator may be, the likeliest first: the program's own directory, the directories of programs on each
// built-in disk, and those of the PATH.
std::vector<Lugar> LugaresUsuais();

// A search that stops between any two directories. It comes to an end even where directories lead back to themselves,
// as it goes no deeper than it is told and looks into a limited number of directories at each place.
class Procura {
 public:
  explicit Procura(std::vector<Lugar> Lugares);

  bool Terminou() const { return fila_.empty() && faltam_.empty(); }

  // Looks into one more directory. The full paths of the emulators in it that can be started here, the likelier first.
  std::vector<std::string> Passo();

 private:
  void Descer(const Lugar& Atual);

  std::deque<Lugar> faltam_;           // places not begun
  std::deque<Lugar> fila_;             // of the present place: directories not looked into
  int resto_ = 0;                      // how many directories the present place may still take
  std::map<std::string, int> vistos_;  // in upper case: so many levels of it have been, or will be, looked into
};
