// What tvk tells: results on the standard output, refusals on the standard error, and on a console how far it is.
#pragma once

#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>

#include "support/textos.h"

// A DOS name as wide as the longest one, and two blanks.
std::string EmColunaDOS(const std::string& NomeDOS);

class Relato {
 public:
  // A line of the standard output, in the ANSI code page.
  void Linha(const std::string& Texto);

  // Says why something was refused, as "where: why".
  void Recusar(const std::string& Onde, const std::string& Porque);

  // The same of an argument that need not be in the code page.
  void RecusarUtf8(std::string_view Onde, const std::string& Porque);

  // Says what is wrong with the command line, and how help is had.
  void UsoErrado(const std::string& Porque);

  // How many there will be; how many of them are done, with so many bytes. Shown on a console only, in one line.
  void Comecar(std::size_t Total);
  void Andar(std::int64_t Bytes);
  void Terminar();

  std::size_t Recusados() const { return recusados_; }

  // The exit status: 0 all well, 1 something was refused or could not be told, 2 wrong use.
  int Estado() const;

 private:
  void Escrever(bool Erro, std::string_view Utf8);
  void ApagarAndamento();
  void MostrarAndamento(std::uint64_t Agora);

  std::size_t total_ = 0, feitos_ = 0, recusados_ = 0;
  std::int64_t bytes_ = 0;
  std::uint64_t inicio_ = 0, mostrado_ = 0;  // milliseconds
  std::size_t largura_ = 0;                  // of the line of progress that stands on the console
  bool usoErrado_ = false, calado_ = false;  // calado_: a text could not be written
};
