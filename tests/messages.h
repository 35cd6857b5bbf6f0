// Messages by their names, as the table has them: untranslated. That these are the texts that a person should read is
// looked at in tests/support/messages_tests.cpp alone.
#pragma once

#include <cstddef>
#include <string>
#include <string_view>

#include "platform/text.h"
#include "support/mensagens.h"

inline const DescricaoDeMensagem& RowOf(Mensagem which) { return TodasAsMensagens()[static_cast<std::size_t>(which)]; }

inline std::string TitleOf(Mensagem which) { return platform::FromUtf8(RowOf(which).Titulo); }

inline std::string TextOf(Mensagem which, const std::string& value = "") {
  std::string text;
  for (const std::string_view piece : RowOf(which).Pecas) {
    text += piece == Peca::Valor ? value : platform::FromUtf8(piece);
  }
  return text;
}
