// Searching a text for a plain character, which in some code pages may equal the second byte of another one.
#pragma once

#include <string_view>

#include "platform/text.h"

// The position of the first one from `Inicio` on, or npos.
inline std::size_t AcharCaractere(std::string_view Texto, char Qual, std::size_t Inicio = 0) {
  std::size_t posicao = Texto.find(Qual, Inicio);
  while (!platform::CharacterBeginsAt(Texto, posicao)) posicao = Texto.find(Qual, posicao + 1);
  return posicao;
}

// The position of the last one, or npos.
inline std::size_t AcharUltimo(std::string_view Texto, char Qual) {
  std::size_t posicao = Texto.rfind(Qual);
  while (!platform::CharacterBeginsAt(Texto, posicao)) posicao = Texto.rfind(Qual, posicao - 1);
  return posicao;
}

inline bool TerminaCom(std::string_view Texto, char Qual) {
  return Texto.ends_with(Qual) && platform::CharacterBeginsAt(Texto, Texto.size() - 1);
}
