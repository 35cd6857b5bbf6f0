// What a message of the program shows, by the message's name.
#pragma once

#include "tests/messages.h"
#include "tests/windows/driver/window.h"

inline Message Of(Mensagem which, const std::string& value = "") {
  const std::vector<int> buttons[] = {{IDOK}, {IDYES, IDNO, IDCANCEL}, {IDRETRY, IDCANCEL}};
  return {TitleOf(which), TextOf(which, value), buttons[static_cast<int>(RowOf(which).Botoes)]};
}
