// What a repository says of its games beside what their packages hold: author, licence, description and version.
#pragma once

#include <map>
#include <string>
#include <vector>

#include "keeper/relato.h"
#include "repository/indice.h"

class Fichas {
 public:
  // As games have them that are published already.
  explicit Fichas(const std::vector<JogoPublicado>& Jogos);

  // As a list has them, with the columns dos, autor, licenca, descricao, versao. What is wrong with it is told.
  Fichas(const std::string& Lista, Relato& Onde);

  // Gives the game its texts, which have been asked for by nobody else.
  void Preencher(JogoPublicado& Jogo);

  // Tells each line of the list whose game nobody has asked for.
  void RecusarSobras(Relato& Onde) const;

 private:
  struct Ficha {
    std::string Onde;  // the list and its line
    JogoPublicado Textos;
    bool Usada = false;
  };
  std::map<std::string, Ficha> fichas_;  // by DOS name
};
